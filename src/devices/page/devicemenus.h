#pragma once

class DeviceToolBar;
class MainConsoleTable;
class QPoint;

/// The context menus of the device tables; they delete themselves.
namespace DeviceMenus {

/// Copying, and the operations that can be begun now. Global position.
void showRowMenu(const DeviceToolBar *operations, MainConsoleTable *table, const QPoint &position);

void showColumnMenu(MainConsoleTable *table, const QPoint &position);

} // namespace DeviceMenus
