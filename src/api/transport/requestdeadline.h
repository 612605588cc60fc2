#pragma once

#include <chrono>
#include <cstdint>

class RequestGroup;

/// The time that one request may take: altogether, or for a transfer of files without progress.
///
/// The transport's own time-outs are for each wait, so a peer that sends a byte now and then could hold a
/// request for ever. A watchdog thread cuts the request's connection when its time is over; the request then
/// returns with a transport error. The same happens when the group is cut to which the thread's requests
/// belong. Unless something else is said, used by the thread of the request.
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

    /// Cuts the requests of a group that are under way; the group itself ends the later ones. Any thread.
    static void cut(const RequestGroup &group);

    /// Cuts every request under way and every later one at once: the program is about to end. Any thread.
    static void cutAll();

private:
    std::chrono::milliseconds m_time;
    std::uint64_t m_id;
};
