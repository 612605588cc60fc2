#include "devicetab.h"

#include "icons.h"
#include "mainconsoletable.h"
#include "waitingspinner.h"

#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace {

QLabel *centredLabel(const QString &text, const char *role) {
    auto *label = new QLabel(text);
    label->setTextFormat(Qt::PlainText);
    label->setAlignment(Qt::AlignCenter);
    label->setProperty("role", QLatin1String(role));
    return label;
}

QLabel *picture(const QString &resource) {
    auto *label = new QLabel;
    label->setAlignment(Qt::AlignCenter);
    label->setPixmap(Icons::pixmap(resource, {160, 120}, 2.0));
    return label;
}

/// A page with its parts one below the other, in the middle.
QWidget *makePage(const char *name, std::initializer_list<QWidget *> parts) {
    auto *page = new QWidget;
    page->setObjectName(QLatin1String(name));
    auto *layout = new QVBoxLayout(page);
    layout->setSpacing(12);
    layout->addStretch();
    for (QWidget *part : parts)
        layout->addWidget(part, 0, Qt::AlignHCenter);
    layout->addStretch();
    return page;
}

} // namespace

DeviceTab::DeviceTab(DeviceClass deviceClass, const DeviceInventory *inventory, QWidget *parent)
    : QStackedWidget(parent),
      m_table(new MainConsoleTable(deviceClass, this)),
      m_siteHint(centredLabel(tr("Drag devices from the \"Device Overview\""), "quiet")),
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
    return makePage("emptyPage", {picture(QStringLiteral(":/images/empty_devices.svg")),
                                  centredLabel(tr("No Device"), "heading"), m_siteHint, add});
}

QWidget *DeviceTab::makeNoMatchPage() {
    auto *clear = new QPushButton(tr("Clear filter"));
    clear->setObjectName(QStringLiteral("clearFilterButton"));
    connect(clear, &QPushButton::clicked, this, &DeviceTab::clearFilterRequested);
    return makePage("noMatchPage",
                    {picture(QStringLiteral(":/images/empty_search.svg")),
                     centredLabel(tr("No device matches"), "heading"),
                     centredLabel(tr("Search and status chips leave no device of this tab."), "quiet"),
                     clear});
}

QWidget *DeviceTab::makeLoadingPage() {
    return makePage("loadingPage", {new WaitingSpinner, centredLabel(tr("Loading devices..."), "quiet")});
}

QWidget *DeviceTab::makeFailedPage() {
    return makePage("failedPage",
                    {centredLabel(tr("The device list could not be read"), "heading"),
                     centredLabel(tr("It is read again as soon as the server answers."), "quiet")});
}
