#include "devices/page/devicemenus.h"

#include "devices/page/devicetoolbar.h"
#include "devices/page/mainconsolemenu.h"
#include "devices/page/mainconsoletable.h"
#include "widgets/controls/popupmenu.h"

#include <QClipboard>
#include <QCoreApplication>
#include <QGuiApplication>
#include <QHeaderView>

namespace DeviceMenus {

void showRowMenu(const DeviceToolBar *operations, MainConsoleTable *table, const QPoint &position) {
    auto *menu = new PopupMenu(table);
    menu->setAttribute(Qt::WA_DeleteOnClose);
    const QString cell = table->currentIndex().data(Qt::DisplayRole).toString().simplified();
    const auto copyCell = [cell] { QGuiApplication::clipboard()->setText(cell); };
    menu->addAction(QCoreApplication::translate("DeviceMenus", "Copy cell"), table, copyCell);
    menu->addAction(QCoreApplication::translate("DeviceMenus", "Copy rows"), table,
                    &MainConsoleTable::copySelection);
    menu->addSeparator();
    operations->addOperations(menu);
    menu->popup(position);
}

void showColumnMenu(MainConsoleTable *table, const QPoint &position) {
    auto *menu = new MainConsoleMenu(table->horizontalHeader(), table);
    menu->setAttribute(Qt::WA_DeleteOnClose);
    QObject::connect(menu, &MainConsoleMenu::resetRequested, table, &MainConsoleTable::resetColumns);
    menu->popup(position);
}

} // namespace DeviceMenus
