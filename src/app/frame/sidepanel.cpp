#include "app/frame/sidepanel.h"

#include "tasks/panels/alarmpanel.h"
#include "tasks/panels/taskpanel.h"
#include "widgets/controls/badgebutton.h"
#include "widgets/style/icons.h"

#include <QHBoxLayout>
#include <QStackedWidget>
#include <QVBoxLayout>

namespace {
constexpr QSize iconSize{16, 16};
constexpr int headerHeight = 44;
constexpr int narrowest = 300;
} // namespace

SidePanel::SidePanel(QWidget *parent)
    : QFrame(parent),
      m_stack(new QStackedWidget(this)),
      m_alarms(new AlarmPanel(m_stack)),
      m_tasks(new TaskPanel(m_stack)) {
    setObjectName(QStringLiteral("sidePanel"));
    m_stack->setObjectName(QStringLiteral("sideStack"));
    m_stack->addWidget(m_alarms);
    m_stack->addWidget(m_tasks);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(buildHeader());
    layout->addWidget(m_stack, 1);
}

QWidget *SidePanel::buildHeader() {
    auto *header = new QFrame(this);
    header->setObjectName(QStringLiteral("sideHeader"));
    header->setFixedHeight(headerHeight);
    // The panels may need more, as their texts ask for in the language they are in.
    header->setMinimumWidth(narrowest);
    auto *layout = new QHBoxLayout(header);
    layout->setContentsMargins(8, 0, 6, 0);
    layout->setSpacing(4);
    m_alarmTab = addTab(header, "alarmTabButton", tr("Alarms"), Panel::Alarms);
    m_taskTab = addTab(header, "taskTabButton", tr("Tasks"), Panel::Tasks);
    layout->addStretch();
    auto *close = new QToolButton(header);
    close->setObjectName(QStringLiteral("closeSidePanelButton"));
    close->setAccessibleName(tr("Close"));
    close->setToolTip(tr("Close"));
    close->setIcon(Icons::icon(QStringLiteral(":/images/icon_general_close_line.svg"), iconSize));
    close->setFocusPolicy(Qt::TabFocus);
    connect(close, &QToolButton::clicked, this, &QWidget::hide);
    layout->addWidget(close);
    return header;
}

BadgeButton *SidePanel::addTab(QWidget *header, const char *name, const QString &text, Panel panel) {
    auto *tab = new BadgeButton(header);
    tab->setObjectName(QLatin1String(name));
    tab->setText(text);
    tab->setCheckable(true);
    tab->setFixedHeight(headerHeight);
    tab->setFocusPolicy(Qt::TabFocus);
    tab->setProperty("role", QStringLiteral("tab"));
    header->layout()->addWidget(tab);
    connect(tab, &QToolButton::clicked, this, [this, panel] { open(panel); });
    return tab;
}

void SidePanel::open(Panel panel) {
    m_stack->setCurrentIndex(static_cast<int>(panel));
    show();
    showTabs();
    emit changed();
}

SidePanel::Panel SidePanel::current() const {
    return static_cast<Panel>(m_stack->currentIndex());
}

void SidePanel::setUnreadCount(int count) {
    m_alarmTab->setBadge(count);
}

void SidePanel::showEvent(QShowEvent *event) {
    QFrame::showEvent(event);
    showTabs();
    emit changed();
}

void SidePanel::hideEvent(QHideEvent *event) {
    QFrame::hideEvent(event);
    emit changed();
}

void SidePanel::showTabs() {
    m_alarmTab->setChecked(current() == Panel::Alarms);
    m_taskTab->setChecked(current() == Panel::Tasks);
}
