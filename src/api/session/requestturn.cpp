#include "api/session/requestturn.h"

#include <condition_variable>
#include <mutex>
#include <optional>
#include <set>
#include <utility>

namespace {

using Clock = std::chrono::steady_clock;

class TurnQueue {
public:
    /// Without an end it waits for as long as it takes. False when the time is over.
    bool take(RequestTurn::Order order, std::optional<Clock::time_point> end) {
        std::unique_lock lock(m_mutex);
        return wait(lock, order, end);
    }

    void giveBack() {
        const std::lock_guard lock(m_mutex);
        m_taken = false;
        m_changed.notify_all();
    }

    void passOn(RequestTurn::Order order) {
        std::unique_lock lock(m_mutex);
        if (m_waiting.empty())
            return;
        m_taken = false;
        m_changed.notify_all();
        wait(lock, order, {});
    }

private:
    using Ticket = std::pair<RequestTurn::Order, std::uint64_t>;

    bool wait(std::unique_lock<std::mutex> &lock, RequestTurn::Order order,
              std::optional<Clock::time_point> end) {
        const Ticket ticket{order, ++m_lastTicket};
        m_waiting.insert(ticket);
        const auto isNext = [&] { return !m_taken && *m_waiting.begin() == ticket; };
        bool isMine = true;
        if (end)
            isMine = m_changed.wait_until(lock, *end, isNext);
        else
            m_changed.wait(lock, isNext);
        m_waiting.erase(ticket);
        if (isMine)
            m_taken = true;
        else
            m_changed.notify_all(); // whoever came next may be the first now
        return isMine;
    }

    std::mutex m_mutex;
    std::condition_variable m_changed;
    std::set<Ticket> m_waiting; ///< in the order in which they go
    std::uint64_t m_lastTicket = 0;
    bool m_taken = false;
};

/// Never destroyed: a runner that outlives the wait at the end of the program may still give its turn back.
TurnQueue &queue() {
    static auto *const queue = new TurnQueue;
    return *queue;
}

thread_local const RequestTurn *heldByThread = nullptr;

} // namespace

RequestTurn::RequestTurn(Order order, std::chrono::milliseconds wait)
    : m_order(order), m_held(queue().take(order, Clock::now() + wait)) {
    if (m_held)
        heldByThread = this;
}

RequestTurn::~RequestTurn() {
    if (!m_held)
        return;
    heldByThread = nullptr;
    queue().giveBack();
}

void RequestTurn::passOn() {
    if (heldByThread && heldByThread->m_order == Order::Reading)
        queue().passOn(Order::Reading);
}
