#include "devices/operations/files/uploadconfigurationdialog.h"

#include "devices/operations/files/filefield.h"
#include "devices/operations/operations.h"
#include "devices/operations/queueing.h"
#include "devices/operations/targetsummary.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "tasks/service/tasktargets.h"

#include <nlohmann/json.hpp>

UploadConfigurationDialog::UploadConfigurationDialog(OperationTargets::List targets, QWidget *parent)
    : OperationDialog(tr("Upload Configuration File"), parent),
      m_file(new FileField(
          FileField::Kind::File,
          {tr("Configuration file"), tr("Choose Configuration File"), tr("One file of up to 4 GiB.")},
          body())) {
    setObjectName(QStringLiteral("UploadConfigurationDialog"));
    m_file->setObjectName(QStringLiteral("configurationFileField"));
    m_file->acceptDropsOn(this);
    addPart(m_file);
    finish(std::move(targets), OperationTargets::Need::Authorization, tr("Upload"), "uploadButton");
    connect(m_file, &PathField::changed, this, &UploadConfigurationDialog::updateAccept);
    m_file->setFocus();
}

bool UploadConfigurationDialog::isComplete() const {
    return m_file->file().isGood();
}

void UploadConfigurationDialog::apply() {
    Queueing::post<UploadTaskMgr>(
        this,
        [file = m_file->file(), ids = targets().tickedIds()](UploadTaskMgr &queue) {
            return queue.insertNewConfigFileUploadTask(QStringLiteral("manual"), file.name, file.path,
                                                       TaskTargets::ids(ids));
        },
        [this] { setComplaint(tr("The upload could not be started.")); });
}

namespace {

QDialog *openUploadConfiguration(OperationContext &context, OperationRequest request) {
    return new UploadConfigurationDialog(std::move(request.targets), context.dialogParent());
}

} // namespace

const Operation Operations::uploadConfiguration{
    .objectName = "uploadConfigurationAction",
    .text = QT_TRANSLATE_NOOP("Operation", "Upload Configuration File"),
    .group = Operation::Group::UploadMenu,
    .needs = Operation::Needs::Selection,
    .taskTypes = {"deviceConfigFileUpload"},
    .helpPage = "uploads.html",
    .open = openUploadConfiguration};
