#include "devices/operations/deviceactions.h"
#include "devices/operations/operations.h"
#include "devices/operations/targetsummary.h"
#include "tasks/service/tasktype.h"
#include "widgets/dialogs/confirmdialog.h"

#include <QDebug>

namespace {

constexpr auto restartCommand = "/cgi-bin/admin/setparam.cgi?system_reset=0";

QDialog *on_restartButton_clicked(OperationContext &context, OperationRequest request) {
    auto *confirm = new ConfirmDialog(ConfirmDialog::Kind::RestartDevices, context.dialogParent());
    confirm->setAttribute(Qt::WA_DeleteOnClose);
    auto *box = new TargetSummary(confirm);
    const auto warnings = OperationTargets::warnings(request.targets, OperationTargets::Need::Authorization);
    box->setTargets(std::move(request.targets));
    box->setWarnings(warnings);
    confirm->addDetail(box);
    QObject::connect(box, &TargetSummary::tickedChanged, confirm,
                     [confirm, box] { confirm->setAcceptable(box->tickedCount() > 0); });
    QObject::connect(confirm, &QDialog::accepted, context.actions(), [actions = context.actions(), box] {
        qDebug("on_restartButton_clicked accepted");
        actions->start({TaskType::restart, box->tickedIds(), [](const DeviceOperations::DeviceTask &task) {
                            return DeviceOperations::runCommand(task, restartCommand);
                        }});
    });
    return confirm;
}

} // namespace

const Operation Operations::restart{.objectName = "restartButton",
                                    .text = QT_TRANSLATE_NOOP("Operation", "Restart Device"),
                                    .icon = "tool_restart_line",
                                    .group = Operation::Group::MaintenanceButtons,
                                    .needs = Operation::Needs::Selection,
                                    .taskTypes = {"deviceRestart"},
                                    .helpPage = "restarting.html",
                                    .open = on_restartButton_clicked};
