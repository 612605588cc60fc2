#include "rolloutfields.h"

#include <QCheckBox>
#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QSpinBox>

#include <algorithm>

namespace {

enum Unit { DevicesUnit, PercentUnit };

constexpr int mostDevices = 50000;
constexpr int longestWait = 7 * 24 * 60;
constexpr int usualFirst = 5;
constexpr int usualWait = 30;
constexpr int usualFailed = 10;

} // namespace

RolloutFields::RolloutFields(QWidget *parent)
    : QWidget(parent), m_inWaves(new QCheckBox(tr("In waves:"), this)), m_details(new QWidget(this)) {
    m_inWaves->setObjectName(QStringLiteral("inWavesCheckBox"));
    m_first = addSpinBox("firstSpinBox", tr("Size of the first wave"), 1, mostDevices, usualFirst);
    m_unit = new QComboBox(m_details);
    m_unit->setObjectName(QStringLiteral("firstUnitComboBox"));
    m_unit->setAccessibleName(tr("What the first wave is counted in"));
    m_unit->addItems({tr("devices"), tr("%")});
    m_wait = addSpinBox("waitSpinBox", tr("Minutes between the waves"), 0, longestWait, usualWait);
    m_failed = addSpinBox("failedSpinBox", tr("Most failed devices in percent"), 0, 100, usualFailed);
    m_wait->setSuffix(tr(" min"));
    m_failed->setSuffix(tr(" %"));
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->addWidget(m_inWaves);
    layout->addWidget(buildDetails(), 1);
    connect(m_unit, &QComboBox::currentIndexChanged, this, &RolloutFields::onUnitChanged);
    connect(m_inWaves, &QCheckBox::toggled, this, [this] {
        updateEnabled();
        emit changed();
    });
    connect(m_first, &QSpinBox::valueChanged, this, &RolloutFields::changed);
    updateEnabled();
}

QSpinBox *RolloutFields::addSpinBox(const char *name, const QString &accessibleName, int least, int most,
                                    int value) {
    auto *box = new QSpinBox(m_details);
    box->setObjectName(QLatin1String(name));
    box->setAccessibleName(accessibleName);
    box->setRange(least, most);
    box->setValue(value);
    return box;
}

QWidget *RolloutFields::buildDetails() {
    auto *layout = new QHBoxLayout(m_details);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(6);
    layout->addWidget(new QLabel(tr("first"), m_details));
    layout->addWidget(m_first);
    layout->addWidget(m_unit);
    layout->addWidget(new QLabel(tr("wait"), m_details));
    layout->addWidget(m_wait);
    layout->addWidget(new QLabel(tr("go on if at most"), m_details));
    layout->addWidget(m_failed);
    layout->addWidget(new QLabel(tr("failed"), m_details), 1);
    return m_details;
}

void RolloutFields::onUnitChanged() {
    m_first->setMaximum(m_unit->currentIndex() == PercentUnit ? 99 : mostDevices);
    emit changed();
}

void RolloutFields::setDeviceCount(int count) {
    m_deviceCount = count;
    updateEnabled();
}

void RolloutFields::updateEnabled() {
    m_inWaves->setEnabled(m_deviceCount > 1);
    m_details->setEnabled(isInWaves());
}

bool RolloutFields::isInWaves() const {
    return m_inWaves->isChecked() && m_deviceCount > 1;
}

int RolloutFields::firstCount() const {
    const int value = m_first->value();
    const int wanted = m_unit->currentIndex() == PercentUnit
                           ? static_cast<int>((qint64{m_deviceCount} * value + 99) / 100)
                           : value;
    return std::clamp(wanted, 1, std::max(m_deviceCount - 1, 1));
}

int RolloutFields::waitMinutes() const {
    return m_wait->value();
}

int RolloutFields::mostFailedPercent() const {
    return m_failed->value();
}
