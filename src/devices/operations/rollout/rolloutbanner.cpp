#include "devices/operations/rollout/rolloutbanner.h"

#include "devices/operations/rollout/rolloutbannerrow.h"
#include "devices/operations/rollout/rolloutmgr.h"
#include "widgets/dialogs/transientmessage.h"

#include <QVBoxLayout>

#include <algorithm>

namespace {
/// Often enough for a text that counts minutes.
constexpr int refreshMs = 5000;
} // namespace

RolloutBanner::RolloutBanner(QWidget *parent) : QFrame(parent), m_layout(new QVBoxLayout(this)) {
    setObjectName(QStringLiteral("rolloutStrip"));
    m_layout->setContentsMargins(0, 0, 0, 0);
    m_layout->setSpacing(0);
    m_timer.setInterval(refreshMs);
    connect(&m_timer, &QTimer::timeout, this, &RolloutBanner::showTexts);
    connect(&RolloutMgr::instance(), &RolloutMgr::changed, this, &RolloutBanner::onChanged);
    connect(&RolloutMgr::instance(), &RolloutMgr::dropped, this, [this](const QString &message) {
        TransientMessage::show(this, message, TransientMessage::Kind::Error);
    });
    onChanged();
}

void RolloutBanner::onChanged() {
    const std::vector<Rollout *> rollouts = RolloutMgr::instance().rollouts();
    const bool isSame = std::equal(
        rollouts.begin(), rollouts.end(), m_rows.begin(), m_rows.end(),
        [](const Rollout *rollout, const RolloutBannerRow *row) { return rollout == row->rollout(); });
    if (!isSame)
        showRows();
    showTexts();
}

void RolloutBanner::showRows() {
    for (RolloutBannerRow *row : m_rows) {
        // The button that was clicked is in one of them.
        row->hide();
        row->deleteLater();
    }
    m_rows.clear();
    for (Rollout *rollout : RolloutMgr::instance().rollouts()) {
        m_rows.push_back(new RolloutBannerRow(rollout, this));
        m_layout->addWidget(m_rows.back());
    }
    setVisible(!m_rows.empty());
    m_rows.empty() ? m_timer.stop() : m_timer.start();
}

void RolloutBanner::showTexts() {
    for (RolloutBannerRow *row : m_rows)
        row->showStanding();
}
