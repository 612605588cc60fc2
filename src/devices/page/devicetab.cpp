#include "devices/page/devicetab.h"

#include "devices/page/mainconsoletable.h"
#include "widgets/controls/statepage.h"
#include "widgets/controls/waitingspinner.h"

#include <QLabel>
#include <QPushButton>

DeviceTab::DeviceTab(DeviceClass deviceClass, const DeviceInventory *inventory, QWidget *parent)
    : QStackedWidget(parent),
      m_table(new MainConsoleTable(deviceClass, this)),
      m_siteHint(StatePage::text(tr("Drag devices from the \"Device Overview\""), "quiet")),
      m_emptyPage(makeEmptyPage()),
      m_noMatchPage(makeNoMatchPage()),
      m_loadingPage(makeLoadingPage()),
      m_failedPage(makeFailedPage()) {
    m_table->setInventory(inventory);
    for (QWidget *page :
         {static_cast<QWidget *>(m_table), m_emptyPage, m_noMatchPage, m_loadingPage, m_failedPage})
        addWidget(page);
    setCurrentWidget(m_loadingPage);
}

void DeviceTab::showContent(Content content, bool isSite) {
    m_siteHint->setVisible(isSite);
    if (content == Content::Loading)
        setCurrentWidget(m_loadingPage);
    else if (content == Content::Failed)
        setCurrentWidget(m_failedPage);
    else if (m_table->rowCount() > 0)
        setCurrentWidget(m_table);
    else
        setCurrentWidget(m_table->unfilteredCount() > 0 ? m_noMatchPage : m_emptyPage);
}

QWidget *DeviceTab::makeEmptyPage() {
    auto *add = new QPushButton(tr("Add Device"));
    add->setObjectName(QStringLiteral("emptyAddDeviceButton"));
    connect(add, &QPushButton::clicked, this, &DeviceTab::addDeviceRequested);
    m_siteHint->setObjectName(QStringLiteral("siteHintLabel"));
    return StatePage::make("emptyPage", {StatePage::picture(QStringLiteral(":/images/empty_devices.svg")),
                                         StatePage::text(tr("No Device"), "heading"), m_siteHint, add});
}

QWidget *DeviceTab::makeNoMatchPage() {
    auto *clear = new QPushButton(tr("Clear filter"));
    clear->setObjectName(QStringLiteral("clearFilterButton"));
    connect(clear, &QPushButton::clicked, this, &DeviceTab::clearFilterRequested);
    return StatePage::make(
        "noMatchPage",
        {StatePage::picture(QStringLiteral(":/images/empty_search.svg")),
         StatePage::text(tr("No device matches"), "heading"),
         StatePage::text(tr("Search and status chips leave no device of this tab."), "quiet"), clear});
}

QWidget *DeviceTab::makeLoadingPage() {
    return StatePage::make("loadingPage",
                           {new WaitingSpinner, StatePage::text(tr("Loading devices..."), "quiet")});
}

QWidget *DeviceTab::makeFailedPage() {
    return StatePage::make("failedPage",
                           {StatePage::text(tr("The device list could not be read"), "heading"),
                            StatePage::text(tr("It is read again as soon as the server answers."), "quiet")});
}
