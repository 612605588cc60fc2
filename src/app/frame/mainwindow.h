#pragma once

#include <QMainWindow>
#include <QPointer>

#include <functional>

class ConfirmDialog;
class DeviceWindow;
class LogWindow;
class QButtonGroup;
class BadgeButton;
class QSplitter;
class QStackedWidget;
class QToolButton;
class SettingWindow;
class SidePanel;

/// The frame's content: the pages, and the rail of buttons that lead to them.
class MainWindow : public QMainWindow {
    Q_OBJECT

public:
    explicit MainWindow(QWidget *parent = nullptr);
    ~MainWindow() override;

    DeviceWindow *deviceWindow() const { return m_deviceWindow; }
    LogWindow *logWindow() const { return m_logWindow; }
    SettingWindow *settingWindow() const { return m_settingWindow; }
    SidePanel *sidePanel() const { return m_sidePanel; }
    QWidget *currentPage() const;

    /// Begins to work on the present session, on the device page.
    void startWork();
    /// Ends that and forgets everything that was shown.
    void stopWork();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    /// Pages by their places in the stack.
    enum Page { DevicePage, LogPage, SettingsPage };

    QWidget *buildRail();
    BadgeButton *addRailButton(QWidget *rail, const char *name, const QString &icon, const QString &text);
    void connectPages();
    void connectPanels();
    void connectPostWork();
    void connectFailedOperations();
    bool isTaskPanelOpen() const;
    void navigateTo(int page);
    void askToLeave(const std::function<void()> &discard);
    void showPage(int page);
    void togglePanel(QToolButton *button);
    void showPanelButtons();

    QSplitter *m_splitter;
    QStackedWidget *m_pages;
    DeviceWindow *m_deviceWindow;
    LogWindow *m_logWindow;
    SettingWindow *m_settingWindow;
    SidePanel *m_sidePanel;
    QButtonGroup *m_navigation;
    QPointer<ConfirmDialog> m_question;
    BadgeButton *m_alarmButton = nullptr;
    BadgeButton *m_taskButton = nullptr;
};
