#include "platform.h"

#include "http/utf8path.h"

#include <fcntl.h>
#include <poll.h>
#include <signal.h>
#include <sys/file.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <stdexcept>

namespace emulator::platform {

namespace {

sigset_t stopSignals() {
    sigset_t stops;
    sigemptyset(&stops);
    sigaddset(&stops, SIGTERM);
    sigaddset(&stops, SIGINT);
    return stops;
}

int openPrivate(const std::filesystem::path &path, int mode) {
    return ::open(path.c_str(), mode | O_CREAT | O_CLOEXEC, 0600);
}

} // namespace

void prepare() {
    ::signal(SIGPIPE, SIG_IGN);
    ::umask(077);
    // Blocked in every thread, so that the main thread alone takes them.
    const sigset_t stops = stopSignals();
    ::pthread_sigmask(SIG_BLOCK, &stops, nullptr);
}

void waitForStop() {
    const sigset_t stops = stopSignals();
    int signal = 0;
    ::sigwait(&stops, &signal);
}

void requestStop() {
    ::kill(::getpid(), SIGTERM);
}

std::optional<std::string> readInput(std::chrono::milliseconds time) {
    pollfd input{STDIN_FILENO, POLLIN, 0};
    if (::poll(&input, 1, static_cast<int>(time.count())) <= 0)
        return std::string();
    std::array<char, 4096> chunk{};
    const ssize_t count = ::read(STDIN_FILENO, chunk.data(), chunk.size());
    return count > 0 ? std::optional(std::string(chunk.data(), static_cast<std::size_t>(count)))
                     : std::nullopt;
}

void makePrivateFolder(const std::filesystem::path &folder) {
    if (::mkdir(folder.c_str(), 0700) != 0 && !std::filesystem::is_directory(folder))
        throw std::runtime_error("cannot make the folder " + utf8(folder));
}

void makePrivateFile(const std::filesystem::path &path) {
    const int file = openPrivate(path, O_RDWR);
    if (file < 0)
        throw std::runtime_error("cannot open " + utf8(path));
    ::close(file);
}

void writePrivateFile(const std::filesystem::path &path, const std::string &text) {
    const int file = openPrivate(path, O_WRONLY | O_TRUNC);
    const bool written =
        file >= 0 && ::write(file, text.data(), text.size()) == static_cast<ssize_t>(text.size());
    const bool closed = file >= 0 && ::close(file) == 0;
    if (!written || !closed)
        throw std::runtime_error("cannot write " + utf8(path));
}

FileClaim::FileClaim(const std::filesystem::path &path) {
    const int file = openPrivate(path, O_RDWR);
    if (file < 0 || ::flock(file, LOCK_EX | LOCK_NB) != 0) {
        if (file >= 0)
            ::close(file);
        throw std::runtime_error("the folder " + utf8(path.parent_path()) + " cannot be used or is in use");
    }
    m_file = file;
}

FileClaim::~FileClaim() {
    ::close(static_cast<int>(m_file));
}

void cutConnection(int descriptor) {
    sockaddr unspecified{};
    unspecified.sa_family = AF_UNSPEC;
    ::connect(descriptor, &unspecified, sizeof unspecified);
}

bool callerHasLeft(int descriptor) {
    pollfd watched{descriptor, POLLRDHUP, 0};
    return ::poll(&watched, 1, 0) > 0 && (watched.revents & (POLLRDHUP | POLLHUP | POLLERR)) != 0;
}

void reclaimPort(std::intptr_t descriptor) {
    const int on = 1;
    ::setsockopt(static_cast<int>(descriptor), SOL_SOCKET, SO_REUSEADDR, &on, sizeof on);
}

} // namespace emulator::platform
