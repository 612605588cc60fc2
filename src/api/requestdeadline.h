#pragma once

#include <chrono>
#include <cstdint>

/// The time that one request may take: altogether, or for a transfer of files without progress.
///
/// The transport's own time-outs are for each wait, so a peer that sends a byte now and then could hold a
/// request for ever. A watchdog thread cuts the request's connection when its time is over; the request then
/// returns with a transport error. Unless something else is said, used by the thread of the request.
class RequestDeadline {
public:
    explicit RequestDeadline(std::chrono::milliseconds time);
    ~RequestDeadline();
    RequestDeadline(const RequestDeadline &) = delete;
    RequestDeadline &operator=(const RequestDeadline &) = delete;

    /// Watches over the connection from here on, in place of an earlier one.
    void watch(long long socket);

    /// There was progress: the time begins anew.
    void restart();

    /// Ends the request now. Any thread.
    void cut();

    /// True when the connection has been cut.
    bool isOver() const;

    /// Cuts every request under way and every later one at once: the program is about to end. Any thread.
    static void cutAll();

private:
    std::chrono::milliseconds m_time;
    std::uint64_t m_id;
};
