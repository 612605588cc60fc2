#include "tasks/panels/alarmpanel.h"

#include "store/localstore.h"
#include "tasks/notify/notifier.h"
#include "tasks/panels/alarmdelegate.h"
#include "tasks/panels/alarmmodel.h"
#include "tasks/panels/listactions.h"
#include "tasks/panels/panelpage.h"
#include "tasks/panels/tasktexts.h"
#include "tasks/service/taskinfopool.h"
#include "widgets/dialogs/confirmdialog.h"
#include "widgets/dialogs/transientmessage.h"

#include <QAction>
#include <QClipboard>
#include <QGuiApplication>
#include <QHBoxLayout>
#include <QLabel>
#include <QListView>
#include <QScrollBar>
#include <QTime>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>

AlarmPanel::AlarmPanel(QWidget *parent)
    : QWidget(parent),
      m_model(new AlarmModel(m_history, this)),
      m_actions(new ListActions(this)),
      m_page(new PanelPage(this)),
      m_list(new QListView(m_page)),
      m_stale(new QLabel(this)),
      m_copy(new QAction(tr("Copy"), this)),
      m_delete(new QAction(tr("Delete"), this)) {
    setObjectName(QStringLiteral("alarmPanel"));
    m_copy->setObjectName(QStringLiteral("copyAlarmAction"));
    m_copy->setShortcut(QKeySequence::Copy);
    m_copy->setShortcutContext(Qt::WidgetShortcut);
    m_delete->setObjectName(QStringLiteral("deleteAlarmAction"));
    m_delete->setShortcut(QKeySequence::Delete);
    m_delete->setShortcutContext(Qt::WidgetShortcut);
    m_stale->setObjectName(QStringLiteral("alarmStaleLabel"));
    m_stale->setProperty("role", QStringLiteral("warning"));
    m_stale->hide();
    buildList();
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(buildHeader());
    layout->addWidget(m_page, 1);
    connectParts();
    showPage();
    showActions();
}

AlarmPanel::~AlarmPanel() = default;

QWidget *AlarmPanel::buildHeader() {
    auto *header = new QWidget(this);
    auto *layout = new QHBoxLayout(header);
    layout->setContentsMargins(12, 10, 12, 10);
    layout->setSpacing(6);
    auto *remove = new QToolButton(header);
    remove->setObjectName(QStringLiteral("deleteAlarmButton"));
    remove->setDefaultAction(m_delete);
    m_deleteAll = new QToolButton(header);
    m_deleteAll->setObjectName(QStringLiteral("deleteAllAlarmsButton"));
    m_deleteAll->setText(tr("Delete all"));
    layout->addWidget(m_stale, 1);
    layout->addStretch();
    for (QToolButton *button : {remove, m_deleteAll}) {
        button->setProperty("role", QStringLiteral("panel"));
        button->setFocusPolicy(Qt::TabFocus);
        layout->addWidget(button);
    }
    return header;
}

void AlarmPanel::buildList() {
    m_list->setObjectName(QStringLiteral("alarmList"));
    m_list->setAccessibleName(tr("Alarms"));
    m_list->setModel(m_model);
    m_list->setItemDelegate(new AlarmDelegate(m_list));
    m_list->setUniformItemSizes(true);
    m_list->setSelectionMode(QAbstractItemView::ExtendedSelection);
    m_list->setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    m_list->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_list->verticalScrollBar()->setSingleStep(18);
    m_list->setMouseTracking(true);
    m_list->setContextMenuPolicy(Qt::ActionsContextMenu);
    m_list->addActions({m_copy, m_delete});
    m_page->setView(m_list);
}

void AlarmPanel::connectParts() {
    CTaskInfoPool *pool = &CTaskInfoPool::instance();
    connect(pool, &CTaskInfoPool::alarmListUpdated, this, &AlarmPanel::onAlarmListUpdated);
    connect(pool, &CTaskInfoPool::alarmListFailed, this, &AlarmPanel::onAlarmListFailed);
    connect(pool, &CTaskInfoPool::cleared, this, &AlarmPanel::onCleared);
    connect(m_list, &QListView::activated, this, &AlarmPanel::onChosen);
    connect(m_list->selectionModel(), &QItemSelectionModel::selectionChanged, this, &AlarmPanel::showActions);
    connect(m_copy, &QAction::triggered, this, &AlarmPanel::copySelected);
    connect(m_delete, &QAction::triggered, this, &AlarmPanel::deleteSelected);
    connect(m_deleteAll, &QToolButton::clicked, this, &AlarmPanel::deleteAll);
    connect(m_actions, &ListActions::busyChanged, this, &AlarmPanel::showActions);
    connect(m_actions, &ListActions::failed, this, [this](const QString &message) {
        TransientMessage::show(this, message, TransientMessage::Kind::Error);
    });
}

void AlarmPanel::onAlarmListUpdated() {
    m_stale->hide();
    openHistory();
    const AlarmListPtr alarms = CTaskInfoPool::instance().alarmInfo();
    for (const QString &message : m_announcer.follow(*alarms))
        Notifier::instance().ShowMessage(message, Notifier::Alarm);
    m_history.keepOnly(*alarms);
    const int scrolled = m_list->verticalScrollBar()->value();
    const int rows = m_model->rowCount();
    m_model->setAlarms(*alarms);
    // Below the upper end one is reading: what comes in above must not push that away.
    if (scrolled > 0)
        m_list->verticalScrollBar()->setValue(scrolled +
                                              (m_model->rowCount() - rows) * AlarmDelegate::rowHeight);
    if (isVisible())
        markSeen();
    tellUnread();
    showPage();
    showActions();
}

void AlarmPanel::onAlarmListFailed() {
    if (m_stale->isHidden())
        m_stale->setText(
            tr("Not read since %1").arg(QTime::currentTime().toString(QStringLiteral("hh:mm:ss"))));
    m_stale->show();
    showPage();
}

void AlarmPanel::onCleared() {
    m_announcer.reset();
    m_historyOpen = false;
    m_stale->hide();
    m_model->setAlarms({});
    emit alarmUnreadCountUpdated(0);
    showPage();
    showActions();
}

void AlarmPanel::openHistory() {
    if (std::exchange(m_historyOpen, true))
        return;
    const LoginInfo login = CLocalStore::instance().loginInfo();
    m_history.open(QStringLiteral("%1:%2").arg(login.address).arg(login.port));
}

void AlarmPanel::showEvent(QShowEvent *event) {
    QWidget::showEvent(event);
    markSeen();
    tellUnread();
}

void AlarmPanel::hideEvent(QHideEvent *event) {
    QWidget::hideEvent(event);
    m_model->clearMarks();
}

void AlarmPanel::markSeen() {
    if (!m_historyOpen)
        return;
    m_model->keepMarks();
    m_history.markAllRead(m_model->alarms());
}

void AlarmPanel::tellUnread() {
    if (m_historyOpen)
        emit alarmUnreadCountUpdated(
            m_history.unreadCount(m_model->alarms(), CTaskInfoPool::instance().alarmTotal()));
}

void AlarmPanel::onChosen(const QModelIndex &index) {
    const AlarmRecord &alarm = m_model->alarmOf(index);
    if (!alarm.deviceId.isEmpty() || !alarm.deviceIp.isEmpty())
        emit deviceChosen(alarm.deviceId, alarm.deviceIp);
}

void AlarmPanel::showPage() {
    if (m_model->rowCount() > 0)
        m_page->showView();
    else if (CTaskInfoPool::instance().isAlarmListLoaded())
        m_page->showText(tr("No alarms."));
    else
        m_page->showText(m_stale->isHidden() ? tr("Loading alarms...")
                                             : tr("The alarm list could not be read."));
}

void AlarmPanel::showActions() {
    const bool idle = !m_actions->isBusy();
    const bool selected = m_list->selectionModel()->hasSelection();
    m_copy->setEnabled(selected);
    m_delete->setEnabled(idle && selected);
    m_deleteAll->setEnabled(idle && m_model->rowCount() > 0);
}

void AlarmPanel::copySelected() {
    QModelIndexList selected = m_list->selectionModel()->selectedIndexes();
    std::sort(selected.begin(), selected.end());
    QStringList lines;
    for (const QModelIndex &index : selected) {
        const AlarmRecord &alarm = m_model->alarmOf(index);
        lines += QStringList{TaskTexts::zonedTime(alarm.createdAt), alarm.text(), alarm.deviceIp}.join(
            QLatin1Char('\t'));
    }
    QGuiApplication::clipboard()->setText(lines.join(QLatin1Char('\n')));
}

void AlarmPanel::deleteSelected() {
    QStringList alids;
    for (const QModelIndex &index : m_list->selectionModel()->selectedIndexes())
        alids += m_model->alarmOf(index).alid;
    m_actions->removeAlarms(alids);
}

void AlarmPanel::deleteAll() {
    auto *confirm = new ConfirmDialog(ConfirmDialog::Kind::DeleteAlarms, this,
                                      std::max(m_model->rowCount(), CTaskInfoPool::instance().alarmTotal()));
    confirm->setAttribute(Qt::WA_DeleteOnClose);
    connect(confirm, &QDialog::accepted, m_actions, &ListActions::removeAllAlarms);
    confirm->open();
}
