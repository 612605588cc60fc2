#include "devicewindow.h"

#include "adddevicedialog.h"
#include "clientstore.h"
#include "consolecorner.h"
#include "countedtabwidget.h"
#include "deviceactions.h"
#include "devicefooter.h"
#include "devicelog.h"
#include "devicemenus.h"
#include "devicemonitor.h"
#include "devicetab.h"
#include "devicetoolbar.h"
#include "filedialogs.h"
#include "mainconsoletable.h"
#include "noticebar.h"
#include "reconnectingdialog.h"
#include "refreshdevicedialog.h"
#include "servicerequest.h"
#include "sitecommit.h"
#include "sitetree.h"
#include "storewriter.h"
#include "taskinfopool.h"
#include "transientmessage.h"

#include <QComboBox>
#include <QDebug>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLineEdit>
#include <QShortcut>
#include <QSplitter>
#include <QTimer>
#include <QToolButton>
#include <QVBoxLayout>

#include <nlohmann/json.hpp>

#include <chrono>
#include <new>
#include <thread>

using namespace std::chrono_literals;

namespace {

constexpr auto refreshDelay = 2000ms;
constexpr auto selectionLogDelay = 200ms;
/// Polls tell of devices that come and go; what else others change shows with a reading once a minute.
constexpr int answersBetweenReadings = 10;
constexpr int siteTreeWidth = 248;
/// While tasks run, readings take one part in so many of the time at most.
constexpr int readingShare = 4;

} // namespace

DeviceWindow::DeviceWindow(QWidget *parent)
    : QWidget(parent),
      m_monitor(std::make_unique<DeviceMonitor>(m_inventory)),
      m_netTask(new (std::nothrow) NetTask),
      m_refreshTask(new (std::nothrow) NetTask),
      m_splitter(new QSplitter(this)),
      m_console(new QWidget(m_splitter)),
      m_siteTree(new SiteTree(m_splitter)),
      m_siteCommit(new SiteCommit(m_siteTree, this)),
      m_actions(new DeviceActions(this)),
      m_toolBar(new DeviceToolBar(m_console)),
      m_noticeBar(new NoticeBar(m_console)),
      m_tabs(new CountedTabWidget(m_console)),
      m_corner(new ConsoleCorner(m_tabs)),
      m_footer(new DeviceFooter(m_console)),
      m_selectionLogDelay(new QTimer(this)) {
    qDebug("DeviceWindow constructor");
    setObjectName(QStringLiteral("DeviceWindow"));
    if (!m_netTask || !m_refreshTask)
        qDebug("net task create failed!should not be this case!");
    m_selectionLogDelay->setSingleShot(true);
    m_selectionLogDelay->setInterval(selectionLogDelay);
    buildTabs();
    buildLayout();
    connectParts();
    showCounts();
    m_footer->clear();
}

DeviceWindow::~DeviceWindow() {
    qDebug("DeviceWindow destructor");
}

void DeviceWindow::buildTabs() {
    m_tabs->setObjectName(QStringLiteral("deviceTabs"));
    const std::pair<QString, const char *> tabs[] = {
        {tr("Camera"), "cameraTable"}, {tr("NVR"), "nvrTable"}, {tr("Others"), "othersTable"}};
    for (int i = 0; i < deviceClassCount; ++i) {
        auto *tab = new DeviceTab(static_cast<DeviceClass>(i), &m_inventory, m_tabs->pageParent());
        tab->table()->setObjectName(QLatin1String(tabs[i].second));
        tab->table()->setAccessibleName(tabs[i].first);
        m_tabs->addTab(tab, tabs[i].first);
        m_deviceTabs.push_back(tab);
    }
    m_tabs->setCornerWidget(m_corner);
    for (const DeviceTab *tab : m_deviceTabs)
        tab->table()->keepColumns();
}

void DeviceWindow::buildLayout() {
    auto *consoleLayout = new QVBoxLayout(m_console);
    consoleLayout->setContentsMargins(14, 10, 14, 0);
    consoleLayout->setSpacing(8);
    consoleLayout->addWidget(m_toolBar);
    consoleLayout->addWidget(m_noticeBar);
    consoleLayout->addWidget(m_tabs, 1);
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
    connect(m_monitor.get(), &DeviceMonitor::ticked, this, &DeviceWindow::onTick);
    connect(&CTaskInfoPool::instance(), &CTaskInfoPool::taskListUpdated, this,
            &DeviceWindow::onTaskListUpdated);
    connect(m_actions, &DeviceActions::failed, this, &DeviceWindow::onShowAnimatedMsgDlg);
    connect(m_siteTree, &SiteTree::currentSiteChanged, this, &DeviceWindow::onSiteChanged);
    connect(m_siteTree, &SiteTree::sitesEdited, this,
            [this] { m_noticeBar->setVisible(m_siteTree->edits().isDirty()); });
    connect(m_siteTree, &SiteTree::editsDropped, this, [this](const QStringList &reasons) {
        emit onShowAnimatedMsgDlg(reasons.join(QLatin1Char('\n')));
    });
    connect(m_siteTree, &SiteTree::editRefused, this, &DeviceWindow::onShowAnimatedMsgDlg);
    connect(m_siteTree, &SiteTree::dropRefused, this, &DeviceWindow::onShowAnimatedMsgDlg);
    connect(m_siteTree, &SiteTree::devicesDropped, this, &DeviceWindow::onDevicesDropped);
    connect(m_noticeBar, &NoticeBar::msgButtonClicked, this, &DeviceWindow::commitSites);
    connect(m_siteCommit, &SiteCommit::failed, this, &DeviceWindow::onShowAnimatedMsgDlg);
    connect(m_siteCommit, &SiteCommit::answered, this, &DeviceWindow::reload);
    connect(m_tabs, &CountedTabWidget::currentChanged, this, [this] {
        showStatusCounts();
        onSelectionChanged();
    });
    for (const DeviceTab *tab : m_deviceTabs)
        connectTable(tab);
    connect(m_corner->search(), &QLineEdit::textChanged, this, &DeviceWindow::applySearch);
    connect(m_corner->columnsButton(), &QToolButton::clicked, this, [this] {
        const QWidget *button = m_corner->columnsButton();
        DeviceMenus::showColumnMenu(currentTab()->table(), button->mapToGlobal(QPoint(0, button->height())));
    });
    connect(m_footer, &DeviceFooter::statusFilterChanged, this, &DeviceWindow::applyStatusFilter);
    connect(m_actions, &DeviceActions::done, this, &DeviceWindow::onShowAnimatedMsgDlg);
    connect(m_actions, &DeviceActions::devicesChanged, this, &DeviceWindow::reload);
    connect(m_actions, &DeviceActions::devicesDeleted, this, &DeviceWindow::onDevicesDeleted);
    connect(m_selectionLogDelay, &QTimer::timeout, this, [this] { DeviceLog::selectionChanged(m_selected); });
    connect(this, &DeviceWindow::onShowAnimatedMsgDlg, this, &DeviceWindow::showDefAnimateMsgDlg);
    QComboBox *servers = m_corner->remoteCombo();
    connect(servers, &QComboBox::activated, this, [this, servers](int index) {
        const QString id = servers->itemData(index).toString();
        servers->setCurrentIndex(-1);
        emit remoteServerChosen(id);
    });
    QToolButton *refresh = m_toolBar->button(QStringLiteral("refreshButton"));
    connect(refresh, &QToolButton::clicked, this, &DeviceWindow::openRefreshDialog);
    connect(m_toolBar->button(QStringLiteral("addDeviceButton")), &QToolButton::clicked, this,
            &DeviceWindow::openAddDialog);
    connect(m_toolBar->button(QStringLiteral("restartButton")), &QToolButton::clicked, this,
            &DeviceWindow::on_restartButton_clicked);
    connect(m_toolBar->button(QStringLiteral("deleteButton")), &QToolButton::clicked, this,
            &DeviceWindow::on_deleteButton_clicked);
    connect(m_toolBar->entry(QStringLiteral("exportDeviceListAction")), &QAction::triggered, this,
            &DeviceWindow::exportDeviceList);
    addShortcuts();
}

void DeviceWindow::connectTable(const DeviceTab *tab) {
    MainConsoleTable *table = tab->table();
    connect(table, &MainConsoleTable::selectedDevicesChanged, this, &DeviceWindow::onSelectionChanged);
    connect(table, &MainConsoleTable::deleteRequested, this, &DeviceWindow::on_deleteButton_clicked);
    connect(table, &MainConsoleTable::rowMenuRequested, this,
            [this, table](const QPoint &position) { DeviceMenus::showRowMenu(m_toolBar, table, position); });
    connect(table, &MainConsoleTable::columnMenuRequested, this,
            [table](const QPoint &position) { DeviceMenus::showColumnMenu(table, position); });
    connect(tab, &DeviceTab::addDeviceRequested, this, &DeviceWindow::openAddDialog);
    connect(tab, &DeviceTab::clearFilterRequested, this, &DeviceWindow::clearFilter);
}

void DeviceWindow::addShortcuts() {
    const auto add = [this](const QKeySequence &keys, auto slot) {
        auto *shortcut = new QShortcut(keys, this);
        shortcut->setContext(Qt::WidgetWithChildrenShortcut);
        connect(shortcut, &QShortcut::activated, this, slot);
    };
    add(QKeySequence::Find, [this] {
        m_corner->search()->setFocus();
        m_corner->search()->selectAll();
    });
    add(Qt::Key_F5, [this] { m_toolBar->button(QStringLiteral("refreshButton"))->click(); });
}

void DeviceWindow::startWork() {
    loadRemoteServers();
    m_online = false;
    m_toolBar->button(QStringLiteral("refreshButton"))->setEnabled(true);
    for (const char *name : {"exportButton", "addDeviceButton"})
        m_toolBar->button(QLatin1String(name))->setEnabled(true);
    m_toolBar->entry(QStringLiteral("exportDeviceListAction"))->setEnabled(true);
    m_siteTree->setFocus();
    reload();
    m_monitor->start();
}

void DeviceWindow::stopWork() {
    m_monitor->stop();
    for (const char *name : {"refreshButton", "exportButton", "addDeviceButton"})
        m_toolBar->button(QLatin1String(name))->setEnabled(false);
    clearFilter();
    if (m_reconnecting)
        m_reconnecting->close();
    if (m_refreshing)
        m_refreshing->close();
    m_reloadWanted = false;
    m_everRead = false;
    m_lastReadFailed = false;
    m_tasksRunning = false;
    m_online = false;
    m_inventory.replace(std::make_shared<DeviceSnapshot>(), {});
    m_siteTree->forgetSites();
    m_noticeBar->hide();
    for (const DeviceTab *tab : m_deviceTabs)
        tab->table()->refill();
    showCounts();
    showContent();
    m_footer->clear();
}

void DeviceWindow::loadRemoteServers() {
    QComboBox *combo = m_corner->remoteCombo();
    combo->clear();
    JSON servers;
    CClientStore::instance().loadServerList(servers);
    for (const JSON &server : servers)
        combo->addItem(stringMember(server, "svrname"), stringMember(server, "id"));
    combo->setCurrentIndex(-1);
    combo->setEnabled(combo->count() > 0);
}

void DeviceWindow::reload() {
    if (!CLocalStore::instance().loginInfo().isComplete())
        return;
    if (m_reloading) {
        m_reloadWanted = true;
        return;
    }
    const auto read = [snapshot = m_inventory.snapshot(),
                       codes = m_inventory.statuses()](ServiceSession &session) {
        return InventoryReader::readAll(session, snapshot, codes);
    };
    m_reloadWanted = false;
    m_answersSinceReading = 0;
    m_sinceReading.start();
    m_reloading = ServiceRequest::post(
        m_netTask.get(), this, read,
        [this, commits = m_siteTree->edits().commitCount()](InventoryReader::Reading reading) {
            // Sites that were read before a commit are older than the tree.
            if (commits != m_siteTree->edits().commitCount())
                reading.sites.reset();
            onReading(reading);
        },
        [this](JobEnd end) {
            m_reloading = false;
            m_readingMs = m_sinceReading.restart();
            if (end != JobEnd::Delivered && end != JobEnd::SessionGone) {
                m_lastReadFailed = true;
                showContent();
            }
            if (m_reloadWanted)
                reload();
        });
    // The runner may still be busy with the last answer of a session that has ended.
    m_reloadWanted = !m_reloading;
}

/// A task that has moved has changed devices, mostly. How soon they are read again depends on what that
/// costs.
void DeviceWindow::onTick() {
    CTaskInfoPool &pool = CTaskInfoPool::instance();
    if (m_reloading || m_reloadWanted || !pool.isTasksChanged() ||
        m_sinceReading.elapsed() < m_readingMs * (readingShare - 1))
        return;
    reload();
    pool.clearTasksChanged();
}

void DeviceWindow::onTaskListUpdated() {
    const bool running = CTaskInfoPool::instance().hasRunningTask();
    if (std::exchange(m_tasksRunning, running) && !running)
        emit allTasksDone();
}

void DeviceWindow::openAddDialog() {
    auto *dialog = new AddDeviceDialog(m_inventory.snapshot(), this);
    connect(dialog, &AddDeviceDialog::devicesAdded, this, &DeviceWindow::reload);
    dialog->open();
}

void DeviceWindow::on_restartButton_clicked() {
    QStringList ids;
    for (const DeviceRecordPtr &device : m_selected)
        ids += device->id;
    ask(ConfirmDialog::Kind::RestartDevices, [this, ids] {
        qDebug("on_restartButton_clicked accepted");
        m_actions->restart(ids);
    });
}

void DeviceWindow::on_deleteButton_clicked() {
    if (m_selected.empty())
        return;
    // What was selected when the question was asked, whatever a poll does to the selection meanwhile.
    const QString site = m_siteTree->currentSite();
    if (site == Sites::overviewId)
        ask(ConfirmDialog::Kind::DeleteDevices,
            [this, devices = m_selected] { m_actions->deleteDevices(devices); });
    else
        ask(ConfirmDialog::Kind::RemoveFromSite,
            [this, devices = m_selected, site] { m_actions->removeFromSite(devices, site); });
}

void DeviceWindow::ask(ConfirmDialog::Kind kind, const std::function<void()> &agreed) {
    auto *confirm = new ConfirmDialog(kind, this, static_cast<int>(m_selected.size()));
    confirm->setAttribute(Qt::WA_DeleteOnClose);
    connect(confirm, &QDialog::accepted, this, agreed);
    confirm->open();
}

/// The service needs a moment to let devices go; the next poll comes at once after it.
void DeviceWindow::onDevicesDeleted() {
    const auto read = [snapshot = m_inventory.snapshot(),
                       codes = m_inventory.statuses()](ServiceSession &session) {
        return InventoryReader::readStatus(session, snapshot, codes);
    };
    ServiceRequest::post(
        NetJob::createRunner("reading the states after a removal"), this, read,
        [this](const std::optional<DeviceStatusUpdate> &update) {
            if (update)
                onUpdateDeviceStatus(*update);
        },
        [this](JobEnd) { m_monitor->forceRefresh(); }, [] { std::this_thread::sleep_for(refreshDelay); });
}

void DeviceWindow::exportDeviceList() {
    const QString folder = CLocalStore::instance().defaultFilePath();
    const QString name = tr("Device List") + QStringLiteral(".csv");
    FileDialogs::askSavePath(
        this, tr("Save as"), folder.isEmpty() ? name : folder + QLatin1Char('/') + name,
        tr("CSV files (*.csv)"), QStringLiteral("csv"), [this](const QString &path) {
            StoreWriter::post(
                [path] { CLocalStore::instance().setDefaultFilePath(QFileInfo(path).absolutePath()); });
            m_actions->exportList(path, m_inventory.snapshot(), currentTab()->table()->shownDevices());
        });
}

QHash<QString, QString> DeviceWindow::siteNames() const {
    QHash<QString, QString> names;
    for (const Sites::Site &site : m_siteTree->edits().merged())
        names.insert(site.id, site.name);
    return names;
}

void DeviceWindow::applySearch(const QString &text) {
    const DeviceSearch search(text, siteNames());
    for (const DeviceTab *tab : m_deviceTabs)
        tab->table()->setSearch(search);
    onFilterChanged();
}

void DeviceWindow::applyStatusFilter(std::optional<DeviceStatusGroup> status) {
    for (const DeviceTab *tab : m_deviceTabs)
        tab->table()->setStatusFilter(status);
    onFilterChanged();
}

void DeviceWindow::clearFilter() {
    m_corner->search()->clear();
    m_footer->clearStatusFilter();
}

void DeviceWindow::onFilterChanged() {
    showCounts();
    showContent();
    onSelectionChanged();
}

void DeviceWindow::onReading(const InventoryReader::Reading &reading) {
    qDebug("update site info");
    qDebug("update device info");
    if (reading.sites)
        m_siteTree->setSites(*reading.sites);
    m_lastReadFailed = !reading.devices;
    if (reading.devices) {
        const DeviceSnapshotPtr previous = m_inventory.snapshot();
        m_inventory.replace(reading.devices, reading.codes);
        m_everRead = true;
        for (const DeviceTab *tab : m_deviceTabs)
            tab->table()->refill();
        DeviceLog::tablesFilled(reading.devices, previous);
        m_footer->markUpdated();
    }
    m_siteTree->setCounts(*m_inventory.snapshot());
    showCounts();
    showContent();
    onSelectionChanged();
}

void DeviceWindow::onUpdateDeviceStatus(const DeviceStatusUpdate &update) {
    m_footer->markUpdated();
    if (update.devicesDiffer)
        reload();
    if (!m_inventory.apply(update) || update.changes.empty())
        return;
    for (const DeviceTab *tab : m_deviceTabs)
        tab->table()->refreshStatus();
    showCounts();
    showContent();
}

void DeviceWindow::onServerAnswered() {
    if (m_reconnecting && m_reconnecting->isVisible()) {
        m_reconnecting->setStatusVisible(false);
        m_reconnecting->close();
    }
    if (!m_online && !m_refreshing)
        openRefreshDialog();
    else if (++m_answersSinceReading >= answersBetweenReadings)
        reload();
}

void DeviceWindow::onServerLost() {
    m_online = false;
    if (m_reconnecting && m_reconnecting->isVisible())
        return;
    if (m_refreshing)
        m_refreshing->close();
    if (!m_reconnecting) {
        m_reconnecting = new ReconnectingDialog(this);
        connect(m_reconnecting, &ReconnectingDialog::disconnectBtnClicked, this,
                &DeviceWindow::disconnectRequested);
    }
    m_reconnecting->setStatusVisible(true);
    m_reconnecting->show();
}

void DeviceWindow::openRefreshDialog() {
    if (m_refreshing)
        return;
    m_refreshing = new RefreshDeviceDialog(this);
    m_refreshing->setAttribute(Qt::WA_DeleteOnClose);
    connect(m_refreshing, &RefreshDeviceDialog::refresh, this, &DeviceWindow::onRefreshDevice);
    connect(m_refreshing, &QDialog::accepted, this, &DeviceWindow::onRefreshDone);
    connect(m_refreshing, &QDialog::rejected, this, &DeviceWindow::onRefreshDone);
    m_refreshing->open();
}

void DeviceWindow::onRefreshDevice() {
    qDebug("onRefreshDevice@@@@@");
    const auto read = [snapshot = m_inventory.snapshot(),
                       codes = m_inventory.statuses()](ServiceSession &session) {
        return InventoryReader::readStatus(session, snapshot, codes);
    };
    const QPointer<RefreshDeviceDialog> dialog = m_refreshing;
    const bool started = ServiceRequest::post(
        m_refreshTask.get(), this, read,
        [this](const std::optional<DeviceStatusUpdate> &update) {
            if (update)
                onUpdateDeviceStatus(*update);
            else
                emit onShowAnimatedMsgDlg(tr("The device states could not be read. Try again."));
        },
        [dialog](JobEnd) {
            if (dialog)
                dialog->finish();
        },
        // The devices need a moment to settle; the wait must not keep other jobs from their turn.
        [] { std::this_thread::sleep_for(refreshDelay); });
    if (!started && dialog)
        dialog->finish();
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

void DeviceWindow::onDevicesDropped(const QString &siteId, const QStringList &deviceIds,
                                    Qt::DropAction action, const QString &sourceSiteId) {
    std::vector<DeviceRecordPtr> devices;
    const DeviceSnapshot &snapshot = *m_inventory.snapshot();
    for (const QString &id : deviceIds) {
        if (const int place = snapshot.indexOf(id); place >= 0)
            devices.push_back(snapshot.at(place));
    }
    if (devices.empty())
        return showDefAnimateMsgDlg(tr("The devices are not managed any more."));
    m_actions->putIntoSite(devices, {siteId, sourceSiteId, action == Qt::MoveAction});
}

void DeviceWindow::onSiteChanged(const QString &siteId) {
    for (const DeviceTab *tab : m_deviceTabs)
        tab->table()->setSite(siteId);
    showCounts();
    showContent();
    onSelectionChanged();
}

void DeviceWindow::selectDevice(const QString &id, const QString &ip) {
    const DeviceSnapshot &devices = *m_inventory.snapshot();
    int place = devices.indexOf(id);
    for (int each = 0; place < 0 && each < devices.size(); ++each) {
        if (!ip.isEmpty() && devices.at(each)->text(DeviceColumn::Ip) == ip)
            place = each;
    }
    if (place < 0)
        return showDefAnimateMsgDlg(tr("The device is not managed any more."));
    const int tab = static_cast<int>(devices.at(place)->deviceClass);
    m_tabs->setCurrentIndex(tab);
    if (!currentTab()->table()->selectDevice(place)) {
        m_siteTree->select(Sites::overviewId);
        currentTab()->table()->selectDevice(place);
    }
}

void DeviceWindow::onSelectionChanged() {
    const MainConsoleTable *table = currentTab()->table();
    m_selected.clear();
    for (const int device : table->selectedDevices())
        m_selected.push_back(m_inventory.snapshot()->at(device));
    qDebug("device selected: %d", static_cast<int>(m_selected.size()));
    m_selectionLogDelay->start();
    for (const char *name : {"restartButton", "deleteButton"})
        m_toolBar->button(QLatin1String(name))->setEnabled(!m_selected.empty());
    m_footer->setSelection(static_cast<int>(m_selected.size()), table->rowCount(), table->unfilteredCount());
}

void DeviceWindow::showCounts() {
    for (int i = 0; i < m_tabs->count(); ++i)
        m_tabs->setCount(i, m_deviceTabs[static_cast<std::size_t>(i)]->table()->rowCount());
    showStatusCounts();
}

void DeviceWindow::showStatusCounts() {
    m_footer->setStatuses(m_inventory, currentTab()->table()->matchingDevices());
}

void DeviceWindow::showContent() {
    const auto content = m_everRead         ? DeviceTab::Content::Read
                         : m_lastReadFailed ? DeviceTab::Content::Failed
                                            : DeviceTab::Content::Loading;
    for (DeviceTab *tab : m_deviceTabs)
        tab->showContent(content, m_siteTree->currentSite() != Sites::overviewId);
}

DeviceTab *DeviceWindow::currentTab() const {
    return m_deviceTabs[static_cast<std::size_t>(m_tabs->currentIndex())];
}

void DeviceWindow::showDefAnimateMsgDlg(const QString &message) {
    TransientMessage::show(this, message);
}
