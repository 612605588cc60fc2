#pragma once

#include <QDateTime>
#include <QWidget>

class QDateTimeEdit;
class QLabel;
class QRadioButton;

/// Whether something is to be done now or at a time of this computer's clock, whose zone it names.
class ScheduleField : public QWidget {
    Q_OBJECT

public:
    explicit ScheduleField(QWidget *parent = nullptr);

    bool isScheduled() const;
    void setScheduled(bool scheduled);
    void setTime(const QDateTime &time);

    /// Unix ms of the time, 0 for now.
    qint64 time() const;
    /// Why the time is none to begin at, as a sentence; empty where it is good.
    QString problem() const;

    /// The zone of a time, as in "Europe/Vienna (UTC+1)".
    static QString zoneText(const QDateTime &time);

signals:
    void changed();

private:
    QDateTime chosen() const;
    void onChanged();

    QRadioButton *m_now;
    QRadioButton *m_at;
    QDateTimeEdit *m_time;
    QLabel *m_zone;
};
