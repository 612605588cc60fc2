#pragma once

#include "tasks/notify/alarmannouncer.h"
#include "tasks/panels/alarmreadhistory.h"

#include <QWidget>

class AlarmModel;
class ListActions;
class PanelPage;
class QAction;
class QLabel;
class QListView;
class QToolButton;

/// The alarms of the service, and which of them the user has not seen yet.
class AlarmPanel : public QWidget {
    Q_OBJECT

public:
    explicit AlarmPanel(QWidget *parent = nullptr);
    ~AlarmPanel() override;

signals:
    void alarmUnreadCountUpdated(int count);
    /// The user has chosen an alarm that is about a device.
    void deviceChosen(const QString &deviceId, const QString &ip);

protected:
    void showEvent(QShowEvent *event) override;
    void hideEvent(QHideEvent *event) override;

private:
    void buildList();
    QWidget *buildHeader();
    void connectParts();

    void onAlarmListUpdated();
    void onAlarmListFailed();
    void onCleared();
    void onChosen(const QModelIndex &index);

    void openHistory();
    void markSeen();
    void tellUnread();
    void showPage();
    void showActions();
    void copySelected();
    void deleteSelected();
    void deleteAll();

    AlarmReadHistory m_history;
    AlarmModel *m_model;
    ListActions *m_actions;
    PanelPage *m_page;
    QListView *m_list;
    QLabel *m_stale;
    QAction *m_copy;
    QAction *m_delete;
    QToolButton *m_deleteAll = nullptr;
    AlarmAnnouncer m_announcer;
    bool m_historyOpen = false;
};
