#include "devices/page/devicetabs.h"

#include "devices/inventory/deviceinventory.h"
#include "devices/inventory/devicesearch.h"
#include "devices/page/devicemenus.h"
#include "devices/page/devicetabscorner.h"
#include "devices/page/mainconsoletable.h"

#include <QToolButton>

DeviceTabs::DeviceTabs(const DeviceInventory &inventory, QWidget *parent)
    : CountedTabWidget(parent), m_inventory(inventory), m_corner(new DeviceTabsCorner(this)) {
    setObjectName(QStringLiteral("deviceTabs"));
    addTable(DeviceClass::Camera, tr("Camera"), "cameraTable");
    addTable(DeviceClass::Nvr, tr("NVR"), "nvrTable");
    addTable(DeviceClass::Others, tr("Others"), "othersTable");
    setCornerWidget(m_corner);
    for (const DeviceTab *tab : m_tabs)
        tab->table()->keepColumns();
    connect(this, &QTabWidget::currentChanged, this, &DeviceTabs::selectionChanged);
    connect(m_corner->columnsButton(), &QToolButton::clicked, this, [this] {
        const QWidget *button = m_corner->columnsButton();
        DeviceMenus::showColumnMenu(currentTable(), button->mapToGlobal(QPoint(0, button->height())));
    });
    showCounts();
}

void DeviceTabs::addTable(DeviceClass deviceClass, const QString &title, const char *name) {
    auto *tab = new DeviceTab(deviceClass, &m_inventory, pageParent());
    MainConsoleTable *table = tab->table();
    table->setObjectName(QLatin1String(name));
    table->setAccessibleName(title);
    addTab(tab, title);
    m_tabs.push_back(tab);
    connect(table, &MainConsoleTable::selectedDevicesChanged, this, [this] {
        m_selectionChanged = true;
        if (!m_changing)
            emit selectionChanged();
    });
    connect(table, &MainConsoleTable::deleteRequested, this, &DeviceTabs::deleteRequested);
    connect(table, &MainConsoleTable::rowMenuRequested, this,
            [this, table](const QPoint &position) { emit rowMenuRequested(table, position); });
    connect(table, &MainConsoleTable::columnMenuRequested, this,
            [table](const QPoint &position) { DeviceMenus::showColumnMenu(table, position); });
    connect(tab, &DeviceTab::addDeviceRequested, this, &DeviceTabs::addDeviceRequested);
    connect(tab, &DeviceTab::clearFilterRequested, this, &DeviceTabs::clearFilterRequested);
}

MainConsoleTable *DeviceTabs::currentTable() const {
    return m_tabs[static_cast<std::size_t>(currentIndex())]->table();
}

/// Changes one table after the other. Nobody hears of it before the last one: until then, tables hold places
/// in different readings.
template <typename Change>
void DeviceTabs::changeTables(const Change &change) {
    m_changing = true;
    m_selectionChanged = false;
    for (const DeviceTab *tab : m_tabs)
        change(tab->table());
    m_changing = false;
    showCounts();
}

void DeviceTabs::refill() {
    changeTables([](MainConsoleTable *table) { table->refill(); });
    emit selectionChanged();
}

void DeviceTabs::refreshStatus() {
    changeTables([](MainConsoleTable *table) { table->refreshStatus(); });
    if (m_selectionChanged)
        emit selectionChanged();
}

void DeviceTabs::setSite(const QString &siteId) {
    changeTables([&](MainConsoleTable *table) { table->setSite(siteId); });
    emit selectionChanged();
}

void DeviceTabs::setSearch(const DeviceSearch &search) {
    changeTables([&](MainConsoleTable *table) { table->setSearch(search); });
    emit selectionChanged();
}

void DeviceTabs::setStatusFilter(std::optional<DeviceStatusGroup> status) {
    changeTables([&](MainConsoleTable *table) { table->setStatusFilter(status); });
    emit selectionChanged();
}

void DeviceTabs::showContent(DeviceTab::Content content, bool isSite) {
    for (DeviceTab *tab : m_tabs)
        tab->showContent(content, isSite);
}

bool DeviceTabs::selectDevice(int place) {
    setCurrentIndex(static_cast<int>(m_inventory.record(place).deviceClass));
    return currentTable()->selectDevice(place);
}

void DeviceTabs::showCounts() {
    for (int i = 0; i < count(); ++i)
        setCount(i, m_tabs[static_cast<std::size_t>(i)]->table()->rowCount());
}
