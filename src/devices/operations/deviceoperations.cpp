#include "devices/operations/deviceoperations.h"

#include "api/client/apilog.h"
#include "api/session/pagereader.h"
#include "api/session/servicesession.h"
#include "platform/log/messagelog.h"
#include "tasks/queue/taskmaker.h"
#include "tasks/service/existingdevices.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/tasktype.h"

#include <QDebug>
#include <QSet>

#include <nlohmann/json.hpp>

#include <array>
#include <cstdio>

namespace DeviceOperations {

namespace {

/// Devices take commands in a buffer of this size, with the zero at the end.
constexpr std::size_t commandSize = 256;

JSON idsOf(const QStringList &deviceIds) {
    JSON ids = JSON::array();
    for (const QString &id : deviceIds)
        ids.push_back(id.toStdString());
    return ids;
}

/// Makes a task for the devices; the outcome's task is empty where the service made none.
Outcome makeTask(ServiceSession &session, const QString &type, const QStringList &deviceIds) {
    std::string tid;
    const unsigned result = ApiLog::logged(
        "newTaskState", TaskMaker::make(session, type.toUtf8().constData(), idsOf(deviceIds), tid));
    return {result, QString::fromStdString(tid), {}};
}

/// Does something for devices, and once more for the rest when the service refuses because some of them are
/// gone meanwhile.
template <typename Attempt>
Outcome withoutVanished(ServiceSession &session, QStringList &deviceIds, Attempt attempt) {
    Outcome outcome = attempt();
    if (outcome.result != ApiServerError)
        return outcome;
    const ExistingDevices left = ExistingDevices::among(deviceIds, session);
    deviceIds = left.ids;
    if (left.canRetry())
        outcome = attempt();
    outcome.vanished = left.vanished;
    return outcome;
}

/// Makes a task, shows it in the task list, and then has its work done for the devices that are left.
template <typename Work>
Outcome runUnderTask(ServiceSession &session, const QString &type, QStringList deviceIds, Work work) {
    Outcome outcome = withoutVanished(session, deviceIds, [&] { return makeTask(session, type, deviceIds); });
    if (outcome.result != ApiOk)
        return outcome;
    CTaskInfoPool::instance().fetchTaskStatuses(session);
    outcome.result = work(deviceIds, outcome.tid.toStdString());
    outcome.mayHaveBegun = session.isUnanswered();
    return outcome;
}

/// Runs a command on devices under a task of their own.
Outcome runCommand(ServiceSession &session, const QString &type, const QStringList &deviceIds,
                   const QByteArray &command) {
    return runUnderTask(session, type, deviceIds, [&](const QStringList &ids, const std::string &tid) {
        JSON targets = JSON::array();
        for (const QString &id : ids)
            targets.push_back({{"id", id.toStdString()}, {"tid", tid}});
        JSON answers;
        return ApiLog::logged("runCustomCgisEx", session.call([&](CApiClient &client) {
            return client.runCustomCgisEx(JSON::array({command.toStdString()}), targets, answers);
        }));
    });
}

QByteArray dumpOf(const QStringList &deviceIds) {
    return QByteArray::fromStdString(dumpJson(idsOf(deviceIds)));
}

int countOf(const QStringList &deviceIds) {
    return static_cast<int>(deviceIds.size());
}

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

Outcome restart(ServiceSession &session, const QStringList &deviceIds) {
    return runCommand(session, TaskType::restart, deviceIds, "/cgi-bin/admin/setparam.cgi?system_reset=0");
}

Outcome restore(ServiceSession &session, const QStringList &deviceIds, const RestoreOptions &options) {
    qDebug("restore device: device id count[%d], dump[%s], net[%d], dst[%d], lang[%d], nadp[%d], focus[%d], "
           "len[%d]",
           countOf(deviceIds), dumpOf(deviceIds).constData(), options.network, options.daylightSaving,
           options.language, options.nadp, options.focus, options.lens);
    return runCommand(session, TaskType::restore, deviceIds, restoreCommand(options));
}

Outcome changePassword(ServiceSession &session, const QStringList &deviceIds, const QString &name,
                       const QString &password) {
    qDebug("set password: device id count[%d], dump[%s], name[%s], password[%s]", countOf(deviceIds),
           dumpOf(deviceIds).constData(), qUtf8Printable(name), MessageLog::secret(password).constData());
    return runCommand(session, TaskType::changePassword, deviceIds, passwordCommand(name, password));
}

Outcome setPasswordPolicy(ServiceSession &session, const QStringList &deviceIds,
                          const PasswordPolicy &policy) {
    const Outcome outcome = runUnderTask(
        session, TaskType::passwordPolicy, deviceIds, [&](const QStringList &ids, const std::string &tid) {
            return session.call([&](CApiClient &client) {
                return client.setPassPolicy(idsOf(ids), std::to_string(policy.rules).c_str(), policy.length,
                                            tid.c_str());
            });
        });
    qDebug(outcome.result == ApiOk ? "apply password policy successfully!" : "apply password policy failed!");
    return outcome;
}

Outcome authorize(ServiceSession &session, const QStringList &deviceIds, const QString &name,
                  const QString &password) {
    qDebug("authorize device: device id count[%d], dump[%s], name[%s], password[%s]", countOf(deviceIds),
           dumpOf(deviceIds).constData(), qUtf8Printable(name), MessageLog::secret(password).constData());
    QStringList ids = deviceIds;
    const Outcome outcome = withoutVanished(session, ids, [&] {
        Outcome made;
        made.result = session.call([&](CApiClient &client) {
            return client.authDevices(idsOf(ids), name.toUtf8().constData(), password.toUtf8().constData());
        });
        made.mayHaveBegun = session.isUnanswered();
        return made;
    });
    qDebug(outcome.result == ApiOk ? "http api(authDevices) successfully!" : "http api(authDevices) failed!");
    return outcome;
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
