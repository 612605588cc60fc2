#include "platform/log/crashcatcher.h"

#include "platform/log/crashtext.h"

#include <cxxabi.h>
#include <execinfo.h>
#include <fcntl.h>
#include <pthread.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <ctime>
#include <exception>
#include <typeinfo>

namespace CrashCatcher {

namespace {

struct Fault {
    int number;
    std::string_view name;
    bool hasAddress;
};
constexpr Fault faults[] = {{SIGSEGV, "SIGSEGV", true},
                            {SIGBUS, "SIGBUS", true},
                            {SIGILL, "SIGILL", true},
                            {SIGFPE, "SIGFPE", true},
                            {SIGABRT, "SIGABRT", false}};
constexpr std::size_t stackBytes = 64 * 1024;
constexpr int maxFrames = 64;

Plan *plan = nullptr;
int reportFile = -1;
char exceptionName[256];
std::atomic_flag dying;
std::atomic<pthread_t> dyingThread;

void put(std::string_view text) {
    while (!text.empty()) {
        const ssize_t count = ::write(reportFile, text.data(), text.size());
        if (count < 0 && errno != EINTR)
            return;
        text.remove_prefix(count > 0 ? static_cast<std::size_t>(count) : 0);
    }
}

void writeLocation(CrashText &out, const Fault &fault, const siginfo_t &info) {
    out << "Reason: " << fault.name;
    if (fault.hasAddress && info.si_code > 0)
        (out << " at address ").hexadecimal(reinterpret_cast<std::uintptr_t>(info.si_addr));
    if (exceptionName[0])
        out << ", uncaught exception of type " << exceptionName;
    out << "\n\nPlace:\n";
    void *frames[maxFrames];
    ::backtrace_symbols_fd(frames, ::backtrace(frames, maxFrames), reportFile);
}

void writeReport(const Fault &fault, const siginfo_t &info) {
    // Nobody may have put a link there meanwhile.
    reportFile = ::open(plan->path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC | O_NOFOLLOW, 0600);
    if (reportFile < 0)
        return;
    CrashText out(put);
    out << plan->heading << "\nTime: ";
    out.moment(std::time(nullptr)) << "\n";
    writeLocation(out, fault, info);
    out << "\nLast log lines:\n";
    plan->tell(put);
    ::close(reportFile);
}

void onFault(int number, siginfo_t *info, void *) {
    if (dying.test_and_set()) {
        // A second thread waits for the first one's report; a fault inside the report ends the process.
        while (!::pthread_equal(dyingThread, ::pthread_self()))
            ::pause();
    } else {
        dyingThread = ::pthread_self();
        for (const Fault &fault : faults) {
            if (fault.number == number)
                writeReport(fault, *info);
        }
    }
    // The process still ends by its fault, for whoever waits for it.
    std::signal(number, SIG_DFL);
    ::raise(number);
}

void onTerminate() {
    // The name alone: what an exception says may quote a password.
    if (const std::type_info *type = abi::__cxa_current_exception_type()) {
        int status = 0;
        char *readable = abi::__cxa_demangle(type->name(), nullptr, nullptr, &status);
        const std::string_view name = readable ? readable : type->name();
        exceptionName[name.copy(exceptionName, sizeof exceptionName - 1)] = '\0';
        std::free(readable);
    }
    std::abort();
}

/// Gives the thread a stack for its signals, unless it has one.
void *addSignalStack() {
    stack_t present{};
    if (::sigaltstack(nullptr, &present) != 0 || !(present.ss_flags & SS_DISABLE))
        return nullptr;
    void *memory = std::malloc(stackBytes);
    stack_t stack{};
    stack.ss_sp = memory;
    stack.ss_size = stackBytes;
    if (memory && ::sigaltstack(&stack, nullptr) == 0)
        return memory;
    std::free(memory);
    return nullptr;
}

} // namespace

void install(const Plan &newPlan) {
    // It lives as long as the process: the last destructors may crash as well.
    plan = new Plan(newPlan);
    addSignalStack();
    // The first call loads a library, which a dying process must not do.
    void *frame = nullptr;
    ::backtrace(&frame, 1);
    struct sigaction action {};
    action.sa_sigaction = onFault;
    action.sa_flags = SA_SIGINFO | SA_ONSTACK | SA_NODEFER;
    ::sigemptyset(&action.sa_mask);
    for (const Fault &fault : faults)
        ::sigaction(fault.number, &action, nullptr);
    std::set_terminate(onTerminate);
}

ThreadGuard::ThreadGuard() : m_stack(addSignalStack()) {}

ThreadGuard::~ThreadGuard() {
    if (!m_stack)
        return;
    stack_t none{};
    none.ss_flags = SS_DISABLE;
    ::sigaltstack(&none, nullptr);
    std::free(m_stack);
}

} // namespace CrashCatcher
