#include "devices/addressbook.h"
#include "devices/devicecommands.h"
#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"
#include "tasks/taskwork.h"

namespace emulator {

namespace {

constexpr auto storedKey = "custom_commands";

Json storedCommands(Model &model) {
    const std::string text = model.store.value(storedKey);
    return text.empty() ? Json::array() : Json::parse(text);
}

void checkMethod(const Json &command) {
    const std::string method = optionalText(command, "method");
    if (!method.empty() && method != "GET" && method != "POST")
        throw Refusal(Code::Malformed, "a command is sent with GET or POST");
}

void checkStored(const Json &commands) {
    for (const Json &command : commands) {
        if (!command.is_object())
            throw Refusal(Code::Malformed, "a command is no object");
        for (const char *name : {"cgiid", "name", "method", "command"})
            filledTextMember(command, name);
        textMember(command, "description");
        checkMethod(command);
    }
}

Response listCommands(Service &service, const Call &call) {
    const Page page = pageOf(call.body);
    const Json all = service.withModel(&storedCommands);
    Json part = Json::array();
    for (std::size_t i = page.start; i < all.size() && part.size() < page.count; ++i)
        part.push_back(all[i]);
    return Response::secret(jsonText(part));
}

Response commitCommands(Service &service, const Call &call) {
    const std::string stage = textMember(call.body, "state");
    const Json &commands = arrayMember(call.body, "cgis");
    service.withModel([&](Model &model) {
        const auto complete = model.batches.take("cgis " + call.session.session, stage, commands, nowMs());
        if (complete) {
            checkStored(*complete);
            model.store.setValue(storedKey, jsonText(*complete));
        }
    });
    return {};
}

/// The commands to run: texts, or objects as they are stored.
std::vector<std::string> commandsOf(const Json &body) {
    std::vector<std::string> commands;
    for (const Json &element : arrayMember(body, "cgis")) {
        if (element.is_object()) {
            checkMethod(element);
            commands.push_back(filledTextMember(element, "command"));
        } else if (element.is_string() && !element.get_ref<const std::string &>().empty()) {
            commands.push_back(element.get<std::string>());
        } else {
            throw Refusal(Code::Malformed, "an element of \"cgis\" is no command");
        }
    }
    if (commands.empty())
        throw Refusal(Code::Malformed, "there is no command to run");
    return commands;
}

Json respondAtOnce(Model &model, Device &device, const CommandSeries &series, AddressBook &addresses) {
    const DeviceWork work = series.workOf(device, addresses);
    const auto response = [&](int status, const std::string &body) {
        return Json{{"id", device.id}, {"status", status}, {"body", body}};
    };
    switch (doAtOnce(model, device, work)) {
    case Outcome::NoConnection:
        return response(503, "no connection");
    case Outcome::NotAuthorized:
        return response(401, "not authorized");
    case Outcome::Failed:
        return response(400, work.failure);
    case Outcome::Done:
        break;
    }
    if (!series.action().empty())
        model.engine.restart(device, series.action(), nowMs());
    return response(200, "ok");
}

Json runCommands(Service &service, const Call &call) {
    const CommandSeries series(commandsOf(call.body));
    const auto targets = targetsOf(call.body);
    return service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        checkKnownWithoutTask(model, targets);
        AddressBook addresses(model);
        startUnderTasks(model, targets, {},
                        [&](const Device &device) { return series.workOf(device, addresses); });
        Json responses = Json::array();
        Transaction transaction(model.store.database());
        for (const Target &target : targets)
            responses.push_back(target.taskId.empty()
                                    ? respondAtOnce(model, model.devices.get(target.id), series, addresses)
                                    : Json{{"id", target.id}, {"status", 0}, {"body", ""}});
        transaction.commit();
        return responses;
    });
}

Response runSilently(Service &service, const Call &call) {
    runCommands(service, call);
    return {};
}

Response runTelling(Service &service, const Call &call) {
    return Response::plain(jsonText(runCommands(service, call)));
}

} // namespace

Endpoints commandEndpoints() {
    return {
        {"POST", "/v1/cgi/list", Role::Reader, &listCommands},
        {"POST", "/v1/cgi/commit", Role::Writer, &commitCommands},
        {"POST", "/v1/cgi/custom", Role::Writer, &runSilently},
        {"POST", "/v1/cgi/customx", Role::Writer, &runTelling},
    };
}

} // namespace emulator
