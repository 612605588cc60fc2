#pragma once

#include "tasks/queue/taskqueue.h"

/// The queue of operations that run commands on devices. Every insertion returns false, with the reason in
/// the log, when something is missing; ctid takes the record's id where it is not null.
class ExeTaskMgr : public TaskQueue {
    Q_OBJECT

public:
    static ExeTaskMgr &instance();

    /// devices: array of ids.
    bool insertNewAutoAssignIpTask(const JSON &devices, QString *ctid = nullptr);
    /// devices: array of {"id","ip"}, each with its new address. The servers of names may be empty.
    bool insertNewManualAssignIpTask(const JSON &devices, const QString &mask, const QString &gate,
                                     const QString &dns1, const QString &dns2, QString *ctid = nullptr);
    /// storePath: the folder on this computer for the report, which CPostWork collects.
    bool insertNewExportDebugInfoTask(const JSON &devices, const QString &storePath, QString *ctid = nullptr);
    /// info: the settings as CApiClient::runQuickSetup takes them.
    bool insertNewQuickSetupTask(const JSON &devices, const JSON &info, QString *ctid = nullptr);

private:
    ExeTaskMgr();
};
