#include "devices/operations/rollout/rolloutbannerrow.h"

#include "devices/operations/rollout/rolloutmgr.h"
#include "devices/operations/rollout/rollouttexts.h"
#include "widgets/style/icons.h"
#include "widgets/style/plaintext.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QToolButton>

namespace {

constexpr QSize iconSize{16, 16};
constexpr int maxNameWidth = 260;

QString iconOf(Rollout::State state) {
    switch (state) {
    case Rollout::State::Stopped:
        return QStringLiteral(":/images/icon_general_warning_solid.svg");
    case Rollout::State::Done:
        return QStringLiteral(":/images/icon_general_success_solid_green.svg");
    default:
        return QStringLiteral(":/images/tool_upload_line.svg");
    }
}

QLabel *makeLabel(const char *name, const char *role, QWidget *parent) {
    auto *label = new QLabel(parent);
    label->setObjectName(QLatin1String(name));
    label->setTextFormat(Qt::PlainText);
    label->setProperty("role", role);
    return label;
}

} // namespace

RolloutBannerRow::RolloutBannerRow(Rollout *rollout, QWidget *parent)
    : QWidget(parent),
      m_rollout(rollout),
      m_icon(new QLabel(this)),
      m_name(makeLabel("rolloutNameLabel", "title", this)),
      m_standing(makeLabel("rolloutStandingLabel", "", this)),
      m_goOn(addButton("continueRolloutButton", tr("Continue"))),
      m_stop(addButton("stopRolloutButton", tr("Stop"))),
      m_dismiss(addButton("dismissRolloutButton", tr("Dismiss"))) {
    const QString name = rollout->plan().image.name.simplified();
    m_name->setText(m_name->fontMetrics().elidedText(name, Qt::ElideMiddle, maxNameWidth));
    m_name->setToolTip(PlainText::toolTip(rollout->plan().image.path));
    m_standing->setWordWrap(true);
    m_goOn->setToolTip(tr("Begin with the other devices now"));
    m_stop->setToolTip(tr("Do not begin with the other devices; those at work go on"));
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(12, 6, 12, 6);
    layout->setSpacing(8);
    layout->addWidget(m_icon);
    layout->addWidget(m_name);
    layout->addWidget(m_standing, 1);
    for (QToolButton *button : {m_goOn, m_stop, m_dismiss})
        layout->addWidget(button);
    connect(m_goOn, &QToolButton::clicked, rollout, &Rollout::goOn);
    connect(m_stop, &QToolButton::clicked, rollout, &Rollout::stop);
    connect(m_dismiss, &QToolButton::clicked, this, [this] { RolloutMgr::instance().dismiss(m_rollout); });
    showStanding();
}

QToolButton *RolloutBannerRow::addButton(const char *name, const QString &text) {
    auto *button = new QToolButton(this);
    button->setObjectName(QLatin1String(name));
    button->setProperty("role", QStringLiteral("panel"));
    button->setText(text);
    button->setFocusPolicy(Qt::TabFocus);
    return button;
}

const Rollout *RolloutBannerRow::rollout() const {
    return m_rollout;
}

void RolloutBannerRow::showStanding() {
    if (!m_rollout)
        return;
    m_icon->setPixmap(Icons::pixmap(iconOf(m_rollout->state()), iconSize, devicePixelRatioF()));
    const QString standing = RolloutTexts::standing(*m_rollout);
    m_standing->setText(standing);
    for (QToolButton *button : {m_goOn, m_stop, m_dismiss})
        button->setAccessibleDescription(standing);
    m_goOn->setVisible(m_rollout->canGoOn());
    m_stop->setVisible(m_rollout->canStop());
    m_dismiss->setVisible(m_rollout->canBeDismissed());
}
