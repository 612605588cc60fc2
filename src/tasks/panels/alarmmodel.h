#pragma once

#include "tasks/service/alarmrecord.h"

#include <QAbstractListModel>
#include <QSet>

class AlarmReadHistory;

/// The alarms of the service, newest first.
class AlarmModel : public QAbstractListModel {
    Q_OBJECT

public:
    /// The history must outlive the model.
    explicit AlarmModel(const AlarmReadHistory &history, QObject *parent = nullptr);

    /// Takes a new list over; rows that stay keep their selection.
    void setAlarms(const AlarmList &alarms);

    const AlarmList &alarms() const { return m_alarms; }
    const AlarmRecord &alarmOf(const QModelIndex &index) const;

    /// Unread alarms keep their mark after they count as read, until the marks are cleared: one wants to see
    /// what is new.
    void keepMarks();
    void clearMarks();
    bool isMarked(const QModelIndex &index) const;

    int rowCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role) const override;

private:
    const AlarmReadHistory &m_history;
    AlarmList m_alarms;
    QSet<QString> m_marks;
};
