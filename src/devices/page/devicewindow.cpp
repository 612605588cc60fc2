#include "devices/page/devicewindow.h"

#include "devices/inventory/devicelog.h"
#include "devices/inventory/devicemonitor.h"
#include "devices/inventory/inventoryupdater.h"
#include "devices/operations/deviceactions.h"
#include "devices/operations/operations.h"
#include "devices/operations/rollout/rolloutbanner.h"
#include "devices/page/devicefooter.h"
#include "devices/page/devicemenus.h"
#include "devices/page/devicesiteactions.h"
#include "devices/page/devicetabs.h"
#include "devices/page/devicetabscorner.h"
#include "devices/page/devicetoolbar.h"
#include "devices/page/mainconsoletable.h"
#include "devices/page/noticebar.h"
#include "devices/page/reconnectingdialog.h"
#include "devices/page/staterefresh.h"
#include "devices/sites/sitecommit.h"
#include "devices/sites/sitetree.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "tasks/service/taskinfopool.h"

#include <QDebug>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLineEdit>
#include <QShortcut>
#include <QSplitter>
#include <QTimer>
#include <QToolButton>
#include <QVBoxLayout>

#include <chrono>

using namespace std::chrono_literals;

namespace {

constexpr auto selectionLogDelay = 200ms;
constexpr int siteTreeWidth = 248;

} // namespace

DeviceWindow::DeviceWindow(QWidget *parent)
    : QWidget(parent),
      m_monitor(std::make_unique<DeviceMonitor>(m_inventory)),
      m_splitter(new QSplitter(this)),
      m_console(new QWidget(m_splitter)),
      m_siteTree(new SiteTree(m_splitter)),
      m_siteCommit(new SiteCommit(m_siteTree, this)),
      m_updater(new InventoryUpdater(
          m_inventory, [this] { return m_siteTree->edits().commitCount(); }, this)),
      m_actions(new DeviceActions(this)),
      m_placement(new DeviceSiteActions(m_actions, this)),
      m_refresh(new StateRefresh(m_inventory, this)),
      m_toolBar(new DeviceToolBar(m_console)),
      m_noticeBar(new NoticeBar(m_console)),
      m_tabs(new DeviceTabs(m_inventory, m_console)),
      m_footer(new DeviceFooter(m_console)),
      m_selectionLogDelay(new QTimer(this)) {
    qDebug("DeviceWindow constructor");
    setObjectName(QStringLiteral("DeviceWindow"));
    m_selectionLogDelay->setSingleShot(true);
    m_selectionLogDelay->setInterval(selectionLogDelay);
    buildLayout();
    connectParts();
    connectOperations();
    showStatusCounts();
    m_footer->clear();
}

DeviceWindow::~DeviceWindow() {
    qDebug("DeviceWindow destructor");
}

void DeviceWindow::buildLayout() {
    auto *consoleLayout = new QVBoxLayout(m_console);
    consoleLayout->setContentsMargins(14, 10, 14, 0);
    consoleLayout->setSpacing(8);
    consoleLayout->addWidget(m_toolBar);
    consoleLayout->addWidget(m_noticeBar);
    consoleLayout->addWidget(m_tabs, 1);
    consoleLayout->addWidget(new RolloutBanner(m_console));
    consoleLayout->addWidget(m_footer);

    m_splitter->setChildrenCollapsible(false);
    m_splitter->setHandleWidth(1);
    m_splitter->addWidget(m_siteTree);
    m_splitter->addWidget(m_console);
    m_splitter->setStretchFactor(1, 1);
    m_splitter->setSizes({siteTreeWidth, 1000});
    m_siteTree->setMinimumWidth(180);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_splitter);
}

void DeviceWindow::connectParts() {
    connect(m_monitor.get(), &DeviceMonitor::updateStatus, this, &DeviceWindow::onUpdateDeviceStatus);
    connect(m_monitor.get(), &DeviceMonitor::serverAnswered, this, &DeviceWindow::onServerAnswered);
    connect(m_monitor.get(), &DeviceMonitor::serverLost, this, &DeviceWindow::onServerLost);
    connect(m_monitor.get(), &DeviceMonitor::ticked, m_updater, &InventoryUpdater::reloadForTasks);
    connect(m_updater, &InventoryUpdater::read, this, &DeviceWindow::onReading);
    connect(m_updater, &InventoryUpdater::failed, this, &DeviceWindow::showContent);
    connect(m_updater, &InventoryUpdater::statesRead, this, &DeviceWindow::onUpdateDeviceStatus);
    connect(m_updater, &InventoryUpdater::statesSettled, this, [this] { m_monitor->forceRefresh(); });
    connect(&CTaskInfoPool::instance(), &CTaskInfoPool::taskListUpdated, this,
            &DeviceWindow::onTaskListUpdated);
    connect(m_refresh, &StateRefresh::statesRead, this, &DeviceWindow::onUpdateDeviceStatus);
    connect(m_refresh, &StateRefresh::failed, this, &DeviceWindow::showError);
    connect(m_refresh, &StateRefresh::ended, this, &DeviceWindow::onRefreshDone);
    connect(m_siteTree, &SiteTree::currentSiteChanged, this, &DeviceWindow::onSiteChanged);
    connect(m_siteTree, &SiteTree::sitesEdited, this, [this] {
        m_noticeBar->setVisible(m_siteTree->edits().isDirty());
        followSiteNames();
    });
    connect(m_siteTree, &SiteTree::editsDropped, this,
            [this](const QStringList &reasons) { showError(reasons.join(QLatin1Char('\n'))); });
    connect(m_siteTree, &SiteTree::editRefused, this, &DeviceWindow::showError);
    connect(m_siteTree, &SiteTree::dropRefused, this, &DeviceWindow::showError);
    connect(m_siteTree, &SiteTree::devicesDropped, this, &DeviceWindow::onDeviceDrop);
    connect(m_placement, &DeviceSiteActions::removalConfirmed, this, &DeviceWindow::removeDevices);
    connect(m_noticeBar, &NoticeBar::msgButtonClicked, this, &DeviceWindow::commitSites);
    connect(m_siteCommit, &SiteCommit::failed, this, &DeviceWindow::showError);
    connect(m_siteCommit, &SiteCommit::answered, this, &DeviceWindow::reload);
    connect(m_tabs, &DeviceTabs::currentChanged, this, &DeviceWindow::showStatusCounts);
    connect(m_tabs, &DeviceTabs::selectionChanged, this, &DeviceWindow::onSelectionChanged);
    connect(m_tabs, &DeviceTabs::deleteRequested, this, &DeviceWindow::askToRemove);
    connect(m_tabs, &DeviceTabs::addDeviceRequested, this,
            [this] { openOperation(Operations::addDevice, {}); });
    connect(m_tabs, &DeviceTabs::clearFilterRequested, this, &DeviceWindow::clearFilter);
    connect(m_tabs, &DeviceTabs::rowMenuRequested, this,
            [this](MainConsoleTable *table, const QPoint &position) {
                DeviceMenus::showRowMenu(m_toolBar, table, position);
            });
    connect(m_tabs->corner()->search(), &QLineEdit::textChanged, this, &DeviceWindow::applySearch);
    connect(m_footer, &DeviceFooter::statusFilterChanged, this, &DeviceWindow::applyStatusFilter);
    connect(m_selectionLogDelay, &QTimer::timeout, this,
            [this] { DeviceLog::selectionChanged(selectedDevices()); });
    connect(this, &DeviceWindow::onShowAnimatedMsgDlg, this, &DeviceWindow::showDefAnimateMsgDlg);
    connect(m_tabs->corner(), &DeviceTabsCorner::serverChosen, this, &DeviceWindow::remoteServerChosen);
    addShortcuts();
}

void DeviceWindow::connectOperations() {
    connect(m_toolBar, &DeviceToolBar::operationChosen, this, [this](const Operation &operation) {
        openOperation(operation, {targetsOf(selectedDevices()), {}});
    });
    connect(m_actions, &DeviceActions::failed, this, &DeviceWindow::showError);
    connect(m_actions, &DeviceActions::done, this, &DeviceWindow::showSuccess);
    connect(m_actions, &DeviceActions::working, this, &DeviceWindow::showProgress);
    connect(m_actions, &DeviceActions::devicesChanged, this, &DeviceWindow::reload);
    connect(m_actions, &DeviceActions::devicesDeleted, m_updater, &InventoryUpdater::readStatesSoon);
    connect(m_actions, &DeviceActions::statesChanged, this, [this] { m_monitor->forceRefresh(); });
    connect(m_actions, &DeviceActions::inputNeeded, this, &DeviceWindow::openAgain);
    connect(&UploadTaskMgr::instance(), &TaskQueue::dialogNeeded, this, &DeviceWindow::openAgain);
}

void DeviceWindow::addShortcuts() {
    const auto add = [this](const QKeySequence &keys, auto slot) {
        auto *shortcut = new QShortcut(keys, this);
        shortcut->setContext(Qt::WidgetWithChildrenShortcut);
        connect(shortcut, &QShortcut::activated, this, slot);
    };
    add(QKeySequence::Find, [this] {
        m_tabs->corner()->search()->setFocus();
        m_tabs->corner()->search()->selectAll();
    });
    add(Qt::Key_F5, [this] { m_toolBar->button(QStringLiteral("refreshButton"))->click(); });
}

void DeviceWindow::startWork() {
    m_tabs->corner()->loadServers();
    m_online = false;
    m_toolBar->setFulfilled(Operation::Needs::Session, true);
    m_siteTree->setFocus();
    reload();
    m_monitor->start();
}

void DeviceWindow::stopWork() {
    m_monitor->stop();
    m_toolBar->setFulfilled(Operation::Needs::Session, false);
    clearFilter();
    if (m_reconnecting)
        m_reconnecting->close();
    m_refresh->close();
    m_updater->stop();
    m_tasksRunning = false;
    m_online = false;
    m_inventory.replace(std::make_shared<DeviceSnapshot>(), {});
    m_siteTree->forgetSites();
    m_noticeBar->hide();
    m_tabs->refill();
    showStatusCounts();
    showContent();
    m_footer->clear();
}

void DeviceWindow::reload() {
    m_updater->reload();
}

void DeviceWindow::onTaskListUpdated() {
    const bool running = CTaskInfoPool::instance().hasRunningTask();
    if (std::exchange(m_tasksRunning, running) && !running)
        emit allTasksDone();
}

OperationTargets::List DeviceWindow::targetsOf(const std::vector<DeviceRecordPtr> &devices) const {
    return OperationTargets::of(devices, m_inventory, *CTaskInfoPool::instance().taskList());
}

void DeviceWindow::openOperation(const Operation &operation, OperationRequest request) {
    QDialog *dialog = operation.open(*this, std::move(request));
    if (!dialog)
        return;
    dialog->setProperty("helpPage", QString::fromLatin1(operation.helpPage));
    dialog->open();
}

void DeviceWindow::openAgain(const QString &taskType, const QStringList &deviceIds) {
    const Operation *operation = Operations::findByTask(taskType);
    OperationTargets::List targets = targetsOf(m_inventory.snapshot()->presentOf(deviceIds));
    if (!operation || targets.empty())
        return showError(tr("The devices are not managed any more."));
    openOperation(*operation, {std::move(targets), taskType});
}

void DeviceWindow::onDeviceDrop(const QString &siteId, const QStringList &deviceIds, Qt::DropAction action,
                                const QString &sourceSiteId) {
    m_placement->drop(siteId, deviceIds, action, sourceSiteId);
}

void DeviceWindow::askToRemove() {
    QStringList ids;
    for (const DeviceRecordPtr &device : selectedDevices())
        ids += device->id;
    m_placement->askToRemove(ids, m_siteTree->currentSite());
}

void DeviceWindow::removeDevices(bool fromOverview) {
    m_placement->remove(fromOverview);
}

std::vector<int> DeviceWindow::shownDevices() const {
    return m_tabs->currentTable()->shownDevices();
}

QHash<QString, QString> DeviceWindow::siteNames() const {
    QHash<QString, QString> names;
    for (const Sites::Site &site : m_siteTree->edits().merged())
        names.insert(site.id, site.name);
    return names;
}

void DeviceWindow::applySearch(const QString &text) {
    m_searchedSites = siteNames();
    m_tabs->setSearch(DeviceSearch(text, m_searchedSites));
    onFilterChanged();
}

/// A search may name sites, which come and go and are renamed while it stands.
void DeviceWindow::followSiteNames() {
    const QString text = m_tabs->corner()->search()->text();
    if (!text.isEmpty() && siteNames() != m_searchedSites)
        applySearch(text);
}

void DeviceWindow::applyStatusFilter(std::optional<DeviceStatusGroup> status) {
    m_tabs->setStatusFilter(status);
    onFilterChanged();
}

void DeviceWindow::clearFilter() {
    m_tabs->corner()->search()->clear();
    m_footer->clearStatusFilter();
}

void DeviceWindow::onFilterChanged() {
    showStatusCounts();
    showContent();
}

void DeviceWindow::onReading(const InventoryReader::Reading &reading) {
    qDebug("update site info");
    qDebug("update device info");
    if (reading.sites) {
        m_siteTree->setSites(*reading.sites);
        followSiteNames();
    }
    if (reading.devices) {
        const DeviceSnapshotPtr previous = m_inventory.snapshot();
        const bool isSame = reading.devices == previous && reading.codes == m_inventory.statuses();
        m_inventory.replace(reading.devices, reading.codes);
        if (!isSame)
            m_tabs->refill();
        DeviceLog::tablesFilled(reading.devices, previous);
        m_footer->markUpdated();
    }
    m_siteTree->setCounts(*m_inventory.snapshot());
    showStatusCounts();
    showContent();
}

void DeviceWindow::onUpdateDeviceStatus(const DeviceStatusUpdate &update) {
    m_footer->markUpdated();
    // A poll of an older reading says nothing of the present one.
    if (!m_inventory.apply(update))
        return;
    m_updater->reloadFor(update.difference);
    if (update.changes.empty())
        return;
    m_tabs->refreshStatus();
    showStatusCounts();
    // A status chip shows other devices with the states, also where the selection stays.
    showSelectionCount();
    showContent();
}

void DeviceWindow::onServerAnswered() {
    if (m_reconnecting && m_reconnecting->isVisible()) {
        m_reconnecting->setStatusVisible(false);
        m_reconnecting->close();
    }
    // A name that is being typed is not interrupted; the next answer comes soon enough.
    if (!m_online && !m_refresh->isOpen() && !m_siteTree->isTyping())
        refreshStates();
    else
        m_updater->reloadAfterRest();
}

void DeviceWindow::onServerLost() {
    m_refresh->close();
    // Last, since the end of a refresh counts as an answer.
    m_online = false;
    if (m_reconnecting && m_reconnecting->isVisible())
        return;
    if (!m_reconnecting) {
        m_reconnecting = new ReconnectingDialog(this);
        connect(m_reconnecting, &ReconnectingDialog::disconnectBtnClicked, this,
                &DeviceWindow::disconnectRequested);
    }
    m_reconnecting->setStatusVisible(true);
    m_reconnecting->show();
}

void DeviceWindow::refreshStates() {
    m_refresh->open();
}

void DeviceWindow::onRefreshDone() {
    if (!CLocalStore::instance().loginInfo().isComplete() || (m_reconnecting && m_reconnecting->isVisible()))
        return;
    m_online = true;
    reload();
}

bool DeviceWindow::hasPendingEdits() const {
    return m_siteTree->edits().isDirty();
}

void DeviceWindow::discardEdits() {
    m_siteTree->discardEdits();
}

void DeviceWindow::commitSites() {
    m_siteCommit->send();
}

void DeviceWindow::onSiteChanged(const QString &siteId) {
    m_tabs->setSite(siteId);
    onFilterChanged();
}

void DeviceWindow::selectDevice(const QString &id, const QString &ip) {
    const DeviceSnapshot &devices = *m_inventory.snapshot();
    int place = devices.indexOf(id);
    for (int each = 0; place < 0 && each < devices.size(); ++each) {
        if (!ip.isEmpty() && devices.at(each)->text(DeviceColumn::Ip) == ip)
            place = each;
    }
    if (place < 0)
        return showError(tr("The device is not managed any more."));
    if (m_tabs->selectDevice(place))
        return;
    clearFilter();
    m_siteTree->select(Sites::overviewId);
    if (!m_tabs->selectDevice(place))
        showError(tr("The device cannot be shown."));
}

void DeviceWindow::onSelectionChanged() {
    const auto count = static_cast<int>(m_tabs->currentTable()->selectedDevices().size());
    qDebug("device selected: %d", count);
    m_selectionLogDelay->start();
    m_toolBar->setFulfilled(Operation::Needs::Selection, count > 0);
    showSelectionCount();
}

std::vector<DeviceRecordPtr> DeviceWindow::selectedDevices() const {
    return m_tabs->currentTable()->selectedRecords();
}

void DeviceWindow::showSelectionCount() {
    const MainConsoleTable *table = m_tabs->currentTable();
    m_footer->setSelection(static_cast<int>(table->selectedDevices().size()), table->rowCount(),
                           table->unfilteredCount());
}

void DeviceWindow::showStatusCounts() {
    m_footer->setStatuses(m_inventory, m_tabs->currentTable()->matchingDevices());
}

void DeviceWindow::showContent() {
    using LoadState = InventoryUpdater::LoadState;
    const auto content = m_updater->knowledge() == LoadState::Read     ? DeviceTab::Content::Read
                         : m_updater->knowledge() == LoadState::Failed ? DeviceTab::Content::Failed
                                                                       : DeviceTab::Content::Loading;
    m_tabs->showContent(content, m_siteTree->currentSite() != Sites::overviewId);
}

void DeviceWindow::showDefAnimateMsgDlg(const QString &message, TransientMessage::Kind kind) {
    TransientMessage::show(this, message, kind);
}

void DeviceWindow::showSuccess(const QString &message) {
    emit onShowAnimatedMsgDlg(message, TransientMessage::Kind::Success);
}

void DeviceWindow::showError(const QString &message) {
    emit onShowAnimatedMsgDlg(message, TransientMessage::Kind::Error);
}

void DeviceWindow::showProgress(const QString &message) {
    emit onShowAnimatedMsgDlg(message, TransientMessage::Kind::Loading);
}
