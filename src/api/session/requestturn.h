#pragma once

#include <chrono>

/// The turn that runners' jobs take with their requests: one job of the process has it at a time. What a user
/// does goes before readings, which pass the turn on between their pages; within each of the two kinds, who
/// came first goes first. Any thread.
class RequestTurn {
public:
    enum class Order { User, Reading };

    /// Waits for the turn and holds it, if it got it in time, for as long as it lives. At most one a thread.
    RequestTurn(Order order, std::chrono::milliseconds wait);
    ~RequestTurn();
    RequestTurn(const RequestTurn &) = delete;
    RequestTurn &operator=(const RequestTurn &) = delete;

    bool isHeld() const { return m_held; }

    /// If the calling thread holds the turn for a reading and others wait for it, lets them go first and
    /// returns with the turn again.
    static void passOn();

private:
    Order m_order;
    bool m_held;
};
