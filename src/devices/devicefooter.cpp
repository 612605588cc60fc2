#include "devicefooter.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QLocale>
#include <QStyle>

#include <algorithm>

namespace {

/// Two polls were missed: what is shown may be wrong by now.
constexpr qint64 staleMs = 9000;

QLabel *quietLabel(const char *name) {
    auto *label = new QLabel;
    label->setObjectName(QLatin1String(name));
    label->setTextFormat(Qt::PlainText);
    label->setProperty("role", QStringLiteral("quiet"));
    return label;
}

void setRole(QLabel *label, const QString &role) {
    if (label->property("role").toString() == role)
        return;
    label->setProperty("role", role);
    label->style()->unpolish(label);
    label->style()->polish(label);
}

} // namespace

DeviceFooter::DeviceFooter(QWidget *parent)
    : QFrame(parent),
      m_selection(quietLabel("selectionLabel")),
      m_statuses(quietLabel("statusSummaryLabel")),
      m_age(quietLabel("dataAgeLabel")) {
    setObjectName(QStringLiteral("deviceFooter"));
    setFixedHeight(34);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(16);
    layout->addWidget(m_selection);
    layout->addWidget(m_statuses);
    layout->addStretch();
    layout->addWidget(m_age);
    m_everySecond.setInterval(1000);
    connect(&m_everySecond, &QTimer::timeout, this, &DeviceFooter::showAge);
}

void DeviceFooter::setSelection(int selected, int shown) {
    const QLocale locale;
    m_selection->setText(tr("%1 of %n device(s) selected", nullptr, shown).arg(locale.toString(selected)));
}

void DeviceFooter::setStatuses(const DeviceInventory &inventory, const std::vector<int> &shown) {
    int authorized = 0;
    int unreachable = 0;
    int attention = 0;
    for (const int device : shown) {
        const DeviceStatusCode status = inventory.status(device);
        if (status == DeviceStatusCode::Authorized || status == DeviceStatusCode::Maintaining)
            ++authorized;
        else if (status == DeviceStatusCode::Unreachable)
            ++unreachable;
        else
            ++attention;
    }
    const QLocale locale;
    m_statuses->setText(
        tr("%1 authorized   %2 unreachable   %3 need attention")
            .arg(locale.toString(authorized), locale.toString(unreachable), locale.toString(attention)));
}

void DeviceFooter::markUpdated() {
    m_updated.start();
    m_everySecond.start();
    showAge();
}

void DeviceFooter::clear() {
    m_everySecond.stop();
    m_updated.invalidate();
    for (QLabel *label : {m_selection, m_statuses, m_age})
        label->clear();
}

void DeviceFooter::showAge() {
    const qint64 ms = m_updated.elapsed();
    const int seconds = static_cast<int>(ms / 1000);
    const bool stale = ms > staleMs;
    setRole(m_age, stale ? QStringLiteral("warning") : QStringLiteral("quiet"));
    const QString age = seconds < 120 ? tr("%n s", nullptr, seconds) : tr("%n min", nullptr, seconds / 60);
    m_age->setText(stale         ? tr("Not updated for %1").arg(age)
                   : seconds < 1 ? tr("Updated just now")
                                 : tr("Updated %1 ago").arg(age));
}
