#pragma once

#include <QMainWindow>

class DeviceWindow;
class QButtonGroup;
class QStackedWidget;
class QToolButton;

/// The frame's content: the pages, and the rail of buttons that lead to them.
class MainWindow : public QMainWindow {
    Q_OBJECT

public:
    explicit MainWindow(QWidget *parent = nullptr);
    ~MainWindow() override;

    DeviceWindow *deviceWindow() const { return m_deviceWindow; }

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QWidget *buildRail();
    QToolButton *addRailButton(QWidget *rail, const char *name, const QString &icon, const QString &text);

    QStackedWidget *m_pages;
    DeviceWindow *m_deviceWindow;
    QButtonGroup *m_navigation;
};
