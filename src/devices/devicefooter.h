#pragma once

#include "deviceinventory.h"

#include <QElapsedTimer>
#include <QFrame>
#include <QTimer>

class QLabel;

/// The line below the tables: how many devices are selected, how they are, and how old that knowledge is.
class DeviceFooter : public QFrame {
    Q_OBJECT

public:
    explicit DeviceFooter(QWidget *parent = nullptr);

    void setSelection(int selected, int shown);
    /// Counts the states of those devices of the inventory that are shown.
    void setStatuses(const DeviceInventory &inventory, const std::vector<int> &shown);
    /// The states were read just now.
    void markUpdated();
    /// Nothing is known; the age is not told.
    void clear();

private:
    void showAge();

    QLabel *m_selection;
    QLabel *m_statuses;
    QLabel *m_age;
    QElapsedTimer m_updated;
    QTimer m_everySecond;
};
