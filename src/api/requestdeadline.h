#pragma once

#include <chrono>
#include <cstdint>

/// The total time that one request may take.
///
/// The transport's own time-outs are for each wait, so a peer that sends a byte now and then could hold a
/// request for ever. A watchdog thread cuts the request's connection when its time is over; the request then
/// returns with a transport error. The object is used by the thread of the request.
class RequestDeadline {
public:
    explicit RequestDeadline(std::chrono::milliseconds total);
    ~RequestDeadline();
    RequestDeadline(const RequestDeadline &) = delete;
    RequestDeadline &operator=(const RequestDeadline &) = delete;

    /// Watches over the connection from here on, in place of an earlier one.
    void watch(long long socket);

    /// True when the watchdog has cut the connection.
    bool isOver() const;

    /// Cuts every request under way and every later one at once: the program is about to end. Any thread.
    static void cutAll();

private:
    std::uint64_t m_id;
};
