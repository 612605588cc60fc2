#include "platform/system/socketshutdown.h"

#include <utility>

#ifdef _WIN32
#include <winsock2.h>
#else
#include <cerrno>

#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>
#endif

#ifdef _WIN32

namespace {

long long duplicate(long long socket) {
    WSAPROTOCOL_INFOW info;
    if (WSADuplicateSocketW(static_cast<SOCKET>(socket), GetCurrentProcessId(), &info) != 0)
        return -1;
    return static_cast<long long>(
        WSASocketW(FROM_PROTOCOL_INFO, FROM_PROTOCOL_INFO, FROM_PROTOCOL_INFO, &info, 0, 0));
}

void shutDown(long long socket) {
    ::shutdown(static_cast<SOCKET>(socket), SD_BOTH);
}
void closeHandle(long long socket) {
    ::closesocket(static_cast<SOCKET>(socket));
}

} // namespace

bool isSocketReadable(long long socket, std::chrono::milliseconds wait) {
    WSAPOLLFD descriptor{static_cast<SOCKET>(socket), POLLIN, 0};
    return WSAPoll(&descriptor, 1, static_cast<int>(wait.count())) > 0;
}

#else

namespace {

long long duplicate(long long socket) {
    return ::dup(static_cast<int>(socket));
}
void shutDown(long long socket) {
    ::shutdown(static_cast<int>(socket), SHUT_RDWR);
}
void closeHandle(long long socket) {
    ::close(static_cast<int>(socket));
}

} // namespace

bool isSocketReadable(long long socket, std::chrono::milliseconds wait) {
    pollfd descriptor{static_cast<int>(socket), POLLIN, 0};
    int ready = 0;
    do
        ready = ::poll(&descriptor, 1, static_cast<int>(wait.count()));
    while (ready < 0 && errno == EINTR);
    return ready > 0;
}

#endif

SocketShutdown::SocketShutdown(long long socket) : m_handle(duplicate(socket)) {}

SocketShutdown::~SocketShutdown() {
    if (m_handle >= 0)
        closeHandle(m_handle);
}

SocketShutdown::SocketShutdown(SocketShutdown &&other) noexcept
    : m_handle(std::exchange(other.m_handle, -1)) {}

SocketShutdown &SocketShutdown::operator=(SocketShutdown &&other) noexcept {
    std::swap(m_handle, other.m_handle);
    return *this;
}

void SocketShutdown::cut() {
    if (m_handle >= 0)
        shutDown(m_handle);
}
