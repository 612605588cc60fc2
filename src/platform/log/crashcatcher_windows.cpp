#include "platform/log/crashcatcher.h"

#include "platform/log/crashtext.h"

#include <windows.h>

#include <atomic>
#include <csignal>
#include <cstdlib>
#include <ctime>
#include <exception>

namespace CrashCatcher {

namespace {

constexpr DWORD abortCode = 0xE0000001;
constexpr ULONG overflowRoom = 64 * 1024;
constexpr ULONG maxFrames = 62;

Plan *plan = nullptr;
std::wstring *reportPath = nullptr;
HANDLE reportFile = INVALID_HANDLE_VALUE;
std::atomic_flag dying;

void put(std::string_view text) {
    DWORD count = 0;
    ::WriteFile(reportFile, text.data(), static_cast<DWORD>(text.size()), &count, nullptr);
}

void writeLocation(CrashText &out, const EXCEPTION_RECORD &record) {
    // Addresses mean something only beside the place at which this run has the program.
    const auto base = reinterpret_cast<std::uintptr_t>(::GetModuleHandleW(nullptr));
    (out << "Reason: ").hexadecimal(record.ExceptionCode) << " at address ";
    out.hexadecimal(reinterpret_cast<std::uintptr_t>(record.ExceptionAddress)) << "\nProgram at: ";
    out.hexadecimal(base) << "\n\nPlace:\n";
    void *frames[maxFrames];
    const USHORT count = ::CaptureStackBackTrace(0, maxFrames, frames, nullptr);
    for (USHORT i = 0; i < count; ++i)
        out.hexadecimal(reinterpret_cast<std::uintptr_t>(frames[i])) << "\n";
}

void writeReport(const EXCEPTION_RECORD &record) {
    reportFile = ::CreateFileW(reportPath->c_str(), GENERIC_WRITE, 0, nullptr, CREATE_NEW,
                               FILE_ATTRIBUTE_NORMAL, nullptr);
    if (reportFile == INVALID_HANDLE_VALUE)
        return;
    CrashText out(put);
    out << plan->heading << "\nTime: ";
    out.moment(std::time(nullptr)) << "\n";
    writeLocation(out, record);
    out << "\nLast log lines:\n";
    plan->tell(put);
    ::CloseHandle(reportFile);
}

LONG WINAPI onFault(EXCEPTION_POINTERS *fault) {
    if (!dying.test_and_set())
        writeReport(*fault->ExceptionRecord);
    return EXCEPTION_EXECUTE_HANDLER;
}

[[noreturn]] void reportAbort() {
    EXCEPTION_RECORD record{};
    record.ExceptionCode = abortCode;
    if (!dying.test_and_set())
        writeReport(record);
    ::TerminateProcess(::GetCurrentProcess(), abortCode);
    std::_Exit(EXIT_FAILURE);
}

std::wstring wide(const std::string &text) {
    const int size = static_cast<int>(text.size());
    std::wstring result(static_cast<std::size_t>(size), L'\0');
    result.resize(
        static_cast<std::size_t>(::MultiByteToWideChar(CP_UTF8, 0, text.data(), size, result.data(), size)));
    return result;
}

void reserveStack() {
    ULONG room = overflowRoom;
    ::SetThreadStackGuarantee(&room);
}

} // namespace

void install(const Plan &newPlan) {
    plan = new Plan(newPlan);
    reportPath = new std::wstring(wide(newPlan.path));
    // The system's own dump of a crash would hold passwords.
    ::SetErrorMode(SEM_FAILCRITICALERRORS | SEM_NOGPFAULTERRORBOX);
    ::SetUnhandledExceptionFilter(onFault);
    std::set_terminate(reportAbort);
    std::signal(SIGABRT, [](int) { reportAbort(); });
    reserveStack();
}

ThreadGuard::ThreadGuard() {
    reserveStack();
}

ThreadGuard::~ThreadGuard() = default;

} // namespace CrashCatcher
