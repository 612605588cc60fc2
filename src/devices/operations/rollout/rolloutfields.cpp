#include "devices/operations/rollout/rolloutfields.h"

#include "widgets/controls/flowlayout.h"

#include <QCheckBox>
#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QSpinBox>

#include <algorithm>

namespace {

enum Unit { DevicesUnit, PercentUnit };

constexpr int maxDevices = 50000;
constexpr int maxWait = 7 * 24 * 60;
constexpr int defaultFirst = 5;
constexpr int defaultWait = 30;
constexpr int defaultFailed = 10;

} // namespace

RolloutFields::RolloutFields(QWidget *parent)
    : QWidget(parent), m_inWaves(new QCheckBox(tr("In waves:"), this)), m_details(new QWidget(this)) {
    m_inWaves->setObjectName(QStringLiteral("inWavesCheckBox"));
    m_first = addSpinBox("firstSpinBox", tr("Size of the first wave"), 1, maxDevices, defaultFirst);
    m_unit = new QComboBox(m_details);
    m_unit->setObjectName(QStringLiteral("firstUnitComboBox"));
    m_unit->setAccessibleName(tr("What the first wave is counted in"));
    m_unit->addItems({tr("devices"), tr("%")});
    m_wait = addSpinBox("waitSpinBox", tr("Minutes between the waves"), 0, maxWait, defaultWait);
    m_failed = addSpinBox("failedSpinBox", tr("Most failed devices in percent"), 0, 100, defaultFailed);
    m_wait->setSuffix(tr(" min"));
    m_failed->setSuffix(tr(" %"));
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    // Beside the first line of what may be two.
    m_inWaves->setMinimumHeight(m_first->sizeHint().height());
    layout->addWidget(m_inWaves, 0, Qt::AlignTop);
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
    const auto word = [this](const QString &text) { return new QLabel(text, m_details); };
    auto *layout = new FlowLayout(m_details);
    layout->setSpacing(6);
    for (const std::initializer_list<QWidget *> &clause :
         {std::initializer_list<QWidget *>{word(tr("first")), m_first, m_unit},
          {word(tr("wait")), m_wait},
          {word(tr("go on if at most")), m_failed, word(tr("failed"))}}) {
        auto *line = new QHBoxLayout;
        line->setSpacing(6);
        for (QWidget *part : clause)
            line->addWidget(part);
        layout->addLayout(line);
    }
    return m_details;
}

void RolloutFields::onUnitChanged() {
    m_first->setMaximum(m_unit->currentIndex() == PercentUnit ? 99 : maxDevices);
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

int RolloutFields::maxFailedPercent() const {
    return m_failed->value();
}
