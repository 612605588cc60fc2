#include "tasks/queue/exetaskmgr.h"

#include "api/session/servicesession.h"
#include "tasks/queue/postwork.h"
#include "tasks/queue/taskcheck.h"
#include "tasks/service/tasktargets.h"

#include <QDebug>

#include <nlohmann/json.hpp>

namespace {

JSON idsOf(const JSON &record) {
    return TaskTargets::ids(record.at("devices"));
}

unsigned runGeneral(TaskContext &step, const char *path, const JSON &body) {
    return step.session.call([&](CApiClient &client) { return client.runGeneralCgis(path, body); });
}

unsigned assignAuto(TaskContext &step) {
    return runGeneral(step, "/v1/assip/auto", {{"tid", step.tid}, {"devices", idsOf(step.record)}});
}

unsigned assignManual(TaskContext &step) {
    return runGeneral(step, "/v1/assip/manual",
                      {{"tid", step.tid},
                       {"devices", step.record.at("devices")},
                       {"mask", step.text("mask")},
                       {"gate", step.text("gate")},
                       {"dns1", step.text("dns1")},
                       {"dns2", step.text("dns2")}});
}

unsigned exportDebugInfo(TaskContext &step) {
    const JSON devices = TaskTargets::withTask(step.record.at("devices"), step.tid);
    // Noted before the service begins, so that nothing it has collected is forgotten.
    CPostWork::instance().expectExport(step.session.login(), QString::fromStdString(step.tid),
                                       stringMember(step.record, "storepath"));
    JSON answer;
    return step.session.call([&](CApiClient &client) {
        return client.exportDebugInfo(step.text("storepath").c_str(), devices, answer);
    });
}

unsigned quickSetup(TaskContext &step) {
    // A service that cannot even tell its sites is not asked to change devices.
    JSON answer;
    unsigned result = step.session.call([&](CApiClient &client) { return client.listSites(0, 1, answer); });
    if (result != ApiOk) {
        qWarning("HTTP API(listSites) failed!");
        step.hasBegun = false;
        return result;
    }
    const JSON devices = TaskTargets::withTask(step.record.at("devices"), step.tid);
    result = step.session.call(
        [&](CApiClient &client) { return client.runQuickSetup(devices, step.record.at("info"), answer); });
    if (result != ApiOk)
        qWarning("HTTP API(runQuickSetup) failed! (%u)", result);
    return result;
}

void logDevices(const char *purpose, const TaskContext &step) {
    qDebug("%s with devices: %s", purpose, dumpJson(step.record.at("devices")).c_str());
}

void announceCommands(const TaskContext &step) {
    logDevices("Executing CGI commands", step);
}

constexpr TaskKind::Lines commandLines = {
    "Executing CGI commands failed!", "Executing CGI commands success.",
    "Executing CGI commands occurs error: ", "Updating executing task state occurs error: "};

constexpr TaskKind families[] = {
    {.type = "assignip_auto",
     .serviceType = "deviceAssignIPAuto",
     .idPrefix = "assignip_auto_id_",
     .targets = "devices",
     .lines = commandLines,
     .devices = &idsOf,
     .announce = &announceCommands,
     .work = &assignAuto},
    {.type = "assignip_manual",
     .serviceType = "deviceAssignIPManual",
     .idPrefix = "assignip_manual_id_",
     .targets = "devices",
     .lines = commandLines,
     .devices = &idsOf,
     .announce = &announceCommands,
     .work = &assignManual},
    {.type = "export_debuginfo",
     .serviceType = "deviceExportDeviceInfo",
     .idPrefix = "export_debuginfo_id_",
     .targets = "devices",
     .lines = {"Exporting debug info failed!", "Exporting debug info success.",
               "Exporting debug info occurs error: ", commandLines.update},
     .devices = &idsOf,
     .announce = [](const TaskContext &step) { logDevices("Executing exporting debug info", step); },
     .work = &exportDebugInfo},
    {.type = "quick_setup",
     .serviceType = "deviceQuickSetup",
     .idPrefix = "quick_setup_id_",
     .targets = "devices",
     // The step itself tells which of its two requests failed.
     .lines = {nullptr, "Running Quick Setup done.",
               "Exporting Quick Setup occurs error: ", commandLines.update},
     .devices = &idsOf,
     .announce = [](const TaskContext &step) { logDevices("Executing Quick Setup", step); },
     .work = &quickSetup},
};

} // namespace

ExeTaskMgr &ExeTaskMgr::instance() {
    // Never destroyed: its worker may run until the program ends.
    static auto *const manager = new ExeTaskMgr;
    return *manager;
}

ExeTaskMgr::ExeTaskMgr() : TaskQueue(families, "Handling FW upload task occurs error: ") {
    // Steps tell it of their exports, but it has to be made in this thread.
    CPostWork::instance();
}

bool ExeTaskMgr::insertNewAutoAssignIpTask(const JSON &devices, QString *ctid) {
    qDebug("Initiating auto assigning IP task");
    return TaskCheck().devices(devices).passed() && insert("assignip_auto", {{"devices", devices}}, ctid);
}

bool ExeTaskMgr::insertNewManualAssignIpTask(const JSON &devices, const QString &mask, const QString &gate,
                                             const QString &dns1, const QString &dns2, QString *ctid) {
    qDebug("Initiating manually assigning IP task");
    return TaskCheck().texts({mask, gate}).devices(devices).passed() && insert("assignip_manual",
                                                                               {{"devices", devices},
                                                                                {"mask", mask.toStdString()},
                                                                                {"gate", gate.toStdString()},
                                                                                {"dns1", dns1.toStdString()},
                                                                                {"dns2", dns2.toStdString()}},
                                                                               ctid);
}

bool ExeTaskMgr::insertNewExportDebugInfoTask(const JSON &devices, const QString &storePath, QString *ctid) {
    qDebug("Initiating export debug info task");
    return TaskCheck().texts({storePath}).devices(devices).passed() &&
           insert("export_debuginfo", {{"devices", devices}, {"storepath", storePath.toStdString()}}, ctid);
}

bool ExeTaskMgr::insertNewQuickSetupTask(const JSON &devices, const JSON &info, QString *ctid) {
    qDebug("Initiating quick setup task");
    return TaskCheck().require(info.is_object() && !info.empty()).devices(devices).passed() &&
           insert("quick_setup", {{"devices", devices}, {"info", info}}, ctid);
}
