#include "devices/operations/files/exportdebuginfodialog.h"

#include "devices/operations/files/filefield.h"
#include "devices/operations/operations.h"
#include "devices/operations/queueing.h"
#include "devices/operations/targetsummary.h"
#include "tasks/queue/exetaskmgr.h"
#include "tasks/service/tasktargets.h"

#include <QLabel>

#include <nlohmann/json.hpp>

ExportDebugInfoDialog::ExportDebugInfoDialog(OperationTargets::List targets, QWidget *parent)
    : OperationDialog(tr("Export Debug Info"), parent),
      m_folder(new FileField(FileField::Kind::Folder,
                             {tr("Folder on this computer"), tr("Choose Folder"), {}}, body())) {
    setObjectName(QStringLiteral("ExportDebugInfoDialog"));
    m_folder->setObjectName(QStringLiteral("folderField"));
    m_folder->acceptDropsOn(this);
    addPart(m_folder);
    auto *note = label(tr("The devices collect the information first. The report is saved when they are "
                          "done, also if the program is started again meanwhile."),
                       "quiet");
    note->setWordWrap(true);
    addPart(note);
    finish(std::move(targets), OperationTargets::Need::Authorization, tr("Export"), "exportButton");
    connect(m_folder, &PathField::changed, this, &ExportDebugInfoDialog::updateAccept);
    m_folder->setFocus();
}

bool ExportDebugInfoDialog::isComplete() const {
    return m_folder->file().isGood();
}

void ExportDebugInfoDialog::apply() {
    Queueing::post<ExeTaskMgr>(
        this,
        [folder = m_folder->file().path, ids = targets().tickedIds()](ExeTaskMgr &queue) {
            return queue.insertNewExportDebugInfoTask(TaskTargets::ids(ids), folder);
        },
        [this] { setComplaint(tr("The export could not be started.")); });
}

namespace {

QDialog *openExportDebugInfo(OperationContext &context, OperationRequest request) {
    return new ExportDebugInfoDialog(std::move(request.targets), context.dialogParent());
}

} // namespace

const Operation Operations::exportDebugInfo{.objectName = "exportDebugInfoAction",
                                            .text = QT_TRANSLATE_NOOP("Operation", "Export Debug Info"),
                                            .group = Operation::Group::ExportMenu,
                                            .needs = Operation::Needs::Selection,
                                            .taskTypes = {"deviceExportDeviceInfo"},
                                            .helpPage = "exporting.html",
                                            .open = openExportDebugInfo};
