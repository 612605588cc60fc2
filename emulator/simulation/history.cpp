#include "simulation/history.h"

#include "model.h"
#include "simulation/clock.h"
#include "simulation/random.h"
#include "tables/tasktable.h"

#include <algorithm>
#include <array>
#include <utility>

namespace emulator {

namespace {

constexpr std::int64_t dayMs = 86400000;
constexpr std::int64_t taskDays = 5;
constexpr std::int64_t alarmDays = 3;
constexpr std::int64_t logDays = 8;

/// The time of one of many things that lie evenly in the last days, each moved by chance within its share.
std::int64_t timeOf(std::size_t number, std::size_t count, std::int64_t days, Random &random) {
    const std::int64_t share = days * dayMs / static_cast<std::int64_t>(count);
    const auto moved = random.below(static_cast<std::uint64_t>(share) + 1);
    return nowMs() - days * dayMs + static_cast<std::int64_t>(number) * share +
           static_cast<std::int64_t>(moved);
}

class HistoryMaker {
public:
    explicit HistoryMaker(Model &model) : m_model(model), m_random(mixed(model.seed() ^ 0x4157)) {
        for (const Account &account : model.accounts.all())
            m_users.push_back(account.email);
        m_users.insert(m_users.end(), {"day@example.net", "night@example.net"});
        m_identities.resize(model.devices.size());
    }

    void addTask(std::int64_t at, std::size_t devices) {
        static constexpr std::array outcomes = {state::done, state::done,   state::done,
                                                state::done, state::failed, state::aborted};
        Task task;
        task.type = oneOf(taskTypes());
        task.user = oneOf(m_users);
        task.status = task.state = outcomes[m_random.below(outcomes.size())];
        task.createdAt = at;
        // What lies in the past has ended there.
        const auto took = static_cast<std::int64_t>(5000 + m_random.below(1000) * devices);
        task.updatedAt = std::min(at + took, nowMs());
        addDevices(task, std::min(devices, m_model.devices.size()));
        m_model.tasks.add(std::move(task));
    }

    void addAlarm(std::int64_t at) {
        static constexpr std::array kinds = {AlarmKind::LostConnection,     AlarmKind::LostConnection,
                                             AlarmKind::ConnectionRestored, AlarmKind::ConnectionRestored,
                                             AlarmKind::CardError,          AlarmKind::AuthorizationLost};
        m_model.alarms.add(kinds[m_random.below(kinds.size())], anyDevice(), at);
    }

    void addLogEntry(std::int64_t at) {
        static constexpr std::array audits = {"Logged in", "Logged off", "Settings changed"};
        const std::string &user = oneOf(m_users);
        const Device *device = anyDevice();
        if (device && m_random.chance(0.4)) {
            const std::string words = descriptionOf(AlarmKind::LostConnection, displayName(*device));
            m_model.log.add(at, "Device", "Alarm", words, {});
        } else if (m_random.chance(0.5)) {
            m_model.log.add(at, "System", "Event", "Task " + oneOf(taskTypes()) + " ended: pTaskDone", user);
        } else {
            m_model.log.add(at, "System", "Audit", audits[m_random.below(audits.size())], user);
        }
    }

    Random &random() { return m_random; }

private:
    const std::string &oneOf(const std::vector<std::string> &choices) {
        return choices[m_random.below(choices.size())];
    }

    const Device *anyDevice() {
        const std::size_t size = m_model.devices.size();
        return size == 0 ? nullptr : &m_model.devices.at(m_random.below(size));
    }

    void addDevices(Task &task, std::size_t count) {
        const std::size_t size = std::max<std::size_t>(m_model.devices.size(), 1);
        const std::size_t first = m_random.below(size);
        std::size_t sum = 0;
        task.devicesText = std::string("[");
        for (std::size_t i = 0; i < count; ++i) {
            // A failed task has at least one device that failed.
            const bool fails = task.status == state::failed && (i == 0 || m_random.chance(0.2));
            const bool stops = task.status == state::aborted && (i == 0 || m_random.chance(0.5));
            const std::string state = fails ? failureCode(m_random) : stops ? state::aborted : state::done;
            const int progress = state == state::done ? 100 : static_cast<int>(m_random.below(100));
            sum += static_cast<std::size_t>(progress);
            std::string &identity = m_identities[(first + i) % size];
            if (identity.empty())
                identity = identityText(m_model.devices.at((first + i) % size));
            appendEntry(task.devicesText, identity, state, progress);
        }
        task.devicesText += ']';
        task.progress = static_cast<int>(sum / std::max<std::size_t>(count, 1));
    }

    Model &m_model;
    Random m_random;
    std::vector<std::string> m_users;
    std::vector<std::string> m_identities;
};

} // namespace

void makeHistory(Model &model, const HistoryPlan &plan) {
    Transaction transaction(model.store.database());
    HistoryMaker maker(model);
    for (std::size_t i = 0; i < plan.tasks; ++i)
        maker.addTask(timeOf(i, plan.tasks, taskDays, maker.random()), plan.taskDevices);
    for (std::size_t i = 0; i < plan.alarms; ++i)
        maker.addAlarm(timeOf(i, plan.alarms, alarmDays, maker.random()));
    for (std::size_t i = 0; i < plan.logEntries; ++i)
        maker.addLogEntry(timeOf(i, plan.logEntries, logDays, maker.random()));
    transaction.commit();
}

} // namespace emulator
