// Tasks, alarms and the service's log.

#include "api/client/apiclient.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <stdexcept>
#include <string_view>

namespace {

constexpr int logEntryLimit = 200'000;

/// The members of a log entry and the columns that show them.
constexpr std::pair<const char *, const char *> logColumns[] = {{"created_at", "Date/Time"},
                                                                {"source", "Source"},
                                                                {"type", "Type"},
                                                                {"description", "Description"},
                                                                {"user", "User"}};

bool isFinalState(std::string_view state) {
    return state == "pTaskDone" || state == "pTaskAborted" || state == "pTaskFailed";
}

JSON logRow(const JSON &entry) {
    JSON row = JSON::object();
    for (const auto &[member, column] : logColumns) {
        if (!entry.is_object() || !entry.contains(member))
            throw std::runtime_error("cannot get value");
        row[column] = entry.at(member);
    }
    return row;
}

} // namespace

unsigned CApiClient::newTaskState(const char *szType, const JSON &devices, JSON &task) {
    if (isEmpty(szType) || !devices.is_array())
        return ApiInvalidArgument;
    return postAsAccount({"newTaskState", "/v1/task/init", Payload::Ciphered},
                         {{"type", szType}, {"devices", devices}}, &task);
}

unsigned CApiClient::listTaskStatus(int nStart, int nCount, JSON &tasks) {
    return postForPage({"listTaskStatus", "/v1/task/list", Payload::Ciphered}, nStart, nCount, tasks);
}

unsigned CApiClient::removeTaskStatus(const JSON &tids) {
    if (!tids.is_array())
        return ApiInvalidArgument;
    return postAsAccount({"removeTaskStatus", "/v1/task/rm"}, {{"tids", tids}});
}

unsigned CApiClient::updateTaskState(const char *szTaskId, const char *szState) {
    if (isEmpty(szTaskId) || !szState || !isFinalState(szState))
        return ApiInvalidArgument;
    return postAsAccount(
        {.method = "updateTaskState",
         .path = "/v1/task/updateState",
         .logTransportError =
             [](const Call &, const std::string &error) {
                 qWarning("Encountered HTTP request error when CApiClient::updateTaskState: %s",
                          error.c_str());
             },
         .logException =
             [](const Call &, const std::string &error) {
                 qWarning("Encountered unexpected error when CApiClient::updateTaskState: %s", error.c_str());
             }},
        {{"task_id", szTaskId}, {"task_state", szState}});
}

unsigned CApiClient::listAlarmInfo(int nStart, int nCount, JSON &alarms) {
    const unsigned result = postAsAccount({"listAlarmInfo", "/v1/alarm/list", Payload::Ciphered},
                                          {{"start", nStart}, {"count", nCount}}, &alarms);
    if (result == ApiOk && alarms.is_object() && alarms.contains("items"))
        cutTo(alarms["items"], nCount);
    return result;
}

unsigned CApiClient::removeAlarmInfo(const JSON &alids) {
    if (!alids.is_array())
        return ApiInvalidArgument;
    return postAsAccount({"removeAlarmInfo", "/v1/alarm/rm"}, {{"alids", alids}});
}

unsigned CApiClient::browseLogs(const char *szStart, const char *szEnd, JSON &table) {
    if (isEmpty(szStart) || isEmpty(szEnd))
        return ApiInvalidArgument;
    static constexpr auto logException = [](const Call &, const std::string &error) {
        qWarning("Encountered unexpected error when CApiClient::browseLogs: %s", error.c_str());
    };
    const Call call{.method = "browseLogs",
                    .path = "/v1/logs/list",
                    .payload = Payload::Ciphered,
                    .logTransportError =
                        [](const Call &, const std::string &error) {
                            qWarning("Encountered HTTP request error when CApiClient::browseLogs: %s",
                                     error.c_str());
                        },
                    .logException = logException};
    JSON data;
    const unsigned result = postAsAccount(call, {{"start_time", szStart}, {"end_time", szEnd}}, &data);
    if (result != ApiOk)
        return result;
    try {
        JSON rows = JSON::array();
        cutTo(data.at("items"), logEntryLimit);
        for (const JSON &entry : data.at("items"))
            rows.push_back(logRow(entry));
        table = std::move(rows);
        return ApiOk;
    } catch (const std::exception &error) {
        logException(call, error.what());
    }
    return ApiException;
}

unsigned CApiClient::exportDebugInfo(const char *szStorePath, const JSON &devices, JSON &answer) {
    if (!szStorePath || !devices.is_array())
        return ApiInvalidArgument;
    return postAsAccount({"exportDebugInfo", "/v1/export/debif", Payload::Plain},
                         {{"storepath", szStorePath}, {"devices", devices}}, &answer);
}
