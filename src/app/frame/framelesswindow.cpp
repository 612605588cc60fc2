#include "app/frame/framelesswindow.h"

#include "api/session/servicerequest.h"
#include "app/frame/idlewatch.h"
#include "app/frame/localnotices.h"
#include "app/frame/mainwindow.h"
#include "app/frame/resizeedges.h"
#include "app/frame/sidepanel.h"
#include "app/frame/titlebar.h"
#include "app/frame/welcomepage.h"
#include "app/help/aboutdialog.h"
#include "app/help/crashdialog.h"
#include "app/help/userguide.h"
#include "app/login/accountmanagementdialog.h"
#include "app/login/accountsetupdialog.h"
#include "app/login/logindialog.h"
#include "app/login/serverkeydialog.h"
#include "app/remote/servicemanagement.h"
#include "app/startcheck.h"
#include "devices/operations/rollout/rolloutmgr.h"
#include "devices/page/devicewindow.h"
#include "pages/settings/settingwindow.h"
#include "platform/log/crashreport.h"
#include "platform/system/servicecontrol.h"
#include "store/localstore.h"
#include "store/serverkeys.h"
#include "tasks/notify/notifier.h"
#include "tasks/queue/exetaskmgr.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "tasks/service/taskinfopool.h"
#include "widgets/controls/popupmenu.h"
#include "widgets/dialogs/confirmdialog.h"
#include "widgets/dialogs/transientmessage.h"

#include <QApplication>
#include <QCloseEvent>
#include <QDebug>
#include <QScreen>
#include <QStackedWidget>
#include <QTimer>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>
#include <chrono>

using namespace std::chrono_literals;

namespace {

constexpr QSize startSize{1280, 720};
constexpr QSize minSize{1100, 640};
constexpr auto finalLogOffTime = 3000ms;

void warnOfLogOff() {
    qWarning("Encountered unexpected error when onLogOff() while FramelessWindow");
}

unsigned logOut(CApiClient &client, const LoginInfo &login) {
    client.setTotalTimeout(finalLogOffTime);
    return client.logoutServer(login.token.constData());
}

} // namespace

FramelessWindow::FramelessWindow(QWidget *parent)
    : QWidget(parent,
              Qt::Window | Qt::FramelessWindowHint | Qt::WindowSystemMenuHint | Qt::WindowMinimizeButtonHint),
      m_titleBar(new TitleBar),
      m_stack(new QStackedWidget),
      m_welcome(new WelcomePage),
      m_startCheck(new StartCheck(this)),
      m_serviceManagement(new ServiceManagement(this)),
      m_idle(new IdleWatch(this)),
      m_notices(new LocalNotices(this)) {
    qDebug("FramelessWindow constructor");
    setObjectName(QStringLiteral("FramelessWindow"));
    setWindowTitle(QCoreApplication::applicationName());
    buildLayout();
    probeLocalService();
    connectParts();
    qApp->installEventFilter(this);
    QTimer::singleShot(0, this, &FramelessWindow::begin);
}

FramelessWindow::~FramelessWindow() {
    qDebug("FramelessWindow destructor");
    qApp->removeEventFilter(this);
    const LoginInfo login = CLocalStore::instance().loginInfo();
    if (!login.isComplete())
        return;
    unsigned result = ApiOk;
    NetTask::runAndWait([&] {
        result = ServiceSession(login).call([&](CApiClient &client) { return logOut(client, login); });
    });
    if (result != ApiOk)
        warnOfLogOff();
}

void FramelessWindow::buildLayout() {
    setMouseTracking(true);
    auto *frame = new QFrame(this);
    frame->setObjectName(QStringLiteral("windowFrame"));
    frame->setCursor(Qt::ArrowCursor);
    auto *content = new QWidget(frame);
    content->setObjectName(QStringLiteral("windowContent"));
    auto *contentLayout = new QVBoxLayout(content);
    contentLayout->setContentsMargins(0, 0, 0, 0);
    contentLayout->addWidget(m_stack);
    m_stack->addWidget(m_welcome);
    auto *frameLayout = new QVBoxLayout(frame);
    frameLayout->setContentsMargins(1, 1, 1, 1);
    frameLayout->setSpacing(0);
    frameLayout->addWidget(m_titleBar);
    frameLayout->addWidget(content, 1);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(ResizeEdges::margin, ResizeEdges::margin, ResizeEdges::margin,
                               ResizeEdges::margin);
    layout->addWidget(frame);
    setMinimumSize(minSize);
    resize(startSize);
    moveToScreenCentre();
    m_titleBar->helpButton()->hide();
    m_titleBar->accountButton()->hide();
}

/// A place that is asked for is known at once; one that the window system chooses comes after the first
/// dialog, which then stands beside the middle of the frame.
void FramelessWindow::moveToScreenCentre() {
    const QRect room = screen()->availableGeometry();
    const QPoint centred = room.center() - rect().center();
    move(std::max(centred.x(), room.left()), std::max(centred.y(), room.top()));
}

void FramelessWindow::probeLocalService() {
    const bool installed = ServiceControl::queryLocalService() != LocalServiceState::NotInstalled;
    CLocalStore::instance().setLocalServiceInstalled(installed);
    m_titleBar->accountManagementAction()->setEnabled(installed);
}

void FramelessWindow::connectParts() {
    connect(qApp, &QGuiApplication::applicationStateChanged, this,
            &FramelessWindow::on_applicationStateChanged);
    connect(m_titleBar, &WindowDragger::doubleClicked, this,
            &FramelessWindow::on_windowTitlebar_doubleClicked);
    connect(m_titleBar->minimizeButton(), &QToolButton::clicked, this,
            &FramelessWindow::on_minimizeButton_clicked);
    connect(m_titleBar->maximizeButton(), &QToolButton::clicked, this,
            &FramelessWindow::on_maximizeButton_clicked);
    connect(m_titleBar->restoreButton(), &QToolButton::clicked, this,
            &FramelessWindow::on_restoreButton_clicked);
    connect(m_titleBar->closeButton(), &QToolButton::clicked, this, &FramelessWindow::on_closeButton_clicked);
    connect(m_titleBar->helpButton(), &QToolButton::clicked, this, &FramelessWindow::on_helpButton_clicked);
    connect(m_titleBar->accountManagementAction(), &QAction::triggered, this,
            &FramelessWindow::onAccontManagement);
    connect(m_titleBar->serviceManagementAction(), &QAction::triggered, this,
            &FramelessWindow::validateOrbServiceAdded);
    connect(m_titleBar->aboutAction(), &QAction::triggered, this, &FramelessWindow::onAbout);
    connect(m_titleBar->logOffAction(), &QAction::triggered, this, &FramelessWindow::onLogOff);
    connect(m_startCheck, &StartCheck::accountSetupNeeded, this, &FramelessWindow::openAccountSetupDialog);
    connect(m_startCheck, &StartCheck::loginNeeded, this, &FramelessWindow::openLoginDialog);
    connect(m_startCheck, &StartCheck::keyChanged, this, &FramelessWindow::onLocalKeyChanged);
    connect(m_startCheck, &StartCheck::runningChanged, m_welcome, &WelcomePage::setChecking);
    connect(m_welcome, &WelcomePage::loginRequested, this, &FramelessWindow::onLoginRequested);
    connect(m_idle, &IdleWatch::idle, this, &FramelessWindow::logoutIfIdle);
    connect(&Notifier::instance(), &Notifier::notificationClicked, this,
            &FramelessWindow::onNotificationClicked);
    connect(&SessionEvents::instance(), &SessionEvents::sessionLost, this, &FramelessWindow::onSessionLost);
    connect(&SessionEvents::instance(), &SessionEvents::keyChanged, this,
            &FramelessWindow::onServerKeyChanged);
    connectServiceManagement();
}

void FramelessWindow::connectServiceManagement() {
    connect(m_serviceManagement, &ServiceManagement::connectToOrbMessage, this,
            &FramelessWindow::connectToOrbMessage);
    connect(m_serviceManagement, &ServiceManagement::connectToOrbFinished, this,
            &FramelessWindow::connectToOrbFinished);
    connect(this, &FramelessWindow::connectToOrbMessage, this,
            [this](const QString &message, const QString &type) {
                TransientMessage::show(this, message,
                                       type == QLatin1String("loading") ? TransientMessage::Kind::Loading
                                                                        : TransientMessage::Kind::Plain);
            });
    connect(this, &FramelessWindow::connectToOrbFinished, this, [this] { TransientMessage::clear(this); });
    connect(m_serviceManagement, &ServiceManagement::serviceAdded, m_titleBar, &TitleBar::setServiceAdded);
}

QWidget *FramelessWindow::contentParent() const {
    return m_stack;
}

void FramelessWindow::setContent(MainWindow *content) {
    m_content = content;
    m_stack->addWidget(content);
    connect(content->deviceWindow(), &DeviceWindow::disconnectRequested, this, &FramelessWindow::onLogOff);
    connect(content->deviceWindow(), &DeviceWindow::remoteServerChosen, this,
            &FramelessWindow::onRemoteServerChosen);
    connect(content->deviceWindow(), &DeviceWindow::allTasksDone, this, &FramelessWindow::logoutIfIdle);
    // The frame is shown before, and somebody may have been quicker to log in.
    if (m_loggedIn)
        startContent();
}

void FramelessWindow::startContent() {
    m_stack->setCurrentWidget(m_content);
    m_content->startWork();
}

/// What the last run has left to say comes before the login.
void FramelessWindow::begin() {
    const QString report = CrashReport::takePending();
    if (report.isEmpty())
        return checkLoginDialog();
    auto *dialog = new CrashDialog(report, this);
    connect(dialog, &QDialog::finished, this, [this] {
        m_dialog = nullptr;
        checkLoginDialog();
    });
    showDialog(dialog);
}

void FramelessWindow::checkLoginDialog() {
    if (!m_dialog)
        return m_startCheck->start();
    m_dialog->raise();
    m_dialog->activateWindow();
}

/// Somebody who asks a second time does not want to wait for what is being found out.
void FramelessWindow::onLoginRequested() {
    if (!m_startCheck->isRunning())
        return checkLoginDialog();
    m_startCheck->abandon();
    openLoginDialog({});
}

void FramelessWindow::openLoginDialog(const QString &loginTip) {
    if (m_loggedIn || m_dialog)
        return;
    auto *dialog = new LoginDialog(loginTip, this);
    connect(dialog, &LoginDialog::loginSuccess, this, &FramelessWindow::onLoginSuccess);
    connect(dialog, &LoginDialog::serverKeyKept, this, &FramelessWindow::onServerKeyKept);
    connect(dialog, &LoginDialog::notRemembered, this, [this] {
        TransientMessage::show(this,
                               tr("You are logged in, but what you entered could not be saved for the next "
                                  "login. Look at whether the disk is full."),
                               TransientMessage::Kind::Error);
    });
    showDialog(dialog);
}

void FramelessWindow::openAccountSetupDialog() {
    if (m_loggedIn || m_dialog)
        return;
    auto *dialog = new AccountSetupDialog(this);
    connect(dialog, &AccountSetupDialog::accountCreated, this, &FramelessWindow::onAccountCreated);
    showDialog(dialog);
}

void FramelessWindow::showDialog(FramelessDialog *dialog) {
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    m_dialog = dialog;
    dialog->show();
}

void FramelessWindow::onAccountCreated() {
    if (m_dialog)
        m_dialog->close();
    m_dialog = nullptr;
    openLoginDialog({});
}

void FramelessWindow::onLoginSuccess() {
    m_loggedIn = true;
    m_titleBar->accountButton()->show();
    m_titleBar->helpButton()->show();
    if (m_content)
        startContent();
    if (m_dialog)
        m_dialog->close();
    m_dialog = nullptr;
    m_idle->start();
    m_serviceManagement->lookUp();
    m_notices->tellOfMissingKey();
}

void FramelessWindow::onAccontManagement() {
    auto *dialog = new AccountManagementDialog(this);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    connect(dialog, &QDialog::finished, this, [](int result) {
        qDebug(result == QDialog::Accepted ? "account management successfully!"
                                           : "account management failed!");
    });
    dialog->open();
}

void FramelessWindow::validateOrbServiceAdded() {
    m_serviceManagement->validateOrbServiceAdded();
}

void FramelessWindow::onAbout() {
    auto *dialog = new AboutDialog(this);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    dialog->open();
}

void FramelessWindow::on_helpButton_clicked() {
    openGuide(nullptr);
}

void FramelessWindow::openGuide(const QWidget *place) {
    QString page = UserGuide::pageFor(place);
    if (page.isEmpty() && m_loggedIn && m_content)
        page = UserGuide::pageFor(m_content->currentPage());
    if (!UserGuide::open(page))
        TransientMessage::show(this, tr("The user guide cannot be opened. It is installed with the program."),
                               TransientMessage::Kind::Error);
}

void FramelessWindow::onLogOff() {
    if (!m_loggedIn)
        return;
    confirmUnfinished([this] {
        endSession(Notice::TellService);
        checkLoginDialog();
    });
}

/// Whether a log-off would cut work that the service has not begun yet.
bool FramelessWindow::isTaskRequested() {
    return CTaskInfoPool::instance().hasRequestedTask() || UploadTaskMgr::instance().isBusy() ||
           ExeTaskMgr::instance().isBusy() || RolloutMgr::instance().isBusy();
}

bool FramelessWindow::hasUnfinishedWork() const {
    return m_loggedIn &&
           (isTaskRequested() || (m_content && (m_content->deviceWindow()->hasPendingEdits() ||
                                                m_content->settingWindow()->hasUnsavedEdits())));
}

/// Goes on at once, or when the user has agreed to leave behind what a log-off would lose: a task that was
/// requested and has not begun, changes of sites or of settings.
void FramelessWindow::confirmUnfinished(std::function<void()> goOn) {
    if (!hasUnfinishedWork())
        return goOn();
    if (m_unfinishedConfirm && m_unfinishedConfirm->isVisible())
        return m_unfinishedConfirm->raise();
    const auto kind = isTaskRequested()                              ? ConfirmDialog::Kind::UnfinishedTask
                      : m_content->deviceWindow()->hasPendingEdits() ? ConfirmDialog::Kind::UnsavedSites
                                                                     : ConfirmDialog::Kind::UnsavedSettings;
    m_unfinishedConfirm = new ConfirmDialog(kind, this);
    m_unfinishedConfirm->setAttribute(Qt::WA_DeleteOnClose);
    connect(m_unfinishedConfirm, &QDialog::accepted, this, std::move(goOn));
    m_unfinishedConfirm->open();
}

void FramelessWindow::closeEvent(QCloseEvent *event) {
    if (m_closeConfirmed || !hasUnfinishedWork())
        return QWidget::closeEvent(event);
    event->ignore();
    confirmUnfinished([this] {
        m_closeConfirmed = true;
        close();
    });
}

void FramelessWindow::onNotificationClicked(int type) {
    topWindow();
    if (m_loggedIn && m_content)
        m_content->sidePanel()->open(type == Notifier::Alarm ? SidePanel::Panel::Alarms
                                                             : SidePanel::Panel::Tasks);
}

void FramelessWindow::logoutIfIdle() {
    if (CTaskInfoPool::instance().hasRunningTask() || isTaskRequested())
        return;
    if (m_idle->wasActiveSinceLastTick() || !m_loggedIn)
        return;
    endSession(Notice::TellService);
    openLoginDialog(tr("Session Timeout"));
}

void FramelessWindow::onSessionLost() {
    if (!m_loggedIn)
        return;
    endSession(Notice::Silent);
    openLoginDialog(tr("Session Timeout"));
}

void FramelessWindow::onServerKeyKept(const QString &server) {
    const QString key = ServerKeys::readable(ServerKeys::instance().fingerprint(server));
    TransientMessage::show(
        this, server == ServerKeys::thisComputer
                  ? tr("The key of the service on this computer is remembered from now on: %1").arg(key)
                  : tr("The key of the server %1 is remembered from now on: %2").arg(server, key));
}

void FramelessWindow::onLocalKeyChanged(const QString &fingerprint) {
    if (m_loggedIn || m_dialog)
        return;
    const ServerKey remembered = ServerKeys::instance().find(ServerKeys::thisComputer).value_or(ServerKey());
    auto *dialog = new ServerKeyDialog(ServerKeys::thisComputer, remembered, fingerprint, this);
    connect(dialog, &QDialog::finished, this, [this, fingerprint](int result) {
        m_dialog = nullptr;
        if (result != QDialog::Accepted)
            return openLoginDialog(ServerKeyDialog::localKeyChangedText());
        ServerKeys::instance().trust(ServerKeys::thisComputer, fingerprint.toStdString());
        checkLoginDialog();
    });
    showDialog(dialog);
}

/// Whatever else is open waits: the session can do nothing until the question is answered.
void FramelessWindow::onServerKeyChanged(const QString &fingerprint) {
    const LoginInfo login = CLocalStore::instance().loginInfo();
    if (!m_loggedIn)
        return;
    ServerKey remembered = ServerKeys::instance().find(login.server).value_or(ServerKey());
    if (remembered.fingerprint != login.serverKey)
        remembered = {login.serverKey, {}, {}};
    auto *dialog = new ServerKeyDialog(login.server, remembered, fingerprint, this);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    dialog->setWindowModality(Qt::ApplicationModal);
    connect(dialog, &QDialog::finished, this, [this](int result) {
        SessionEvents::instance().answerKeyQuestion(result == QDialog::Accepted);
        if (result != QDialog::Accepted && m_loggedIn)
            TransientMessage::show(this, tr("The new key is not trusted. Nothing is sent to the server."),
                                   TransientMessage::Kind::Error);
    });
    dialog->show();
}

void FramelessWindow::onRemoteServerChosen(const QString &serverId) {
    const auto change = [this, serverId] {
        endSession(Notice::TellService);
        openLoginDialog({});
        if (auto *login = qobject_cast<LoginDialog *>(m_dialog))
            login->chooseServer(serverId);
    };
    // One question is enough, and the one that says what is lost says that the session ends as well.
    if (hasUnfinishedWork())
        return confirmUnfinished(change);
    auto *confirm = new ConfirmDialog(ConfirmDialog::Kind::SwitchServer, this);
    confirm->setAttribute(Qt::WA_DeleteOnClose);
    connect(confirm, &QDialog::accepted, this, [this, change] { confirmUnfinished(change); });
    confirm->open();
}

void FramelessWindow::endSession(Notice notice) {
    if (m_content)
        m_content->stopWork();
    // Dialogs of the session that is over go with it.
    for (QDialog *dialog : findChildren<QDialog *>())
        dialog->close();
    if (notice == Notice::TellService)
        tellLogOff();
    ServiceSession::end();
    CTaskInfoPool::instance().clear();
    m_loggedIn = false;
    m_idle->stop();
    m_titleBar->accountButton()->hide();
    m_titleBar->helpButton()->hide();
    m_serviceManagement->reset();
    TransientMessage::clear(this);
    m_stack->setCurrentWidget(m_welcome);
    emit didLogOff();
}

void FramelessWindow::tellLogOff() {
    // The stored session is cleared right after this, so the request takes its own copy along.
    const LoginInfo login = CLocalStore::instance().loginInfo();
    NetJob::post(
        NetJob::createRunner("onLogOff() in FramelessWindow", NetTask::Turn::Beside), this,
        [login] {
            ServiceSession::log(login);
            CApiClient client(login.address.toUtf8().constData(), login.port);
            client.setAccount(login.account.toUtf8().constData());
            client.setAccessToken(login.token.constData());
            client.expectServerKey(login.serverKey);
            return logOut(client, login);
        },
        [](unsigned result) {
            if (result != ApiOk)
                warnOfLogOff();
        },
        [](JobOutcome end) {
            if (end != JobOutcome::Delivered)
                warnOfLogOff();
        });
}
