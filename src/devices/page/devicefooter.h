#pragma once

#include "devices/inventory/deviceinventory.h"

#include <QElapsedTimer>
#include <QFrame>
#include <QTimer>

#include <array>
#include <optional>

class QLabel;
class QToolButton;

/// The line below the tables: how many devices are selected, how they are, and how old that knowledge is.
class DeviceFooter : public QFrame {
    Q_OBJECT

public:
    explicit DeviceFooter(QWidget *parent = nullptr);

    /// all: the devices there were without search and status filter.
    void setSelection(int selected, int shown, int all);
    /// Counts the states of those devices of the inventory.
    void setStatuses(const DeviceInventory &inventory, const std::vector<int> &devices);
    /// Releases the chip that is pressed.
    void clearStatusFilter();
    /// The states were read just now.
    void markUpdated();
    /// Nothing is known; the age is not told.
    void clear();

signals:
    /// A chip was pressed or released.
    void statusFilterChanged(std::optional<DeviceStatusGroup> status);

private:
    void addChip(DeviceStatusGroup group, const char *name);
    void showAge();

    QLabel *m_selection;
    std::array<QToolButton *, deviceStatusGroupCount> m_chips{};
    QLabel *m_age;
    QElapsedTimer m_updated;
    QTimer m_everySecond;
};
