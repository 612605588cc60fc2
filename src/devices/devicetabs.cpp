#include "devicetabs.h"

#include "consolecorner.h"
#include "deviceinventory.h"
#include "devicemenus.h"
#include "devicesearch.h"
#include "mainconsoletable.h"

#include <QToolButton>

DeviceTabs::DeviceTabs(const DeviceInventory &inventory, QWidget *parent)
    : CountedTabWidget(parent), m_inventory(inventory), m_corner(new ConsoleCorner(this)) {
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
    connect(table, &MainConsoleTable::selectedDevicesChanged, this, &DeviceTabs::selectionChanged);
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

void DeviceTabs::refill() {
    for (const DeviceTab *tab : m_tabs)
        tab->table()->refill();
    showCounts();
}

void DeviceTabs::refreshStatus() {
    for (const DeviceTab *tab : m_tabs)
        tab->table()->refreshStatus();
    showCounts();
}

void DeviceTabs::setSite(const QString &siteId) {
    for (const DeviceTab *tab : m_tabs)
        tab->table()->setSite(siteId);
    showCounts();
}

void DeviceTabs::setSearch(const DeviceSearch &search) {
    for (const DeviceTab *tab : m_tabs)
        tab->table()->setSearch(search);
    showCounts();
}

void DeviceTabs::setStatusFilter(std::optional<DeviceStatusGroup> status) {
    for (const DeviceTab *tab : m_tabs)
        tab->table()->setStatusFilter(status);
    showCounts();
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
