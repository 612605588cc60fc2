#include "devices/operations/deviceoperations.h"

#include "api/client/apilog.h"
#include "api/session/pagereader.h"
#include "api/session/servicesession.h"
#include "platform/log/messagelog.h"
#include "tasks/service/tasktargets.h"

#include <QDebug>
#include <QSet>

#include <nlohmann/json.hpp>

#include <array>
#include <cstdio>

namespace DeviceOperations {

namespace {

/// Devices take commands in a buffer of this size, with the zero at the end.
constexpr std::size_t commandSize = 256;

/// A command in the buffer that devices have for it: what is longer is cut.
template <typename... Values>
QByteArray formatted(const char *format, Values... values) {
    std::array<char, commandSize> buffer{};
    std::snprintf(buffer.data(), buffer.size(), format, values...);
    return buffer.data();
}

constexpr auto passwordFormat = "/cgi-bin/admin/editaccount.cgi?method=edit&username=%s&userpass=%s";

} // namespace

QByteArray passwordCommand(const QString &name, const QString &password) {
    return formatted(passwordFormat, name.toUtf8().constData(), password.toUtf8().constData());
}

int roomInPasswordCommand() {
    const int fixed = std::snprintf(nullptr, 0, passwordFormat, "", "");
    return static_cast<int>(commandSize) - 1 - fixed;
}

QByteArray restoreCommand(const RestoreOptions &options) {
    const auto &[network, daylightSaving, language, nadp, focus, lens] = options;
    if (std::max({network, daylightSaving, language, nadp, focus, lens}) < 0)
        return "/cgi-bin/admin/setparam.cgi?system_restore=1";
    return formatted("/cgi-bin/admin/setparam.cgi?system_restoreexceptnet=%d&system_restoreexceptdst=%d"
                     "&system_restoreexceptlang=%d&system_restoreexceptnadp=%d"
                     "&system_restoreexceptfocusvalue=%d&system_restoreexceptlen=%d",
                     network, daylightSaving, language, nadp, focus, lens);
}

Outcome runTask(const DeviceTask &task, const Work &work) {
    QStringList ids = task.deviceIds;
    ServiceTask::Steps steps;
    steps.type = task.type;
    steps.ids = ids;
    steps.devices = [&ids] { return TaskTargets::ids(ids); };
    steps.keepOnly = [&ids](const ExistingDevices &existing) { ids = existing.ids; };
    steps.retry = task.retry;
    steps.work = [&](const QString &tid) { return work(ids, tid); };
    return ServiceTask::run(task.session, steps);
}

Outcome runCommand(const DeviceTask &task, const QByteArray &command) {
    return runTask(task, [&](const QStringList &ids, const QString &tid) {
        const JSON targets = TaskTargets::withTask(TaskTargets::ids(ids), tid.toStdString());
        JSON responses;
        return ApiLog::logged("runCustomCgisEx", task.session.call([&](CApiClient &client) {
            return client.runCustomCgisEx(JSON::array({command.toStdString()}), targets, responses);
        }));
    });
}

Outcome authorize(ServiceSession &session, const QStringList &deviceIds, const QString &name,
                  const QString &password) {
    qDebug("authorize device: device id count[%d], dump[%s], name[%s], password[%s]",
           static_cast<int>(deviceIds.size()), dumpIds(deviceIds).constData(), qUtf8Printable(name),
           MessageLog::secret(password).constData());
    QStringList ids = deviceIds;
    const auto attempt = [&] {
        Outcome outcome;
        outcome.result = session.call([&](CApiClient &client) {
            return client.authDevices(TaskTargets::ids(ids), name.toUtf8().constData(),
                                      password.toUtf8().constData());
        });
        outcome.mayHaveBegun = session.isUnanswered();
        return outcome;
    };
    const Outcome outcome = ServiceTask::withoutMissing(
        session, deviceIds, [&](const ExistingDevices &existing) { ids = existing.ids; }, attempt);
    qDebug(outcome.result == ApiOk ? "http api(authDevices) successfully!" : "http api(authDevices) failed!");
    return outcome;
}

QByteArray dumpIds(const QStringList &deviceIds) {
    return QByteArray::fromStdString(dumpJson(TaskTargets::ids(deviceIds)));
}

std::map<DeviceStatusCode, int> readStates(ServiceSession &session, const QStringList &deviceIds) {
    const QSet<QString> wanted(deviceIds.begin(), deviceIds.end());
    std::map<DeviceStatusCode, int> states;
    const unsigned result = PageReader::readAll(
        session, &CApiClient::listDeviceStatus, PageReader::recordsOfPage, [&](const JSON &page) {
            for (const JSON &status : page) {
                if (wanted.contains(stringMember(status, "id")))
                    ++states[DeviceStatus::codeOf(textMember(status, "connect_status"),
                                                  textMember(status, "auth_status"),
                                                  textMember(status, "action_status"))];
            }
        });
    return result == ApiOk ? states : std::map<DeviceStatusCode, int>();
}

} // namespace DeviceOperations
