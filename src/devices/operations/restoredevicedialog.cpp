#include "devices/operations/restoredevicedialog.h"

#include "devices/operations/deviceactions.h"
#include "devices/operations/operations.h"
#include "devices/operations/targetsummary.h"
#include "tasks/service/tasktype.h"

#include <QCheckBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

namespace {

struct Part {
    const char *name;
    const char *text;
};

constexpr Part parts[] = {
    {"networkCheckBox", QT_TRANSLATE_NOOP("RestoreDeviceDialog", "Network")},
    {"daylightCheckBox", QT_TRANSLATE_NOOP("RestoreDeviceDialog", "Daylight saving time")},
    {"languageCheckBox", QT_TRANSLATE_NOOP("RestoreDeviceDialog", "Custom language")},
    {"nadpCheckBox", QT_TRANSLATE_NOOP("RestoreDeviceDialog", "NADP")},
    {"focusCheckBox", QT_TRANSLATE_NOOP("RestoreDeviceDialog", "Focus position")},
    {"lensCheckBox", QT_TRANSLATE_NOOP("RestoreDeviceDialog", "Lens configuration")},
};
constexpr std::size_t networkPart = 0;

} // namespace

RestoreDeviceDialog::RestoreDeviceDialog(OperationTargets::List targets, QWidget *parent)
    : OperationDialog(tr("Restore to Factory Default"), parent) {
    setObjectName(QStringLiteral("RestoreDeviceDialog"));
    auto *heading = label(tr("Restore all settings to factory default, including:"), "");
    heading->setWordWrap(true);
    addPart(heading);
    for (std::size_t i = 0; i < m_parts.size(); ++i) {
        m_parts[i] = new QCheckBox(tr(parts[i].text), body());
        m_parts[i]->setObjectName(QLatin1String(parts[i].name));
        addPart(m_parts[i]);
    }
    connect(m_parts[networkPart], &QCheckBox::toggled, this, &RestoreDeviceDialog::showRisk);
    buildCountField();
    finish(std::move(targets), OperationTargets::Need::Authorization, tr("Restore"), "restoreButton");
    acceptButton()->setProperty("role", "danger");
    m_parts[networkPart]->setFocus();
}

void RestoreDeviceDialog::buildCountField() {
    m_count = new QLineEdit(body());
    m_count->setObjectName(QStringLiteral("countEdit"));
    m_count->setMaxLength(7);
    m_countLabel = label({}, "caption");
    m_countLabel->setBuddy(m_count);
    m_countLabel->setWordWrap(true);
    addPart(m_countLabel);
    addPart(m_count);
    connect(m_count, &QLineEdit::textChanged, this, &RestoreDeviceDialog::updateAccept);
}

QStringList RestoreDeviceDialog::deviceIds() const {
    return targets().tickedIds();
}

void RestoreDeviceDialog::showRisk() {
    setComplaint(
        m_parts[networkPart]->isChecked()
            ? tr("Devices whose network settings are restored may get another address and be cut off "
                 "from the server.")
            : QString());
}

bool RestoreDeviceDialog::isComplete() const {
    const int count = targets().tickedCount();
    const QString question =
        tr("The settings of %n device(s) will be lost. Type %n to go on.", nullptr, count);
    m_countLabel->setText(question);
    m_count->setAccessibleName(question);
    return m_count->text().trimmed() == QString::number(count);
}

void RestoreDeviceDialog::apply() {
    std::array<int, 6> values{};
    for (std::size_t i = 0; i < values.size(); ++i)
        values[i] = m_parts[i]->isChecked() ? -1 : 1;
    emit restoreDevice(values[0], values[1], values[2], values[3], values[4], values[5]);
    accept();
}

namespace {

DeviceOperations::Outcome restoreSettings(const DeviceOperations::DeviceTask &task,
                                          const DeviceOperations::RestoreOptions &options) {
    qDebug("restore device: device id count[%d], dump[%s], net[%d], dst[%d], lang[%d], nadp[%d], focus[%d], "
           "len[%d]",
           static_cast<int>(task.deviceIds.size()), DeviceOperations::dumpIds(task.deviceIds).constData(),
           options.network, options.daylightSaving, options.language, options.nadp, options.focus,
           options.lens);
    return DeviceOperations::runCommand(task, DeviceOperations::restoreCommand(options));
}

void onRestoreDevice(DeviceActions *actions, const QStringList &ids,
                     const DeviceOperations::RestoreOptions &options) {
    const auto &[network, daylightSaving, language, nadp, focus, lens] = options;
    qDebug("onRestoreDevice: network: %d, daylight: %d, lan: %d, nadp: %d, focus: %d, lens: %d", network,
           daylightSaving, language, nadp, focus, lens);
    actions->start({TaskType::restore, ids, [options](const DeviceOperations::DeviceTask &task) {
                        return restoreSettings(task, options);
                    }});
}

QDialog *openFactoryDefault(OperationContext &context, OperationRequest request) {
    auto *dialog = new RestoreDeviceDialog(std::move(request.targets), context.dialogParent());
    QObject::connect(
        dialog, &RestoreDeviceDialog::restoreDevice, context.actions(),
        [actions = context.actions(), dialog](int net, int dst, int lang, int nadp, int focus, int lens) {
            onRestoreDevice(actions, dialog->deviceIds(), {net, dst, lang, nadp, focus, lens});
        });
    return dialog;
}

} // namespace

const Operation Operations::factoryDefault{.objectName = "factoryDefaultAction",
                                           .text =
                                               QT_TRANSLATE_NOOP("Operation", "Restore to Factory Default"),
                                           .group = Operation::Group::RestoreMenu,
                                           .needs = Operation::Needs::Selection,
                                           .taskTypes = {"deviceRestore"},
                                           .helpPage = "restarting.html",
                                           .open = openFactoryDefault};
