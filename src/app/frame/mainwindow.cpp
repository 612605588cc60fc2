#include "app/frame/mainwindow.h"

#include "app/frame/sidepanel.h"
#include "devices/page/devicewindow.h"
#include "pages/log/logwindow.h"
#include "pages/settings/settingwindow.h"
#include "tasks/panels/alarmpanel.h"
#include "tasks/queue/failedoperations.h"
#include "tasks/queue/postwork.h"
#include "widgets/controls/badgebutton.h"
#include "widgets/dialogs/confirmdialog.h"
#include "widgets/dialogs/transientmessage.h"
#include "widgets/style/icons.h"

#include <QButtonGroup>
#include <QCursor>
#include <QDebug>
#include <QDir>
#include <QEvent>
#include <QHBoxLayout>
#include <QSplitter>
#include <QStackedWidget>
#include <QToolButton>
#include <QToolTip>
#include <QVBoxLayout>

#include <algorithm>

namespace {
constexpr int railWidth = 56;
constexpr QSize railIconSize{20, 20};
constexpr QSize railButtonSize{44, 44};
constexpr int sidePanelWidth = 340;

/// Made before its children: a tree of widgets that moves to another parent is styled all over again.
QWidget *makeCentral(QMainWindow *window) {
    // It lives inside the frame, so it is no window of its own; said while there is nothing to style yet.
    window->setWindowFlags(Qt::Widget);
    auto *central = new QWidget(window);
    central->setAttribute(Qt::WA_TranslucentBackground);
    auto *layout = new QHBoxLayout(central);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    window->setCentralWidget(central);
    return central;
}

} // namespace

MainWindow::MainWindow(QWidget *parent)
    : QMainWindow(parent),
      m_splitter(new QSplitter(makeCentral(this))),
      m_pages(new QStackedWidget(m_splitter)),
      m_deviceWindow(new DeviceWindow(m_pages)),
      m_logWindow(new LogWindow(m_pages)),
      m_settingWindow(new SettingWindow(m_pages)),
      m_sidePanel(new SidePanel(m_splitter)),
      m_navigation(new QButtonGroup(this)) {
    qDebug("MainWindow constructor");
    setObjectName(QStringLiteral("MainWindow"));
    m_pages->setObjectName(QStringLiteral("pageStack"));
    for (QWidget *page : {static_cast<QWidget *>(m_deviceWindow), static_cast<QWidget *>(m_logWindow),
                          static_cast<QWidget *>(m_settingWindow)})
        m_pages->addWidget(page);
    auto *layout = static_cast<QHBoxLayout *>(centralWidget()->layout());
    layout->addWidget(buildRail());
    layout->addWidget(m_splitter, 1);
    m_splitter->setHandleWidth(1);
    m_splitter->setChildrenCollapsible(false);
    m_splitter->setStretchFactor(0, 1);
    m_splitter->setSizes({1000, sidePanelWidth});
    m_sidePanel->hide();
    connectPages();
    connectPanels();
    connectPostWork();
    connectFailedOperations();
}

MainWindow::~MainWindow() {
    qDebug("MainWindow destructor");
}

QWidget *MainWindow::buildRail() {
    auto *rail = new QFrame(centralWidget());
    rail->setObjectName(QStringLiteral("navigationRail"));
    rail->setFixedWidth(railWidth);
    auto *layout = new QVBoxLayout(rail);
    layout->setContentsMargins(0, 8, 0, 8);
    layout->setSpacing(4);
    BadgeButton *device =
        addRailButton(rail, "deviceButton", QStringLiteral("nav_device_line"), tr("Device"));
    BadgeButton *log = addRailButton(rail, "logButton", QStringLiteral("nav_logs_line"), tr("Logs"));
    BadgeButton *settings =
        addRailButton(rail, "settingsButton", QStringLiteral("nav_settings_line"), tr("Settings"));
    layout->addStretch();
    m_alarmButton = addRailButton(rail, "alarmButton", QStringLiteral("nav_alarm_line"), tr("Alarms"));
    m_taskButton = addRailButton(rail, "taskButton", QStringLiteral("nav_task_line"), tr("Tasks"));
    m_navigation->setExclusive(true);
    m_navigation->addButton(device, DevicePage);
    m_navigation->addButton(log, LogPage);
    m_navigation->addButton(settings, SettingsPage);
    device->setChecked(true);
    connect(m_navigation, &QButtonGroup::idToggled, this, [this](int page, bool checked) {
        if (checked && page != m_pages->currentIndex())
            navigateTo(page);
    });
    return rail;
}

QWidget *MainWindow::currentPage() const {
    return m_pages->currentWidget();
}

void MainWindow::startWork() {
    showPage(DevicePage);
    m_deviceWindow->startWork();
    // Whether alarms and tasks may show on the desktop stands there.
    m_settingWindow->loadConfig();
}

void MainWindow::stopWork() {
    m_deviceWindow->stopWork();
    m_logWindow->reset();
    m_settingWindow->reset();
}

void MainWindow::connectPages() {
    connect(m_logWindow, &LogWindow::export_button_clicked, m_deviceWindow, &DeviceWindow::showProgress);
    connect(m_logWindow, &LogWindow::export_file_generated, m_deviceWindow,
            [this](const QString &message, bool written) {
                written ? m_deviceWindow->showSuccess(message) : m_deviceWindow->showError(message);
            });
}

/// Leads to a page unless the one that is left has changes: then the user decides, and the rail shows the
/// page that is still there.
void MainWindow::navigateTo(int page) {
    const auto goOn = [this, page](auto discard) {
        return [this, page, discard] {
            discard();
            navigateTo(page);
        };
    };
    if (page != DevicePage && m_deviceWindow->hasPendingEdits())
        return askToLeave(goOn([this] { m_deviceWindow->discardEdits(); }));
    if (page != SettingsPage && m_settingWindow->hasUnsavedEdits())
        return askToLeave(goOn([this] { m_settingWindow->discardEdits(); }));
    showPage(page);
}

void MainWindow::askToLeave(const std::function<void()> &discard) {
    m_navigation->button(m_pages->currentIndex())->setChecked(true);
    if (m_question && m_question->isVisible())
        return m_question->raise();
    m_question = new ConfirmDialog(ConfirmDialog::Kind::LeavePage, this);
    m_question->setAttribute(Qt::WA_DeleteOnClose);
    connect(m_question, &QDialog::rejected, this, discard);
    m_question->open();
}

void MainWindow::showPage(int page) {
    m_pages->setCurrentIndex(page);
    m_navigation->button(page)->setChecked(true);
    if (page == SettingsPage)
        m_settingWindow->loadConfig();
}

void MainWindow::connectPanels() {
    for (QToolButton *button : {m_alarmButton, m_taskButton})
        connect(button, &QToolButton::clicked, this, [this, button] { togglePanel(button); });
    connect(m_sidePanel, &SidePanel::changed, this, &MainWindow::showPanelButtons);
    connect(m_sidePanel->alarmPanel(), &AlarmPanel::alarmUnreadCountUpdated, this, [this](int count) {
        m_alarmButton->setBadge(count);
        m_sidePanel->setUnreadCount(count);
    });
    connect(m_sidePanel->alarmPanel(), &AlarmPanel::deviceChosen, this,
            [this](const QString &deviceId, const QString &ip) {
                m_navigation->button(DevicePage)->setChecked(true);
                m_deviceWindow->selectDevice(deviceId, ip);
            });
}

void MainWindow::connectPostWork() {
    CPostWork &work = CPostWork::instance();
    connect(&work, &CPostWork::exported, m_deviceWindow, [this](const QString &path) {
        m_deviceWindow->showSuccess(
            tr("Debug information saved as “%1”.").arg(QDir::toNativeSeparators(path)));
    });
    connect(&work, &CPostWork::exportFailed, m_deviceWindow, &DeviceWindow::showError);
}

/// The panel that tells of them is usually closed.
void MainWindow::connectFailedOperations() {
    const auto *operations = &FailedOperations::instance();
    connect(operations, &FailedOperations::told, this, [this](const QString &message) {
        if (isTaskPanelOpen())
            return;
        m_taskButton->setBadge(m_taskButton->badge() + 1);
        TransientMessage::show(this, message, TransientMessage::Kind::Error);
    });
    connect(operations, &FailedOperations::changed, this, [this, operations] {
        m_taskButton->setBadge(std::min(m_taskButton->badge(), operations->count()));
    });
}

bool MainWindow::isTaskPanelOpen() const {
    return m_sidePanel->isVisible() && m_sidePanel->current() == SidePanel::Panel::Tasks;
}

/// A button opens its panel, and closes it when it is the one that is open.
void MainWindow::togglePanel(QToolButton *button) {
    const auto panel = button == m_alarmButton ? SidePanel::Panel::Alarms : SidePanel::Panel::Tasks;
    if (m_sidePanel->isVisible() && m_sidePanel->current() == panel)
        m_sidePanel->hide();
    else
        m_sidePanel->open(panel);
    showPanelButtons();
}

void MainWindow::showPanelButtons() {
    const bool open = !m_sidePanel->isHidden();
    m_alarmButton->setChecked(open && m_sidePanel->current() == SidePanel::Panel::Alarms);
    if (isTaskPanelOpen())
        m_taskButton->setBadge(0);
    m_taskButton->setChecked(open && m_sidePanel->current() == SidePanel::Panel::Tasks);
}

BadgeButton *MainWindow::addRailButton(QWidget *rail, const char *name, const QString &icon,
                                       const QString &text) {
    auto *button = new BadgeButton(rail);
    button->setObjectName(QLatin1String(name));
    button->setAccessibleName(text);
    button->setIcon(Icons::icon(QStringLiteral(":/images/%1.svg").arg(icon), railIconSize));
    button->setIconSize(railIconSize);
    button->setFixedSize(railButtonSize);
    button->setCheckable(true);
    button->setFocusPolicy(Qt::TabFocus);
    button->installEventFilter(this);
    rail->layout()->addWidget(button);
    rail->layout()->setAlignment(button, Qt::AlignHCenter);
    return button;
}

bool MainWindow::eventFilter(QObject *watched, QEvent *event) {
    if (event->type() == QEvent::Enter) {
        const auto *button = static_cast<QWidget *>(watched);
        QToolTip::showText(QCursor::pos(), button->accessibleName());
    }
    return QMainWindow::eventFilter(watched, event);
}
