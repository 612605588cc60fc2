#pragma once

#include <QObject>

#include <memory>

class ToastPresenter;

/// Messages on the desktop about alarms and tasks. User-interface thread.
class Notifier : public QObject {
    Q_OBJECT

public:
    enum NOTIFICATION_TYPE { Alarm = 0, Task = 1 };
    Q_ENUM(NOTIFICATION_TYPE)

    static Notifier &instance();

    /// Shows a message of one line, unless its kind is switched off. type: a NOTIFICATION_TYPE. A message
    /// takes the place of an earlier one of the same subject.
    void ShowMessage(const QString &text, int type, const QString &subject = {});

    void setEnabled(bool alarms, bool tasks);

    /// Lets tests stand in for the desktop.
    void setPresenter(std::unique_ptr<ToastPresenter> presenter);

signals:
    /// The user wants to see what a message was about.
    void notificationClicked(NOTIFICATION_TYPE i_notification_type);

private:
    Notifier();
    ~Notifier() override;

    std::unique_ptr<ToastPresenter> m_presenter;
    bool m_alarmsEnabled = true;
    bool m_tasksEnabled = true;
};
