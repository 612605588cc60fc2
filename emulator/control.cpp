#include "control.h"

#include "devices/devicecommit.h"
#include "http/answer.h"
#include "http/faults.h"
#include "platform.h"
#include "service.h"
#include "simulation/clock.h"
#include "simulation/fleet.h"
#include "simulation/random.h"
#include "stopsignal.h"

#include <algorithm>
#include <charconv>
#include <iostream>
#include <optional>
#include <stdexcept>

namespace emulator {

namespace {

/// Splits at blanks; double quotes hold a word together.
std::vector<std::string> wordsOf(const std::string &line) {
    std::vector<std::string> words;
    bool quoted = false;
    bool inWord = false;
    for (const char c : line) {
        const bool blank = (c == ' ' || c == '\t' || c == '\r') && !quoted;
        if (!blank && !inWord)
            words.emplace_back();
        inWord = !blank;
        if (c == '"')
            quoted = !quoted;
        else if (!blank)
            words.back() += c;
    }
    return words;
}

std::optional<std::size_t> numberOf(const std::string &text) {
    std::size_t number = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    const bool whole = error == std::errc() && end == text.data() + text.size() && !text.empty();
    return whole ? std::optional(number) : std::nullopt;
}

void changeConnection(Model &model, Device &device, bool reachable) {
    const bool changes = device.reachable != reachable;
    device.reachable = reachable;
    model.devices.saveState(device);
    if (changes) {
        const AlarmKind kind = reachable ? AlarmKind::ConnectionRestored : AlarmKind::LostConnection;
        model.alarms.raise(kind, &device, nowMs());
    }
}

void hold(Model &model, Device &device, bool reachable) {
    device.held = !reachable;
    changeConnection(model, device, reachable);
}

void authorize(Model &model, Device &device) {
    hold(model, device, true);
    model.authorization.admit(device);
}

std::size_t admitAll(Model &model) {
    Transaction transaction(model.store.database());
    for (std::size_t i = 0; i < model.devices.size(); ++i)
        authorize(model, model.devices.at(i));
    transaction.commit();
    return model.devices.size();
}

std::string counted(std::size_t devices) {
    return "ok " + std::to_string(devices) + (devices == 1 ? " device" : " devices");
}

/// Begins at a device that is not always the first, yet the same each time.
std::size_t dropSome(Model &model, std::size_t count) {
    const std::size_t size = model.devices.size();
    Transaction transaction(model.store.database());
    std::size_t dropped = 0;
    const std::size_t start = size == 0 ? 0 : mixed(model.seed()) % size;
    for (std::size_t i = 0; i < size && dropped < count; ++i) {
        Device &device = model.devices.at((start + i) % size);
        if (device.reachable) {
            hold(model, device, false);
            ++dropped;
        }
    }
    transaction.commit();
    return dropped;
}

std::size_t restoreAll(Model &model) {
    Transaction transaction(model.store.database());
    std::size_t restored = 0;
    for (std::size_t i = 0; i < model.devices.size(); ++i) {
        Device &device = model.devices.at(i);
        if (!device.reachable) {
            hold(model, device, true);
            ++restored;
        }
    }
    transaction.commit();
    return restored;
}

} // namespace

Control::Control(Service &service, Faults &faults, const StopSignal &stop)
    : m_service(service), m_faults(faults), m_stop(stop), m_reader([this] { readInput(); }) {}

Control::~Control() {
    m_reader.join();
}

void Control::readInput() {
    std::string pending;
    while (!m_stop.raised() && !m_stopWasAsked) {
        // Waking up now and then keeps the reader from outliving the rest of the program.
        const auto chunk = platform::readInput(std::chrono::milliseconds(200));
        if (!chunk)
            return;
        pending += *chunk;
        for (auto end = pending.find('\n'); end != std::string::npos; end = pending.find('\n')) {
            const std::string line = pending.substr(0, end);
            pending.erase(0, end + 1);
            std::cerr << answer(line) + "\n";
        }
    }
}

std::string Control::answer(const std::string &line) {
    try {
        return run(wordsOf(line));
    } catch (const std::exception &error) {
        return std::string("error ") + error.what();
    }
}

std::string Control::run(const Words &words) {
    const std::string command = words.empty() ? std::string() : words[0];
    if (command == "stop" && words.size() == 1) {
        platform::requestStop();
        // The next line would be waited for where a system cannot tell whether there is one.
        m_stopWasAsked = true;
        return "ok";
    }
    if (command == "counts" && words.size() == 1)
        return counts();
    if (command == "expire-sessions" && words.size() == 1) {
        m_service.withModel([](Model &model) { model.sessions.closeAll(); });
        return "ok";
    }
    if (command == "faults" && words.size() == 2 && words[1] == "clear") {
        m_faults.clear();
        return "ok";
    }
    if (command == "life" && words.size() == 2 && (words[1] == "on" || words[1] == "off")) {
        m_service.letLive(words[1] == "on");
        return "ok";
    }
    return runOnDevices(words);
}

std::string Control::runOnDevices(const Words &words) {
    const std::string command = words.empty() ? std::string() : words[0];
    if (command == "fault" && words.size() == 2)
        return fault(words[1]);
    if (command == "drop" && words.size() == 2)
        return drop(words[1]);
    if (command == "restore" && words.size() == 2)
        return restore(words[1]);
    if (command == "admit" && words.size() == 2)
        return admit(words[1]);
    if (command == "remove" && words.size() == 2)
        return remove(words[1]);
    if (command == "add" && words.size() == 2)
        return add(words[1]);
    if (command == "tick" && words.size() == 2)
        return tick(words[1]);
    if (command == "status" && words.size() == 5)
        return status(words);
    return runOnTasks(words);
}

std::string Control::runOnTasks(const Words &words) {
    const std::string command = words.empty() ? std::string() : words[0];
    if (command == "task" && (words.size() == 3 || words.size() == 4))
        return task(words);
    if ((command == "task-pace" || command == "task-failures") && words.size() == 2)
        return taskRule(command, words[1]);
    if (command == "touch-tasks" && words.size() == 2 && numberOf(words[1])) {
        const std::size_t count = *numberOf(words[1]);
        return "ok " +
               std::to_string(m_service.withModel([&](Model &model) { return model.tasks.touch(count); })) +
               " tasks";
    }
    if (command == "alarm" && (words.size() == 2 || words.size() == 3))
        return alarm(words);
    return runOnAccounts(words);
}

std::string Control::fault(const std::string &text) {
    m_faults.add(text);
    return "ok";
}

std::string Control::drop(const std::string &what) {
    const auto number = numberOf(what);
    return counted(m_service.withModel([&](Model &model) {
        if (number)
            return dropSome(model, *number);
        hold(model, model.devices.get(what), false);
        return std::size_t{1};
    }));
}

std::string Control::restore(const std::string &what) {
    return counted(m_service.withModel([&](Model &model) {
        if (what == "all")
            return restoreAll(model);
        hold(model, model.devices.get(what), true);
        return std::size_t{1};
    }));
}

std::string Control::admit(const std::string &what) {
    return counted(m_service.withModel([&](Model &model) {
        if (what == "all")
            return admitAll(model);
        authorize(model, model.devices.get(what));
        return std::size_t{1};
    }));
}

std::string Control::remove(const std::string &id) {
    m_service.withModel([&](Model &model) { removeDevices(model, {id}); });
    return counted(1);
}

std::string Control::add(const std::string &count) {
    const auto number = numberOf(count);
    if (!number || *number > 100000)
        throw std::runtime_error("add takes a number of devices");
    m_service.withModel([&](Model &model) { addDevices(model, *number); });
    return counted(*number);
}

std::string Control::tick(const std::string &count) {
    const auto number = numberOf(count);
    if (!number || *number > 100000)
        throw std::runtime_error("tick takes a number of ticks");
    for (std::size_t i = 0; i < *number; ++i)
        m_service.step();
    return "ok";
}

std::string Control::status(const Words &words) {
    const std::string &id = words[1], &auth = words[2], &connect = words[3], &action = words[4];
    Authorization authorization{};
    if (auth != "-" && !authorizationOf(auth, authorization))
        throw std::runtime_error("no such authorization");
    if (connect != "-" && connect != "Connected" && connect != "Unreachable")
        throw std::runtime_error("a device is Connected or Unreachable");
    m_service.withModel([&](Model &model) {
        Device &device = model.devices.get(id);
        const bool wasAuthorized = device.authorization == Authorization::Authorized;
        device.authorization = auth == "-" ? device.authorization : authorization;
        if (wasAuthorized && device.authorization != Authorization::Authorized)
            model.alarms.raise(AlarmKind::AuthorizationLost, &device, nowMs());
        device.action = action == "-" ? device.action : action;
        const bool reachable = connect == "-" ? device.reachable : connect == "Connected";
        device.held = connect == "-" ? device.held : !reachable;
        changeConnection(model, device, reachable);
    });
    return counted(1);
}

std::string Control::counts() {
    return m_service.withModel([](Model &model) {
        const DeviceTable::Counts counts = model.devices.counts();
        return "ok devices=" + std::to_string(model.devices.size()) +
               " unreachable=" + std::to_string(counts.unreachable) +
               " authorized=" + std::to_string(counts.authorized) + " busy=" + std::to_string(counts.busy) +
               " sites=" + std::to_string(model.sites.all().size()) +
               " accounts=" + std::to_string(model.accounts.all().size()) +
               " sessions=" + std::to_string(model.sessions.count());
    });
}

std::string Control::task(const Words &words) {
    const auto count = numberOf(words[2]);
    const auto delay = words.size() == 4 ? numberOf(words[3]) : std::optional<std::size_t>(0);
    if (!count || !delay || *delay > 1000000000)
        throw std::runtime_error("task takes a type, a number of devices and a delay");
    return "ok " + m_service.withModel([&](Model &model) {
        const std::int64_t now = nowMs();
        Json devices = Json::array();
        std::vector<DeviceWork> work;
        for (std::size_t i = 0; i < std::min(*count, model.devices.size()); ++i) {
            const std::string &id = model.devices.at(i).id;
            const auto time =
                *delay == 0 ? std::string() : std::to_string(now + static_cast<std::int64_t>(*delay));
            devices.push_back({{"id", id}, {"actm", time}});
            DeviceWork &item = work.emplace_back();
            item.id = id;
            item.access = Access::Anybody;
        }
        const std::string user = model.accounts.all().front().email;
        const std::string id = model.engine.create(words[1], user, devices, now).id;
        model.engine.startWork(id, work, now);
        return id;
    });
}

std::string Control::taskRule(const std::string &rule, const std::string &value) {
    double number = -1;
    const auto [end, error] = std::from_chars(value.data(), value.data() + value.size(), number);
    const double most = rule == "task-pace" ? 3600000 : 1;
    if (error != std::errc() || end != value.data() + value.size() || !(number >= 0 && number <= most))
        throw std::runtime_error(rule + " takes no such number");
    m_service.withModel([&](Model &model) {
        TaskRules &rules = model.engine.rules();
        if (rule == "task-pace")
            rules.paceMs = static_cast<std::int64_t>(number);
        else
            rules.failures = number;
    });
    return "ok";
}

std::string Control::alarm(const Words &words) {
    const auto kind = numberOf(words[1]);
    const auto count = words.size() == 3 ? numberOf(words[2]) : std::optional<std::size_t>(1);
    if (!kind || *kind < 1 || *kind > 6 || !count || *count > 100000)
        throw std::runtime_error("alarm takes a number from 1 to 6 and how often");
    m_service.withModel([&](Model &model) {
        const auto what = static_cast<AlarmKind>(*kind);
        const bool ofServer = what == AlarmKind::ServerStarted || what == AlarmKind::ServerStopped;
        Transaction transaction(model.store.database());
        for (std::size_t i = 0; i < *count; ++i) {
            const bool hasDevice = !ofServer && model.devices.size() != 0;
            const Device *device = hasDevice ? &model.devices.at(i % model.devices.size()) : nullptr;
            model.alarms.raise(what, device, nowMs());
        }
        transaction.commit();
    });
    return "ok " + std::to_string(*count) + " alarms";
}

} // namespace emulator
