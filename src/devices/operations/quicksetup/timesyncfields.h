#pragma once

#include "platform/json.h"

#include <QWidget>

#include <array>

class QComboBox;
class QDateTime;
class QLineEdit;

/// The fields for how devices get their time: once from this computer, or by time servers from then on.
class TimeSyncFields : public QWidget {
    Q_OBJECT

public:
    explicit TimeSyncFields(QWidget *parent = nullptr);

    /// Proposes what a device's record says; what it lacks stays as it is.
    void propose(const JSON &record);

    bool isByServers() const;

    /// What is wrong, with the field at fault focused; empty where nothing is.
    QString complain();

    /// Adds the settings as a quick setup takes them. clock: what the devices' clocks are to show now.
    void addTo(JSON &settings, const QDateTime &clock) const;

signals:
    void edited();

private:
    QWidget *buildServers();
    void showMode();
    void proposeInterval(int minutes);
    QString complain(QLineEdit *field, const QString &problem);

    QComboBox *m_mode;
    QWidget *m_serverPart = nullptr;
    std::array<QLineEdit *, 5> m_servers{};
    QComboBox *m_interval = nullptr;
};
