#include "controlcommands.h"

#include "devices/devicecommit.h"
#include "http/faults.h"
#include "platform.h"
#include "service.h"
#include "simulation/clock.h"
#include "simulation/fleet.h"
#include "simulation/random.h"

#include <algorithm>
#include <charconv>
#include <optional>
#include <sstream>
#include <stdexcept>

namespace emulator {

namespace {

using Arguments = ControlCommand::Arguments;

constexpr std::size_t maxCount = 100000;
constexpr std::size_t maxDelayMs = 1000000000;
constexpr std::size_t maxOrganizations = 10000;
constexpr std::size_t usageWidth = 33;

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

std::string countOfDevices(std::size_t devices) {
    return "ok " + std::to_string(devices) + (devices == 1 ? " device" : " devices");
}

/// Begins at a device that follows from the seed, so that the same fleet loses the same devices.
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

std::size_t countOf(const std::string &text, const char *command, std::size_t max = maxCount) {
    const auto number = numberOf(text);
    if (!number || *number > max)
        throw std::runtime_error(std::string(command) + " takes a number up to " + std::to_string(max));
    return *number;
}

double fractionOf(const std::string &text, const char *command, double max) {
    double number = -1;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (error != std::errc() || end != text.data() + text.size() || !(number >= 0 && number <= max))
        throw std::runtime_error(std::string(command) + " takes no such number");
    return number;
}

bool isOn(const std::string &text) {
    if (text != "on" && text != "off")
        throw std::runtime_error("a switch is on or off");
    return text == "on";
}

std::string stop(ControlContext &context, Arguments) {
    platform::requestStop();
    context.stopRequested = true;
    return "ok";
}

std::string addFault(ControlContext &context, Arguments arguments) {
    context.faults.add(arguments[0]);
    return "ok";
}

std::string clearFaults(ControlContext &context, Arguments) {
    context.faults.clear();
    return "ok";
}

std::string expireSessions(ControlContext &context, Arguments) {
    context.service.withModel([](Model &model) { model.sessions.closeAll(); });
    return "ok";
}

std::string counts(ControlContext &context, Arguments) {
    return context.service.withModel([](Model &model) {
        const DeviceTable::Counts counts = model.devices.counts();
        return "ok devices=" + std::to_string(model.devices.size()) +
               " unreachable=" + std::to_string(counts.unreachable) +
               " authorized=" + std::to_string(counts.authorized) + " busy=" + std::to_string(counts.busy) +
               " sites=" + std::to_string(model.sites.all().size()) +
               " accounts=" + std::to_string(model.accounts.all().size()) +
               " sessions=" + std::to_string(model.sessions.count());
    });
}

std::string switchLife(ControlContext &context, Arguments arguments) {
    context.service.setSimulating(isOn(arguments[0]));
    return "ok";
}

std::string tick(ControlContext &context, Arguments arguments) {
    const std::size_t count = countOf(arguments[0], "tick");
    for (std::size_t i = 0; i < count; ++i)
        context.service.step();
    return "ok";
}

std::string drop(ControlContext &context, Arguments arguments) {
    const auto number = numberOf(arguments[0]);
    return countOfDevices(context.service.withModel([&](Model &model) {
        if (number)
            return dropSome(model, *number);
        hold(model, model.devices.get(arguments[0]), false);
        return std::size_t{1};
    }));
}

std::string restore(ControlContext &context, Arguments arguments) {
    return countOfDevices(context.service.withModel([&](Model &model) {
        if (arguments[0] == "all")
            return restoreAll(model);
        hold(model, model.devices.get(arguments[0]), true);
        return std::size_t{1};
    }));
}

std::string admit(ControlContext &context, Arguments arguments) {
    return countOfDevices(context.service.withModel([&](Model &model) {
        if (arguments[0] == "all")
            return admitAll(model);
        authorize(model, model.devices.get(arguments[0]));
        return std::size_t{1};
    }));
}

std::string remove(ControlContext &context, Arguments arguments) {
    context.service.withModel([&](Model &model) { removeDevices(model, {arguments[0]}); });
    return countOfDevices(1);
}

std::string add(ControlContext &context, Arguments arguments) {
    const std::size_t count = countOf(arguments[0], "add");
    context.service.withModel([&](Model &model) { addDevices(model, count); });
    return countOfDevices(count);
}

std::string setStatus(ControlContext &context, Arguments arguments) {
    const std::string &id = arguments[0], &auth = arguments[1], &connect = arguments[2],
                      &action = arguments[3];
    Authorization authorization{};
    if (auth != "-" && !authorizationOf(auth, authorization))
        throw std::runtime_error("no such authorization");
    if (connect != "-" && connect != "Connected" && connect != "Unreachable")
        throw std::runtime_error("a device is Connected or Unreachable");
    context.service.withModel([&](Model &model) {
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
    return countOfDevices(1);
}

std::string makeTask(ControlContext &context, Arguments arguments) {
    const auto count = numberOf(arguments[1]);
    const auto delay = arguments.size() == 3 ? numberOf(arguments[2]) : std::optional<std::size_t>(0);
    if (!count || !delay || *delay > maxDelayMs)
        throw std::runtime_error("task takes a type, a number of devices and a delay");
    return "ok " + context.service.withModel([&](Model &model) {
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
            item.access = Access::Anyone;
        }
        const std::string user = model.accounts.all().front().email;
        const std::string id = model.engine.create(arguments[0], user, devices, now).id;
        model.engine.startWork(id, work, now);
        return id;
    });
}

std::string setTaskPace(ControlContext &context, Arguments arguments) {
    const auto paceMs = static_cast<std::int64_t>(fractionOf(arguments[0], "task-pace", 3600000));
    context.service.withModel([&](Model &model) { model.engine.rules().paceMs = paceMs; });
    return "ok";
}

std::string setTaskFailures(ControlContext &context, Arguments arguments) {
    const double share = fractionOf(arguments[0], "task-failures", 1);
    context.service.withModel([&](Model &model) { model.engine.rules().failures = share; });
    return "ok";
}

std::string touchTasks(ControlContext &context, Arguments arguments) {
    const std::size_t count = countOf(arguments[0], "touch-tasks");
    const auto touched = context.service.withModel([&](Model &model) { return model.tasks.touch(count); });
    return "ok " + std::to_string(touched) + " tasks";
}

std::string raiseAlarms(ControlContext &context, Arguments arguments) {
    const auto kind = numberOf(arguments[0]);
    const auto count = arguments.size() == 2 ? numberOf(arguments[1]) : std::optional<std::size_t>(1);
    if (!kind || *kind < 1 || *kind > 6 || !count || *count > maxCount)
        throw std::runtime_error("alarm takes a number from 1 to 6 and how often");
    context.service.withModel([&](Model &model) {
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

std::string setPermission(ControlContext &context, Arguments arguments) {
    context.service.withModel(
        [&](Model &model) { model.accounts.setPermission(arguments[0], arguments[1]); });
    return "ok";
}

std::string orbStatus(ControlContext &context, Arguments) {
    return context.service.withModel([](Model &model) {
        return "ok added=" + std::to_string(model.orb.isAdded()) + ' ' + model.orb.statusText();
    });
}

std::string expireOrbSignIn(ControlContext &context, Arguments) {
    context.service.withModel([](Model &model) { model.orb.forgetSignIn(); });
    return "ok";
}

std::string disconnectOrb(ControlContext &context, Arguments) {
    context.service.withModel([](Model &model) { model.orb.disconnect(); });
    return "ok";
}

std::string makeOrganizations(ControlContext &context, Arguments arguments) {
    constexpr int asInNewStore = -1;
    const int count = arguments[0] == "default"
                          ? asInNewStore
                          : static_cast<int>(countOf(arguments[0], "orb orgs", maxOrganizations));
    context.service.withModel([&](Model &model) { model.orb.makeOrganizations(count); });
    return "ok";
}

std::string setOrbConnected(ControlContext &context, Arguments arguments) {
    const bool on = isOn(arguments[0]);
    context.service.withModel([&](Model &model) { model.orb.setConnected(on); });
    return "ok";
}

std::string setRemoteAccess(ControlContext &context, Arguments arguments) {
    const bool on = isOn(arguments[0]);
    context.service.withModel([&](Model &model) { model.orb.setRemoteAccess(on); });
    return "ok";
}

std::string printHelp(ControlContext &, Arguments) {
    return controlHelp() + "ok";
}

constexpr ControlCommand commands[] = {
    {"help", "", "list the commands", &printHelp},
    {"fault", "FAULT", "respond badly, as with --fault", &addFault},
    {"faults clear", "", "end all faults", &clearFaults},
    {"counts", "", "numbers of devices, sites, accounts and sessions", &counts},
    {"expire-sessions", "", "end every session", &expireSessions},
    {"drop", "ID|N", "disconnect a device, or N of them, until they are restored", &drop},
    {"restore", "ID|all", "connect devices again", &restore},
    {"admit", "ID|all", "connect devices again and let the service in", &admit},
    {"add", "N", "add N devices", &add},
    {"remove", "ID", "remove a device", &remove},
    {"status", "ID AUTH CONNECT ACTION", "set states; blanks in double quotes, \"-\" for no change",
     &setStatus},
    {"life", "on|off", "let the fleet change by itself, or hold it still", &switchLife},
    {"tick", "N", "simulate N ticks at once", &tick},
    {"task", "TYPE COUNT [DELAY_MS]", "another client's task on COUNT devices, at once or scheduled",
     &makeTask},
    {"task-pace", "MS", "as the option", &setTaskPace},
    {"task-failures", "P", "as the option", &setTaskFailures},
    {"touch-tasks", "N", "show another progress for the newest N tasks", &touchTasks},
    {"alarm", "DESPID [COUNT]", "raise alarms; nothing happens to the devices", &raiseAlarms},
    {"permission", "EMAIL PERMISSION", "from now on, for the account's open sessions too", &setPermission},
    {"orb status", "", "the connection to the remote-access service", &orbStatus},
    {"orb expire", "", "end the sign-in there", &expireOrbSignIn},
    {"orb disconnect", "", "end the connection from there", &disconnectOrb},
    {"orb orgs", "N|default", "N organizations, or the three of a new store", &makeOrganizations},
    {"orb connected", "on|off", "whether the service reaches it", &setOrbConnected},
    {"orb remote-access", "on|off", "whether it permits remote access", &setRemoteAccess},
    {"stop", "", "end the program", &stop},
};

std::vector<std::string> splitAtBlanks(const char *text) {
    std::istringstream stream(text);
    std::vector<std::string> words;
    for (std::string word; stream >> word;)
        words.push_back(std::move(word));
    return words;
}

std::string usageOf(const ControlCommand &command) {
    return *command.arguments ? std::string(command.name) + ' ' + command.arguments : command.name;
}

bool takes(const ControlCommand &command, std::size_t count) {
    const auto arguments = splitAtBlanks(command.arguments);
    const auto required = std::count_if(arguments.begin(), arguments.end(),
                                        [](const std::string &argument) { return argument[0] != '['; });
    return count >= static_cast<std::size_t>(required) && count <= arguments.size();
}

} // namespace

std::string runCommand(ControlContext &context, const std::vector<std::string> &words) {
    for (const ControlCommand &command : commands) {
        const auto name = splitAtBlanks(command.name);
        if (words.size() < name.size() || !std::equal(name.begin(), name.end(), words.begin()))
            continue;
        const Arguments arguments = Arguments(words).subspan(name.size());
        if (!takes(command, arguments.size()))
            throw std::runtime_error("usage: " + usageOf(command));
        return command.run(context, arguments);
    }
    throw std::runtime_error("no such command; see help");
}

std::string controlHelp() {
    std::string text;
    for (const ControlCommand &command : commands) {
        std::string usage = "  " + usageOf(command);
        usage.resize(std::max(usage.size() + 2, usageWidth), ' ');
        text += usage + command.help + '\n';
    }
    return text;
}

} // namespace emulator
