#pragma once

#include "devices/inventory/deviceinventory.h"
#include "devices/page/refreshdevicedialog.h"

#include <QObject>
#include <QPointer>

/// Reads the states of all devices behind a dialog, as the user or a regained server asks for it.
/// User-interface thread.
class StateRefresh : public QObject {
    Q_OBJECT

public:
    /// over: the window that the dialog stands over; the object is its child. Both outlive the object.
    StateRefresh(const DeviceInventory &inventory, QWidget *over);

    /// Does nothing while a refresh is open.
    void open();
    void close();
    bool isOpen() const { return m_dialog; }

signals:
    void statesRead(const DeviceStatusUpdate &update);
    void failed(const QString &message);
    /// The dialog has closed, however the refresh went.
    void ended();

private:
    void onRefreshAll();
    bool onRefreshDevice(const QPointer<RefreshDeviceDialog> &dialog);

    const DeviceInventory &m_inventory;
    QWidget *m_over;
    QPointer<RefreshDeviceDialog> m_dialog;
};
