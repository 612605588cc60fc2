#include "devices/operations/firmware/schedulefield.h"

#include "widgets/controls/sectionclick.h"

#include <QDateTimeEdit>
#include <QHBoxLayout>
#include <QLabel>
#include <QRadioButton>
#include <QTimeZone>

namespace {

constexpr int secondsAhead = 3600;

QString offsetText(int seconds) {
    const int minutes = std::abs(seconds) / 60;
    QString text = QStringLiteral("UTC%1%2").arg(QLatin1Char(seconds < 0 ? '-' : '+')).arg(minutes / 60);
    if (minutes % 60 != 0)
        text += QStringLiteral(":%1").arg(minutes % 60, 2, 10, QLatin1Char('0'));
    return text;
}

} // namespace

ScheduleField::ScheduleField(QWidget *parent)
    : QWidget(parent),
      m_now(new QRadioButton(tr("Now"), this)),
      m_at(new QRadioButton(tr("At"), this)),
      m_time(new QDateTimeEdit(this)),
      m_zone(new QLabel(this)) {
    m_now->setObjectName(QStringLiteral("nowRadioButton"));
    m_now->setChecked(true);
    m_at->setObjectName(QStringLiteral("atRadioButton"));
    m_time->setObjectName(QStringLiteral("timeEdit"));
    m_time->setAccessibleName(tr("Time of the upload"));
    m_time->setDisplayFormat(QStringLiteral("yyyy/MM/dd hh:mm"));
    SectionClick::install(m_time);
    m_zone->setObjectName(QStringLiteral("zoneLabel"));
    m_zone->setProperty("role", "quiet");
    const QDateTime ahead = QDateTime::currentDateTime().addSecs(secondsAhead);
    m_time->setDateTime(QDateTime(ahead.date(), QTime(ahead.time().hour(), 0)).addSecs(secondsAhead));
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->addWidget(m_now);
    layout->addSpacing(12);
    layout->addWidget(m_at);
    layout->addWidget(m_time);
    layout->addWidget(m_zone, 1);
    connect(m_at, &QRadioButton::toggled, this, &ScheduleField::onChanged);
    connect(m_time, &QDateTimeEdit::dateTimeChanged, this, &ScheduleField::onChanged);
    onChanged();
}

bool ScheduleField::isScheduled() const {
    return m_at->isChecked();
}

void ScheduleField::setScheduled(bool scheduled) {
    (scheduled ? m_at : m_now)->setChecked(true);
}

void ScheduleField::setTime(const QDateTime &time) {
    m_time->setDateTime(time);
}

/// To the minute, which is what is shown.
QDateTime ScheduleField::chosen() const {
    const QTime time = m_time->time();
    return {m_time->date(), QTime(time.hour(), time.minute())};
}

qint64 ScheduleField::time() const {
    return isScheduled() ? chosen().toMSecsSinceEpoch() : 0;
}

QString ScheduleField::problem() const {
    if (!isScheduled())
        return {};
    const QDateTime time = chosen();
    // An hour that is left out when the clocks are put forward is moved by the time's own arithmetic.
    const QDateTime real = QDateTime::fromMSecsSinceEpoch(time.toMSecsSinceEpoch());
    if (!time.isValid() || real.date() != m_time->date() || real.time().hour() != m_time->time().hour())
        return tr("There is no such time on that day: the clocks are put forward.");
    if (time <= QDateTime::currentDateTime())
        return tr("This time has passed; choose a later one.");
    return {};
}

QString ScheduleField::zoneText(const QDateTime &time) {
    const QByteArray id = QTimeZone::systemTimeZoneId();
    const QString offset = offsetText(time.offsetFromUtc());
    // An empty place is what a computer without a zone of its own says.
    return id.isEmpty() || id == "UTC" ? offset
                                       : QStringLiteral("%1 (%2)").arg(QString::fromUtf8(id), offset);
}

void ScheduleField::onChanged() {
    m_time->setEnabled(isScheduled());
    m_zone->setText(zoneText(chosen()));
    emit changed();
}
