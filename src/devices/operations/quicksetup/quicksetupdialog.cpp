#include "devices/operations/quicksetup/quicksetupdialog.h"

#include "devices/operations/operations.h"
#include "devices/operations/queueing.h"
#include "devices/operations/quicksetup/timesyncfields.h"
#include "devices/operations/quicksetup/timezones.h"
#include "devices/operations/targetsummary.h"
#include "tasks/queue/exetaskmgr.h"
#include "tasks/service/tasktargets.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDateTime>
#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>
#include <QSignalBlocker>

#include <nlohmann/json.hpp>

namespace {

constexpr int dialogWidth = 540;
constexpr int tickWidth = 150;
constexpr int maxZoneLength = 64;

void select(QComboBox *choice, const QVariant &value) {
    if (const int place = choice->findData(value); place >= 0)
        choice->setCurrentIndex(place);
}

} // namespace

QuickSetupDialog::QuickSetupDialog(OperationTargets::List targets, QWidget *parent)
    : OperationDialog(tr("Quick Setup"), parent),
      m_timeFields(new TimeSyncFields(body())),
      m_daylightChoice(
          buildChoice("daylightComboBox", tr("Daylight saving"), {{tr("On"), true}, {tr("Off"), false}})),
      m_frequencyChoice(
          buildChoice("frequencyComboBox", tr("Mains frequency"), {{tr("50 Hz"), 50}, {tr("60 Hz"), 60}})),
      m_audioChoice(buildChoice("audioComboBox", tr("Audio"), {{tr("Mute"), true}, {tr("Unmute"), false}})) {
    setObjectName(QStringLiteral("QuickSetupDialog"));
    content()->setFixedWidth(dialogWidth);
    addPart(label(tr("Only the settings that are ticked change."), "quiet"));
    auto *fields = new QWidget(body());
    auto *grid = new QGridLayout(fields);
    grid->setContentsMargins(0, 4, 0, 4);
    grid->setHorizontalSpacing(12);
    grid->setVerticalSpacing(12);
    grid->setColumnMinimumWidth(0, tickWidth);
    grid->setColumnStretch(1, 1);
    m_zone = addSetting(grid, "zoneCheckBox", tr("Time zone"), buildZone());
    m_time = addSetting(grid, "timeCheckBox", tr("Date and time"), m_timeFields);
    m_daylight = addSetting(grid, "daylightCheckBox", tr("Daylight saving"), m_daylightChoice);
    m_frequency = addSetting(grid, "frequencyCheckBox", tr("Mains frequency"), m_frequencyChoice);
    m_audio = addSetting(grid, "audioCheckBox", tr("Audio"), m_audioChoice);
    addPart(fields);
    const DeviceRecordPtr only = targets.size() == 1 ? targets.front().device : nullptr;
    finish(std::move(targets), OperationTargets::Need::Authorization, tr("Apply"), "applyButton");
    if (only)
        propose(*only);
    connect(m_timeFields, &TimeSyncFields::edited, this, &QuickSetupDialog::showDoubts);
    connect(m_daylightChoice, &QComboBox::currentIndexChanged, this, &QuickSetupDialog::showDoubts);
    m_zone->setFocus();
}

QCheckBox *QuickSetupDialog::addSetting(QGridLayout *grid, const char *name, const QString &text,
                                        QWidget *field) {
    auto *tick = new QCheckBox(text, body());
    tick->setObjectName(QLatin1String(name));
    field->setEnabled(false);
    const int row = grid->rowCount();
    // Beside the first line of fields that have several.
    auto *line = new QWidget(body());
    line->setFixedHeight(m_audioChoice->sizeHint().height());
    auto *layout = new QHBoxLayout(line);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(tick);
    grid->addWidget(line, row, 0, Qt::AlignTop);
    grid->addWidget(field, row, 1);
    connect(tick, &QCheckBox::toggled, field, &QWidget::setEnabled);
    connect(tick, &QCheckBox::toggled, this, [this] {
        showDoubts();
        updateAccept();
    });
    return tick;
}

QWidget *QuickSetupDialog::buildZone() {
    auto *part = new QWidget(body());
    m_zoneChoice = new QComboBox(part);
    m_zoneChoice->setObjectName(QStringLiteral("zoneComboBox"));
    m_zoneChoice->setAccessibleName(tr("Time zone"));
    m_zoneChoice->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_zoneChoice->setPlaceholderText(tr("As written below"));
    for (const TimeZones::Zone &zone : TimeZones::all())
        m_zoneChoice->addItem(TimeZones::text(zone), QLatin1String(zone.posix));
    m_zoneEdit = new QLineEdit(part);
    m_zoneEdit->setObjectName(QStringLiteral("zoneEdit"));
    m_zoneEdit->setAccessibleName(tr("Time zone as POSIX writes it"));
    m_zoneEdit->setMaxLength(maxZoneLength);
    auto *layout = new QVBoxLayout(part);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->addWidget(m_zoneChoice);
    layout->addWidget(m_zoneEdit);
    connect(m_zoneChoice, &QComboBox::currentIndexChanged, this, &QuickSetupDialog::onZoneChosen);
    connect(m_zoneEdit, &QLineEdit::textChanged, this, &QuickSetupDialog::onZoneTyped);
    m_zoneChoice->setCurrentIndex(TimeZones::likeThisComputers());
    return part;
}

QComboBox *QuickSetupDialog::buildChoice(const char *name, const QString &caption,
                                         std::initializer_list<std::pair<QString, QVariant>> entries) {
    auto *choice = new QComboBox(body());
    choice->setObjectName(QLatin1String(name));
    choice->setAccessibleName(caption);
    for (const auto &[text, value] : entries)
        choice->addItem(text, value);
    return choice;
}

void QuickSetupDialog::onZoneChosen() {
    if (m_zoneChoice->currentIndex() >= 0)
        m_zoneEdit->setText(m_zoneChoice->currentData().toString());
}

void QuickSetupDialog::onZoneTyped() {
    const QSignalBlocker typed(m_zoneChoice);
    m_zoneChoice->setCurrentIndex(TimeZones::find(m_zoneEdit->text().trimmed()));
    showDoubts();
}

void QuickSetupDialog::propose(const DeviceRecord &device) {
    const JSON record = parseJson(device.json());
    if (const QString zone = stringMember(record, "d_timezone"); TimeZones::isPosix(zone))
        m_zoneEdit->setText(zone);
    m_timeFields->propose(record);
    if (const auto on = record.find("d_daylight"); on != record.end() && on->is_boolean())
        select(m_daylightChoice, on->get<bool>());
    select(m_frequencyChoice, device.text(DeviceColumn::PowerFrequency).toInt());
    if (const std::string_view audio = textMember(record, "d_audio"); audio == "mute" || audio == "unmute")
        select(m_audioChoice, audio == "mute");
}

/// Settings that hardly go together are told and not refused: devices may know better.
void QuickSetupDialog::showDoubts() {
    // The fields tell of their making before all of them are there.
    if (!m_audio)
        return;
    const bool doubtful = m_zone->isChecked() && m_daylight->isChecked() &&
                          m_daylightChoice->currentData().toBool() &&
                          TimeZones::isPosix(m_zoneEdit->text().trimmed()) &&
                          !TimeZones::hasDaylight(m_zoneEdit->text().trimmed());
    setComplaint(doubtful ? tr("This time zone has no daylight saving.") : QString());
}

bool QuickSetupDialog::isComplete() const {
    return m_zone->isChecked() || m_time->isChecked() || m_daylight->isChecked() ||
           m_frequency->isChecked() || m_audio->isChecked();
}

JSON QuickSetupDialog::settings(const QDateTime &now) const {
    JSON settings = JSON::object();
    const QString zone = m_zoneEdit->text().trimmed();
    if (m_zone->isChecked())
        settings["posixTz"] = zone.toStdString();
    if (m_time->isChecked()) {
        const bool saving = !m_daylight->isChecked() || m_daylightChoice->currentData().toBool();
        m_timeFields->addTo(settings,
                            m_zone->isChecked() ? TimeZones::clock(zone, now, saving) : now.toLocalTime());
    }
    if (m_daylight->isChecked())
        settings["daylightEnable"] = m_daylightChoice->currentData().toBool();
    if (m_frequency->isChecked())
        settings["powerfreq"] = m_frequencyChoice->currentData().toInt();
    if (m_audio->isChecked())
        settings["mute"] = m_audioChoice->currentData().toBool();
    return settings;
}

bool QuickSetupDialog::complain(const QString &problem) {
    setComplaint(problem);
    return !problem.isEmpty();
}

void QuickSetupDialog::apply() {
    if (m_zone->isChecked() && !TimeZones::isPosix(m_zoneEdit->text().trimmed())) {
        m_zoneEdit->setFocus();
        complain(tr("This is no time zone, as CET-1CEST,M3.5.0,M10.5.0/3 is one."));
        return;
    }
    if (m_time->isChecked() && complain(m_timeFields->complain()))
        return;
    Queueing::post<ExeTaskMgr>(
        this,
        [settings = settings(QDateTime::currentDateTimeUtc()), ids = targets().tickedIds()](
            ExeTaskMgr &queue) { return queue.insertNewQuickSetupTask(TaskTargets::ids(ids), settings); },
        [this] { setComplaint(tr("The setup could not be started.")); });
}

namespace {

QDialog *on_quickSettingButton_clicked(OperationContext &context, OperationRequest request) {
    return new QuickSetupDialog(std::move(request.targets), context.dialogParent());
}

} // namespace

const Operation Operations::quickSetup{.objectName = "quickSettingButton",
                                       .text = QT_TRANSLATE_NOOP("Operation", "Quick Setup"),
                                       .icon = "tool_quick_setup_line",
                                       .group = Operation::Group::ConfigurationButtons,
                                       .needs = Operation::Needs::Selection,
                                       .taskTypes = {"deviceQuickSetup"},
                                       .helpPage = "uploads.html",
                                       .open = on_quickSettingButton_clicked};
