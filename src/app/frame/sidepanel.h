#pragma once

#include <QFrame>

class AlarmPanel;
class BadgeButton;
class QStackedWidget;
class QToolButton;
class TaskPanel;

/// The frame of the alarm and the task panel, of which it shows one.
class SidePanel : public QFrame {
    Q_OBJECT

public:
    enum class Panel { Alarms, Tasks };

    explicit SidePanel(QWidget *parent = nullptr);

    void open(Panel panel);
    Panel current() const;

    AlarmPanel *alarmPanel() const { return m_alarms; }

    void setUnreadCount(int count);

signals:
    /// Another panel is shown, or none.
    void changed();

protected:
    void showEvent(QShowEvent *event) override;
    void hideEvent(QHideEvent *event) override;

private:
    QWidget *buildHeader();
    BadgeButton *addTab(QWidget *header, const char *name, const QString &text, Panel panel);
    void showTabs();

    QStackedWidget *m_stack;
    AlarmPanel *m_alarms;
    TaskPanel *m_tasks;
    BadgeButton *m_alarmTab = nullptr;
    BadgeButton *m_taskTab = nullptr;
};
