#include "platform.h"

#include "http/utf8path.h"
#include "platform/windows/windowsacl.h"

#include <windows.h>
#include <winsock2.h>

#include <array>
#include <fstream>
#include <stdexcept>
#include <thread>

namespace emulator::platform {

namespace {

HANDLE stopEvent() {
    static const HANDLE event = ::CreateEventW(nullptr, TRUE, FALSE, nullptr);
    return event;
}

BOOL WINAPI onConsoleEvent(DWORD) {
    ::SetEvent(stopEvent());
    // The system ends the process as soon as this returns; the main thread needs its moment.
    std::this_thread::sleep_for(std::chrono::seconds(4));
    return TRUE;
}

/// How many bytes a read would give; nothing when there is no telling, as at a console.
std::optional<DWORD> bytesWaiting(HANDLE input) {
    DWORD count = 0;
    if (::GetFileType(input) != FILE_TYPE_PIPE)
        return std::nullopt;
    // A pipe without a writer is read too, which reports its end.
    return ::PeekNamedPipe(input, nullptr, 0, nullptr, &count, nullptr) ? std::optional(count) : std::nullopt;
}

} // namespace

void prepare() {
    ::SetConsoleCtrlHandler(onConsoleEvent, TRUE);
    ::SetConsoleOutputCP(CP_UTF8);
    stopEvent();
}

void waitForStop() {
    ::WaitForSingleObject(stopEvent(), INFINITE);
}

void requestStop() {
    ::SetEvent(stopEvent());
}

std::optional<std::string> readInput(std::chrono::milliseconds time) {
    const HANDLE input = ::GetStdHandle(STD_INPUT_HANDLE);
    if (::GetFileType(input) == FILE_TYPE_CHAR &&
        ::WaitForSingleObject(input, static_cast<DWORD>(time.count())) != WAIT_OBJECT_0)
        return std::string();
    if (bytesWaiting(input) == DWORD{0}) {
        std::this_thread::sleep_for(time);
        return std::string();
    }
    std::array<char, 4096> chunk{};
    DWORD count = 0;
    const BOOL isRead = ::ReadFile(input, chunk.data(), static_cast<DWORD>(chunk.size()), &count, nullptr);
    return isRead && count > 0 ? std::optional(std::string(chunk.data(), count)) : std::nullopt;
}

void makePrivateFolder(const std::filesystem::path &folder) {
    if (!WindowsAcl::makeFolder(folder.wstring()) && !std::filesystem::is_directory(folder))
        throw std::runtime_error("cannot make the folder " + utf8(folder));
}

void makePrivateFile(const std::filesystem::path &path) {
    if (!WindowsAcl::makeFile(path.wstring()) && !std::filesystem::exists(path))
        throw std::runtime_error("cannot open " + utf8(path));
}

void writePrivateFile(const std::filesystem::path &path, const std::string &text) {
    makePrivateFile(path);
    std::ofstream file(path, std::ios::binary | std::ios::trunc);
    if (!file.write(text.data(), static_cast<std::streamsize>(text.size())).flush())
        throw std::runtime_error("cannot write " + utf8(path));
}

FileClaim::FileClaim(const std::filesystem::path &path) {
    const HANDLE file = ::CreateFileW(path.c_str(), GENERIC_READ | GENERIC_WRITE, 0, nullptr, OPEN_ALWAYS,
                                      FILE_ATTRIBUTE_NORMAL, nullptr);
    if (file == INVALID_HANDLE_VALUE)
        throw std::runtime_error("the folder " + utf8(path.parent_path()) + " cannot be used or is in use");
    m_file = reinterpret_cast<std::intptr_t>(file);
}

FileClaim::~FileClaim() {
    ::CloseHandle(reinterpret_cast<HANDLE>(m_file));
}

void cutConnection(int descriptor) {
    // What is still to be sent is dropped, and the later close sends a reset.
    const linger atOnce{1, 0};
    const auto connection = static_cast<SOCKET>(descriptor);
    ::setsockopt(connection, SOL_SOCKET, SO_LINGER, reinterpret_cast<const char *>(&atOnce), sizeof atOnce);
    ::shutdown(connection, SD_BOTH);
}

bool callerHasLeft(int descriptor) {
    WSAPOLLFD watched{static_cast<SOCKET>(descriptor), POLLRDNORM, 0};
    if (::WSAPoll(&watched, 1, 0) <= 0)
        return false;
    char byte = 0;
    const bool hasEnded = (watched.revents & POLLRDNORM) != 0 &&
                          ::recv(static_cast<SOCKET>(descriptor), &byte, 1, MSG_PEEK) <= 0;
    return hasEnded || (watched.revents & (POLLHUP | POLLERR)) != 0;
}

void reclaimPort(std::intptr_t descriptor) {
    // Dying connections hold no port here; what is to be ruled out is that another program shares it.
    const BOOL on = TRUE;
    ::setsockopt(static_cast<SOCKET>(descriptor), SOL_SOCKET, SO_EXCLUSIVEADDRUSE,
                 reinterpret_cast<const char *>(&on), sizeof on);
}

} // namespace emulator::platform
