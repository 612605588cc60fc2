#include "devices/operations/files/uploadpackagedialog.h"

#include "devices/operations/files/filefield.h"
#include "devices/operations/operations.h"
#include "devices/operations/queueing.h"
#include "devices/operations/targetsummary.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "tasks/service/tasktargets.h"

#include <QCheckBox>

#include <nlohmann/json.hpp>

namespace {

/// Percent; little is left for a package beyond it.
constexpr quint64 fullCard = 95;

bool isCardFull(const DeviceRecord &device) {
    const quint64 usage = device.sortKey(DeviceColumn::SdCardUsage);
    return usage != DeviceRecord::unknownKey && usage >= fullCard;
}

} // namespace

UploadPackageDialog::UploadPackageDialog(OperationTargets::List targets, QWidget *parent)
    : OperationDialog(tr("Upload Package"), parent),
      m_file(new FileField(FileField::Kind::File,
                           {tr("Package"), tr("Choose Package"), tr("One file of up to 4 GiB.")}, body())),
      m_card(new QCheckBox(tr("Store the package on the memory card"), body())) {
    setObjectName(QStringLiteral("UploadPackageDialog"));
    m_file->setObjectName(QStringLiteral("packageFileField"));
    m_file->acceptDropsOn(this);
    m_card->setObjectName(QStringLiteral("sdCardCheckBox"));
    addPart(m_file);
    addPart(m_card);
    finish(std::move(targets), OperationTargets::Need::Authorization, tr("Upload"), "uploadButton");
    connect(m_file, &PathField::changed, this, &UploadPackageDialog::updateAccept);
    connect(m_card, &QCheckBox::toggled, this, &UploadPackageDialog::showCardWarnings);
    m_file->setFocus();
}

void UploadPackageDialog::showCardWarnings() {
    TargetWarning none{
        [](int count) { return tr("%n device(s) will fail: no memory card is ready.", nullptr, count); },
        tr("No memory card ready"),
        {}};
    TargetWarning full{[](int count) {
                           return tr("%n device(s) may fail: the memory card is almost full.", nullptr,
                                     count);
                       },
                       tr("Memory card almost full"),
                       {}};
    const OperationTargets::List &list = targets().targets();
    for (std::size_t i = 0; m_card->isChecked() && i < list.size(); ++i) {
        const DeviceRecord &device = *list[i].device;
        if (!device.hasCard)
            none.targets.push_back(static_cast<int>(i));
        else if (isCardFull(device))
            full.targets.push_back(static_cast<int>(i));
    }
    std::vector<TargetWarning> warnings;
    for (TargetWarning *warning : {&none, &full}) {
        if (!warning->targets.empty())
            warnings.push_back(std::move(*warning));
    }
    setWarnings(std::move(warnings));
}

bool UploadPackageDialog::isComplete() const {
    return m_file->file().isGood();
}

void UploadPackageDialog::apply() {
    Queueing::post<UploadTaskMgr>(
        this,
        [file = m_file->file(), toCard = m_card->isChecked(),
         ids = targets().tickedIds()](UploadTaskMgr &queue) {
            return queue.insertNewPackageUploadTask(QStringLiteral("manual"), file.name, file.path, toCard,
                                                    TaskTargets::ids(ids));
        },
        [this] { setComplaint(tr("The upload could not be started.")); });
}

namespace {

QDialog *openUploadPackage(OperationContext &context, OperationRequest request) {
    return new UploadPackageDialog(std::move(request.targets), context.dialogParent());
}

} // namespace

const Operation Operations::uploadPackage{.objectName = "uploadPackageAction",
                                          .text = QT_TRANSLATE_NOOP("Operation", "Upload Package"),
                                          .group = Operation::Group::UploadMenu,
                                          .needs = Operation::Needs::Selection,
                                          .taskTypes = {"devicePackageUpload"},
                                          .helpPage = "uploads.html",
                                          .open = openUploadPackage};
