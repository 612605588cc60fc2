#pragma once

#include <chrono>

/// True when a read of the socket would not wait, or will not before the time is over.
bool isSocketReadable(long long socket, std::chrono::milliseconds wait = {});

/// Ends the traffic of a socket from another thread, whatever its owner waits for at that moment.
///
/// Holds a handle of its own, so that a number the owner has closed and the system has given out again is
/// never touched. Not copyable; a default one holds nothing.
class SocketShutdown {
public:
    SocketShutdown() = default;
    explicit SocketShutdown(long long socket);
    ~SocketShutdown();
    SocketShutdown(SocketShutdown &&other) noexcept;
    SocketShutdown &operator=(SocketShutdown &&other) noexcept;

    /// Shuts the connection down in both directions; a waiting owner returns with an error.
    void cut();

private:
    long long m_handle = -1;
};
