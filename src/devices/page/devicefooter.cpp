#include "devices/page/devicefooter.h"

#include "widgets/controls/elidedlabel.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QLocale>
#include <QStyle>
#include <QToolButton>

#include <algorithm>

namespace {

/// Two polls were missed: what is shown may be wrong by now.
constexpr qint64 staleMs = 9000;

template <typename Label>
QLabel *quietLabel(const char *name) {
    auto *label = new Label;
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
      m_selection(quietLabel<ElidedLabel>("selectionLabel")),
      // How old the data is stays readable whatever else gives way.
      m_age(quietLabel<QLabel>("dataAgeLabel")) {
    setObjectName(QStringLiteral("deviceFooter"));
    setFixedHeight(34);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(4);
    layout->addWidget(m_selection);
    addChip(DeviceStatusGroup::Authorized, "authorizedChip");
    addChip(DeviceStatusGroup::Unreachable, "unreachableChip");
    addChip(DeviceStatusGroup::Attention, "attentionChip");
    layout->addStretch();
    layout->addWidget(m_age);
    m_everySecond.setInterval(1000);
    connect(&m_everySecond, &QTimer::timeout, this, &DeviceFooter::showAge);
}

void DeviceFooter::addChip(DeviceStatusGroup group, const char *name) {
    auto *chip = new QToolButton(this);
    chip->setObjectName(QLatin1String(name));
    chip->setProperty("role", QStringLiteral("filter"));
    chip->setCheckable(true);
    chip->setFocusPolicy(Qt::TabFocus);
    chip->setToolTip(tr("Show only these"));
    layout()->addWidget(chip);
    m_chips[static_cast<std::size_t>(group)] = chip;
    connect(chip, &QToolButton::clicked, this, [this, chip, group](bool pressed) {
        for (QToolButton *each : m_chips)
            each->setChecked(each == chip && pressed);
        emit statusFilterChanged(pressed ? std::optional(group) : std::nullopt);
    });
}

void DeviceFooter::clearStatusFilter() {
    for (QToolButton *chip : m_chips)
        chip->setChecked(false);
    emit statusFilterChanged(std::nullopt);
}

void DeviceFooter::setSelection(int selected, int shown, int all) {
    const QLocale locale;
    if (shown == all)
        m_selection->setText(
            tr("%1 of %Ln device(s) selected", nullptr, shown).arg(locale.toString(selected)));
    else
        m_selection->setText(tr("%1 of %2 shown selected, %Ln device(s) in all", nullptr, all)
                                 .arg(locale.toString(selected), locale.toString(shown)));
}

void DeviceFooter::setStatuses(const DeviceInventory &inventory, const std::vector<int> &devices) {
    std::array<int, deviceStatusGroupCount> counts{};
    for (const int device : devices)
        ++counts[static_cast<std::size_t>(DeviceStatus::groupOf(inventory.status(device)))];
    const std::array<QString, deviceStatusGroupCount> texts{tr("%1 authorized"), tr("%1 unreachable"),
                                                            tr("%1 need attention")};
    for (std::size_t i = 0; i < m_chips.size(); ++i)
        m_chips[i]->setText(texts[i].arg(QLocale().toString(counts[i])));
}

void DeviceFooter::markUpdated() {
    m_updated.start();
    m_everySecond.start();
    showAge();
}

void DeviceFooter::clear() {
    m_everySecond.stop();
    m_updated.invalidate();
    for (QLabel *label : {m_selection, m_age})
        label->clear();
    for (QToolButton *chip : m_chips)
        chip->setChecked(false);
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
