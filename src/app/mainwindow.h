#pragma once

#include <QMainWindow>

class DeviceWindow;
class QButtonGroup;
class BadgeButton;
class QSplitter;
class QStackedWidget;
class QToolButton;
class SidePanel;

/// The frame's content: the pages, and the rail of buttons that lead to them.
class MainWindow : public QMainWindow {
    Q_OBJECT

public:
    explicit MainWindow(QWidget *parent = nullptr);
    ~MainWindow() override;

    DeviceWindow *deviceWindow() const { return m_deviceWindow; }
    SidePanel *sidePanel() const { return m_sidePanel; }

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QWidget *buildRail();
    BadgeButton *addRailButton(QWidget *rail, const char *name, const QString &icon, const QString &text);
    void connectPanels();
    void connectPostWork();
    void togglePanel(QToolButton *button);
    void showPanelButtons();

    QSplitter *m_splitter;
    QStackedWidget *m_pages;
    DeviceWindow *m_deviceWindow;
    SidePanel *m_sidePanel;
    QButtonGroup *m_navigation;
    BadgeButton *m_alarmButton = nullptr;
    BadgeButton *m_taskButton = nullptr;
};
