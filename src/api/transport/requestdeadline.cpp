#include "api/transport/requestdeadline.h"

#include "api/session/requestgroup.h"
#include "platform/log/crashcatcher.h"
#include "platform/system/socketshutdown.h"

#include <algorithm>
#include <condition_variable>
#include <map>
#include <mutex>
#include <optional>
#include <thread>

namespace {

using Clock = std::chrono::steady_clock;

struct Watched {
    Clock::time_point end;
    SocketShutdown connection;
    bool over = false;
    std::optional<RequestGroup> group;
};

/// The one watchdog thread. It is never joined with: the object lives until the process ends.
class Watchdog {
public:
    static Watchdog &instance() {
        static auto *const watchdog = new Watchdog;
        return *watchdog;
    }

    std::uint64_t add(Clock::time_point end) {
        const std::lock_guard lock(m_mutex);
        Watched watched{end, {}, m_cutAll, {}};
        if (const RequestGroup *group = RequestGroup::current()) {
            watched.group = *group;
            watched.over = watched.over || group->isCut();
        }
        m_watched.emplace(++m_lastId, std::move(watched));
        m_changed.notify_one();
        return m_lastId;
    }

    void remove(std::uint64_t id) {
        const std::lock_guard lock(m_mutex);
        m_watched.erase(id);
    }

    void connect(std::uint64_t id, SocketShutdown connection) {
        const std::lock_guard lock(m_mutex);
        Watched &watched = m_watched.at(id);
        watched.connection = std::move(connection);
        if (watched.over)
            watched.connection.cut();
    }

    /// The watching thread need not hear of it: when it wakes, it sees the later end.
    void postpone(std::uint64_t id, Clock::time_point end) {
        const std::lock_guard lock(m_mutex);
        m_watched.at(id).end = end;
    }

    void cut(std::uint64_t id) {
        const std::lock_guard lock(m_mutex);
        cut(m_watched.at(id));
    }

    bool isOver(std::uint64_t id) {
        const std::lock_guard lock(m_mutex);
        return m_watched.at(id).over;
    }

    void cut(const RequestGroup &group) {
        const std::lock_guard lock(m_mutex);
        for (auto &[id, watched] : m_watched) {
            if (watched.group == group)
                cut(watched);
        }
    }

    void cutAll() {
        const std::lock_guard lock(m_mutex);
        m_cutAll = true;
        for (auto &[id, watched] : m_watched)
            cut(watched);
    }

private:
    Watchdog() {
        std::thread([this] {
            const CrashCatcher::ThreadGuard guard;
            watch();
        }).detach();
    }

    static void cut(Watched &watched) {
        watched.over = true;
        watched.connection.cut();
    }

    void watch() {
        std::unique_lock lock(m_mutex);
        while (true) {
            Clock::time_point next = Clock::time_point::max();
            for (auto &[id, watched] : m_watched) {
                if (watched.over)
                    continue;
                if (watched.end <= Clock::now())
                    cut(watched);
                else
                    next = std::min(next, watched.end);
            }
            if (next == Clock::time_point::max())
                m_changed.wait(lock);
            else
                m_changed.wait_until(lock, next);
        }
    }

    std::mutex m_mutex;
    std::condition_variable m_changed;
    std::map<std::uint64_t, Watched> m_watched;
    std::uint64_t m_lastId = 0;
    bool m_cutAll = false;
};

} // namespace

RequestDeadline::RequestDeadline(std::chrono::milliseconds time)
    : m_time(time), m_id(Watchdog::instance().add(Clock::now() + time)) {}

RequestDeadline::~RequestDeadline() {
    Watchdog::instance().remove(m_id);
}

void RequestDeadline::watch(long long socket) {
    Watchdog::instance().connect(m_id, SocketShutdown(socket));
}

void RequestDeadline::restart() {
    Watchdog::instance().postpone(m_id, Clock::now() + m_time);
}

void RequestDeadline::cut() {
    Watchdog::instance().cut(m_id);
}

bool RequestDeadline::isOver() const {
    return Watchdog::instance().isOver(m_id);
}

void RequestDeadline::cut(const RequestGroup &group) {
    Watchdog::instance().cut(group);
}

void RequestDeadline::cutAll() {
    Watchdog::instance().cutAll();
}
