#pragma once

#include "api/session/nettask.h"

#include <QPointer>
#include <QWidget>

#include <functional>

class IdleWatch;
class LocalNotices;
class FramelessDialog;
class LoginDialog;
class MainWindow;
class QStackedWidget;
class ServiceManagement;
class StartCheck;
class TitleBar;
class WelcomePage;

/// The program's outer window: title bar, account menu, and the life of the login session.
class FramelessWindow : public QWidget {
    Q_OBJECT

public:
    explicit FramelessWindow(QWidget *parent = nullptr);
    /// Ends the session on the service too, and waits for the answer for a few seconds at most.
    ~FramelessWindow() override;

    /// The parent for the main window to be made with, which spares styling it twice.
    QWidget *contentParent() const;
    /// Takes the main window over as the frame's content.
    void setContent(MainWindow *content);

    IdleWatch *idleWatch() const { return m_idle; }
    bool isLoggedIn() const { return m_loggedIn; }

public slots:
    void setWindowTitle(const QString &title);
    void setWindowIcon(const QIcon &icon);
    /// Brings the window to the front.
    void topWindow();

    void on_applicationStateChanged(Qt::ApplicationState state);
    void on_minimizeButton_clicked();
    void on_restoreButton_clicked();
    void on_maximizeButton_clicked();
    void on_closeButton_clicked();
    void on_windowTitlebar_doubleClicked();

    /// Decides what the user sees first while nobody is logged in.
    void checkLoginDialog();
    void openLoginDialog(const QString &loginTip);
    void onLoginSuccess();
    void onAccountCreated();
    void onAccontManagement();
    /// Opens the dialog about the remote-access service that fits.
    void validateOrbServiceAdded();
    void onAbout();
    /// Shows the guide's page about what is open.
    void on_helpButton_clicked();
    /// Ends the session and shows the login dialog.
    void onLogOff();
    /// Logs off unless somebody was active since the idle timer's last tick.
    void logoutIfIdle();

signals:
    /// A transient message to be shown until connectToOrbFinished; 0 stands for the usual time and width.
    void connectToOrbMessage(const QString &i_message, const QString &i_dialog_type, int i_timeout,
                             int i_dialog_width);
    void connectToOrbFinished();
    void didLogOff();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;
    void closeEvent(QCloseEvent *event) override;
    void changeEvent(QEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;

private:
    enum class Notice { TellService, Silent };

    void buildLayout();
    void moveToScreenCentre();
    void connectParts();
    void connectServiceManagement();
    void probeLocalService();
    static bool isTaskRequested();
    bool hasUnfinishedWork() const;
    void confirmUnfinished(std::function<void()> goOn);
    void endSession(Notice notice);
    void tellLogOff();
    void openAccountSetupDialog();
    void onSessionLost();
    void onServerKeyKept(const QString &server);
    void onLocalKeyChanged(const QString &fingerprint);
    void onServerKeyChanged(const QString &fingerprint);
    void onNotificationClicked(int type);
    void onRemoteServerChosen(const QString &serverId);
    void showDialog(FramelessDialog *dialog);
    void startContent();
    void begin();
    void onLoginRequested();
    void openGuide(const QWidget *place);
    Qt::Edges edgesAt(const QPoint &position) const;

    TitleBar *m_titleBar;
    QStackedWidget *m_stack;
    WelcomePage *m_welcome;
    MainWindow *m_content = nullptr;
    QPointer<FramelessDialog> m_unfinishedConfirm;
    QPointer<FramelessDialog> m_dialog; ///< the login or account set-up dialog that is shown
    StartCheck *m_startCheck;
    ServiceManagement *m_serviceManagement;
    IdleWatch *m_idle;
    LocalNotices *m_notices;
    bool m_loggedIn = false;
    bool m_closeConfirmed = false;
};
