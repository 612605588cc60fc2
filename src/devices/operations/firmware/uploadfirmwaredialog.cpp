#include "devices/operations/firmware/uploadfirmwaredialog.h"

#include "api/client/settingvalue.h"
#include "api/session/servicerequest.h"
#include "devices/operations/credentialfields.h"
#include "devices/operations/files/filefield.h"
#include "devices/operations/firmware/firmwarehistory.h"
#include "devices/operations/firmware/firmwareupload.h"
#include "devices/operations/firmware/modelgroupmodel.h"
#include "devices/operations/firmware/schedulefield.h"
#include "devices/operations/operations.h"
#include "devices/operations/queueing.h"
#include "devices/operations/rollout/rolloutfields.h"
#include "devices/operations/rollout/rolloutmgr.h"
#include "devices/operations/targetsummary.h"
#include "store/storewriter.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/tasktargets.h"
#include "widgets/lists/checktable.h"
#include "widgets/style/theme.h"

#include <QCheckBox>
#include <QHeaderView>
#include <QLabel>
#include <QLocale>
#include <QPushButton>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <numeric>

namespace {

constexpr int contentWidth = 720;
constexpr int maxRows = 4;
constexpr int minRows = 1;

QString number(int value) {
    return QLocale().toString(value);
}

} // namespace

struct UploadFirmwareDialog::Start {
    bool isScheduled = false;
    bool onlyFailed = false;
    std::vector<bool> hasFailed; ///< the last upload, by target
    ModelGroups::Index models;
};

UploadFirmwareDialog::UploadFirmwareDialog(OperationTargets::List targets, QWidget *parent)
    : OperationDialog(tr("Upload Firmware"), parent),
      m_all(std::make_shared<const OperationTargets::List>(std::move(targets))),
      m_file(new FileField(FileField::Kind::File,
                           {tr("Firmware file"), tr("Open Firmware Image"), tr("One file of up to 4 GiB.")},
                           body())),
      m_table(new CheckTable(body())),
      m_groups(new ModelGroupModel(this)),
      m_schedule(new ScheduleField(body())),
      m_waves(new RolloutFields(body())),
      m_onlyFailed(new QCheckBox(tr("Only devices whose last upload failed"), body())) {
    setObjectName(QStringLiteral("UploadFirmwareDialog"));
    content()->setFixedWidth(contentWidth);
    buildFile();
    buildDevices();
    buildTimes();
    finish(tr("Upload"), "uploadButton");
    connect(&std::as_const(*this).targets(), &TargetSummary::tickedChanged, this,
            &UploadFirmwareDialog::onTicked);
    onTicked();
    readStart();
    readUploadLimit();
    m_file->setFocus();
}

UploadFirmwareDialog::~UploadFirmwareDialog() = default;

void UploadFirmwareDialog::buildFile() {
    m_file->acceptDropsOn(this);
    m_file->setJudge([](const FileCheck &file) {
        return FirmwareHeader::parse(file.head).kind == FirmwareHeader::Kind::Broken
                   ? tr("The first line of this image is damaged; every device would refuse it.")
                   : QString();
    });
    addPart(m_file);
    connect(m_file, &PathField::changed, this, &UploadFirmwareDialog::onFileChanged);
}

void UploadFirmwareDialog::buildDevices() {
    m_table->setObjectName(QStringLiteral("modelTable"));
    m_table->setAccessibleName(tr("Models of the devices"));
    m_shown.resize(m_all->size());
    std::iota(m_shown.begin(), m_shown.end(), 0);
    m_isUnticked.resize(m_all->size());
    m_table->showList(m_groups, {160, 90, 130}, -1);
    addPart(m_table);
    m_empty = label(tr("The last upload failed on none of the devices."), "quiet");
    m_empty->setObjectName(QStringLiteral("noDevicesLabel"));
    m_empty->hide();
    addPart(m_empty);
    addTargets(*m_all, OperationTargets::Need::Authorization);
    connect(m_groups, &ModelGroupModel::groupToggled, this, &UploadFirmwareDialog::onGroupToggled);
    fitTable();
}

void UploadFirmwareDialog::buildTimes() {
    m_onlyFailed->setObjectName(QStringLiteral("onlyFailedCheckBox"));
    m_onlyFailed->setEnabled(false);
    addPart(m_onlyFailed);
    m_scheduleWarning = addField(tr("When"), m_schedule, "scheduleWarningLabel");
    addPart(label(tr("Rollout"), "caption"));
    addPart(m_waves);
    connect(m_onlyFailed, &QCheckBox::toggled, this, &UploadFirmwareDialog::onOnlyFailedToggled);
    connect(m_schedule, &ScheduleField::changed, this, [this] {
        CredentialFields::tell(m_scheduleWarning, m_schedule->problem());
        showAction();
    });
    connect(m_waves, &RolloutFields::changed, this, &UploadFirmwareDialog::showAction);
}

void UploadFirmwareDialog::readStart() {
    NetJob::post(
        NetJob::createRunner("reading how earlier uploads went", NetTask::Turn::Beside), this,
        [all = m_all, tasks = CTaskInfoPool::instance().taskList()] {
            QSet<QString> ids;
            for (const OperationTarget &target : *all)
                ids.insert(target.device->id);
            const QSet<QString> failed = FirmwareHistory::lastFailed(*tasks, ids);
            std::vector<bool> hasFailed;
            for (const OperationTarget &target : *all)
                hasFailed.push_back(failed.contains(target.device->id));
            const CLocalStore &store = CLocalStore::instance();
            return std::make_shared<const Start>(Start{store.isFWUploadScheduleOn(),
                                                       store.isFwUploadOnlyApplyFail(), std::move(hasFailed),
                                                       ModelGroups::indexOf(*all)});
        },
        [this](std::shared_ptr<const Start> start) { onStartRead(std::move(start)); });
}

void UploadFirmwareDialog::onStartRead(std::shared_ptr<const Start> start) {
    m_start = std::move(start);
    showGroups();
    m_schedule->setScheduled(m_start->isScheduled || m_schedule->isScheduled());
    m_onlyFailed->setEnabled(true);
    m_onlyFailed->setChecked(m_start->onlyFailed);
}

void UploadFirmwareDialog::readUploadLimit() {
    ServiceRequest::post(
        NetJob::createRunner("reading the limit of uploads"), this,
        [](ServiceSession &session) {
            JSON settings;
            const unsigned result =
                session.call([&](CApiClient &client) { return client.loadServerSettings(settings); });
            if (result != ApiOk)
                qWarning("HTTP API(loadServerSettings) failed! (%u)", result);
            return result == ApiOk && settings.is_object() ? SettingValue::uploadLimit(settings) : 0;
        },
        [this](int limit) { setFootNote(limit > 0 ? tr("%1 at a time").arg(number(limit)) : QString()); });
}

void UploadFirmwareDialog::onFileChanged() {
    m_head = FirmwareHeader::parse(m_file->file().head);
    if (!m_file->isChecking())
        showImage();
    updateAccept();
}

/// Ticks what an earlier image has kept out, and leaves out what this one is not for.
void UploadFirmwareDialog::showImage() {
    m_groups->setImage(m_head, m_file->file().isGood());
    targets().setTicked(std::exchange(m_leftOut, {}), true);
    const std::vector<int> ticked = targets().ticked();
    for (const int each : misfits()) {
        if (std::binary_search(ticked.begin(), ticked.end(), each))
            m_leftOut.push_back(each);
    }
    showMisfits();
    targets().setTicked(m_leftOut, false);
}

std::vector<int> UploadFirmwareDialog::misfits() const {
    std::vector<int> found;
    for (std::size_t i = 0; i < m_groups->groups().size(); ++i) {
        const std::vector<int> &members = m_groups->groups()[i].targets;
        if (m_groups->fitOf(i) == FirmwareHeader::Fit::OtherModel)
            found.insert(found.end(), members.begin(), members.end());
    }
    std::sort(found.begin(), found.end());
    return found;
}

void UploadFirmwareDialog::showMisfits() {
    std::vector<int> found = misfits();
    if (found.empty())
        return setWarnings({});
    setWarnings({{[](int count) {
                      return tr("%n device(s) will fail: the image is for another model group.", nullptr,
                                count);
                  },
                  tr("Another model group"), std::move(found)}});
}

void UploadFirmwareDialog::onOnlyFailedToggled() {
    noteUnticked();
    m_shown.clear();
    for (std::size_t place = 0; place < m_all->size(); ++place) {
        if (!m_onlyFailed->isChecked() || m_start->hasFailed[place])
            m_shown.push_back(static_cast<int>(place));
    }
    showTargets();
}

/// What the user has left out of those that are shown; what the image has kept out does not count.
void UploadFirmwareDialog::noteUnticked() {
    for (const int place : m_shown)
        m_isUnticked[static_cast<std::size_t>(place)] = true;
    const std::vector<int> ticked = targets().ticked();
    for (const std::vector<int> *wanted : {&ticked, &std::as_const(m_leftOut)}) {
        for (const int each : *wanted)
            m_isUnticked[static_cast<std::size_t>(m_shown[static_cast<std::size_t>(each)])] = false;
    }
}

void UploadFirmwareDialog::showTargets() {
    OperationTargets::List shown;
    shown.reserve(m_shown.size());
    std::vector<int> unticked;
    for (std::size_t i = 0; i < m_shown.size(); ++i) {
        const auto place = static_cast<std::size_t>(m_shown[i]);
        shown.push_back((*m_all)[place]);
        if (m_isUnticked[place])
            unticked.push_back(static_cast<int>(i));
    }
    m_leftOut.clear();
    m_groups->setGroups({});
    replaceTargets(std::move(shown));
    targets().setTicked(unticked, false);
    showGroups();
}

void UploadFirmwareDialog::showGroups() {
    m_groups->setGroups(ModelGroups::of(m_start->models, m_shown));
    showImage();
    onTicked();
    fitTable();
}

/// As many rows as there are models, as long as the dialog fits the smallest window.
void UploadFirmwareDialog::fitTable() {
    const bool isEmpty = m_start && m_groups->rowCount() == 0;
    const int rows = std::clamp(m_groups->rowCount(), minRows, maxRows);
    m_table->setFixedHeight(m_table->horizontalHeader()->height() + rows * Theme::rowHeight + 2);
    m_table->setVisible(!isEmpty);
    m_empty->setVisible(isEmpty);
}

void UploadFirmwareDialog::onGroupToggled(int group, bool checked) {
    targets().setTicked(m_groups->groups()[static_cast<std::size_t>(group)].targets, checked);
}

void UploadFirmwareDialog::onTicked() {
    // While others are being put in their place, the groups are ahead of the targets or behind them.
    std::size_t grouped = 0;
    for (const ModelGroup &group : m_groups->groups())
        grouped += group.targets.size();
    if (grouped == targets().targets().size())
        m_groups->setTicked(targets().ticked());
    m_waves->setDeviceCount(targets().tickedCount());
    showAction();
}

bool UploadFirmwareDialog::isComplete() const {
    return m_file->file().isGood() && m_schedule->problem().isEmpty();
}

void UploadFirmwareDialog::showAction() {
    const int count = targets().tickedCount();
    const int first = m_waves->firstCount();
    const bool isScheduled = m_schedule->isScheduled();
    if (m_waves->isInWaves())
        acceptButton()->setText((isScheduled ? tr("Schedule for %1, then %2") : tr("Upload to %1, then %2"))
                                    .arg(number(first), number(count - first)));
    else
        acceptButton()->setText(
            (isScheduled ? tr("Schedule for %1") : tr("Upload to %1")).arg(number(count)));
    updateAccept();
}

/// A first wave is to meet every model, and devices that will fail as things stand tell nothing about the
/// image.
QStringList UploadFirmwareDialog::orderedIds() const {
    const OperationTargets::List &all = targets().targets();
    std::vector<bool> doubtful(all.size());
    for (const TargetWarning &warning :
         OperationTargets::warnings(all, OperationTargets::Need::Authorization)) {
        for (const int each : warning.targets)
            doubtful[static_cast<std::size_t>(each)] = true;
    }
    for (const int each : misfits())
        doubtful[static_cast<std::size_t>(each)] = true;
    QStringList ids;
    for (const int each : ModelGroups::mixed(m_groups->groups(), targets().ticked(), doubtful))
        ids += all[static_cast<std::size_t>(each)].device->id;
    return ids;
}

void UploadFirmwareDialog::keepChoices() const {
    StoreWriter::post([isScheduled = m_schedule->isScheduled(), onlyFailed = m_onlyFailed->isChecked()] {
        CLocalStore::instance().setFWUploadScheduleOn(isScheduled);
        CLocalStore::instance().setFwUploadOnlyApplyFail(onlyFailed);
    });
}

void UploadFirmwareDialog::startUpload() {
    const qint64 time = m_schedule->time();
    const QString actionTime = time > 0 ? QString::number(time) : QString();
    if (!m_waves->isInWaves())
        return Queueing::post<UploadTaskMgr>(
            this,
            [file = m_file->file(), ids = targets().tickedIds(), actionTime](UploadTaskMgr &) {
                return FirmwareUpload::insert(file, TaskTargets::ids(ids), FirmwareUpload::newId(),
                                              actionTime);
            },
            [this] { setComplaint(tr("The upload could not be started.")); });
    RolloutMgr::instance().start({m_file->file(), FirmwareUpload::newId(), actionTime, orderedIds(),
                                  m_waves->firstCount(), m_waves->waitMinutes(),
                                  m_waves->maxFailedPercent()});
    accept();
}

void UploadFirmwareDialog::apply() {
    // It may have passed since it was chosen.
    if (!CredentialFields::tell(m_scheduleWarning, m_schedule->problem()))
        return m_schedule->setFocus();
    keepChoices();
    startUpload();
}

namespace {

QDialog *openUploadFirmware(OperationContext &context, OperationRequest request) {
    return new UploadFirmwareDialog(std::move(request.targets), context.dialogParent());
}

} // namespace

const Operation Operations::uploadFirmware{.objectName = "uploadFirmwareAction",
                                           .text = QT_TRANSLATE_NOOP("Operation", "Upload Firmware"),
                                           .group = Operation::Group::UploadMenu,
                                           .needs = Operation::Needs::Selection,
                                           .taskTypes = {"deviceFWUpgrade"},
                                           .helpPage = "firmware.html",
                                           .open = openUploadFirmware};
