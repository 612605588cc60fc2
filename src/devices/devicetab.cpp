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

} // namespace

DeviceTab::DeviceTab(DeviceClass deviceClass, const DeviceInventory *inventory, QWidget *parent)
    : QStackedWidget(parent),
      m_table(new MainConsoleTable(deviceClass, this)),
      m_siteHint(centredLabel(tr("Drag devices from the \"Device Overview\""), "quiet")),
      m_emptyPage(makeEmptyPage()),
      m_loadingPage(makeLoadingPage()),
      m_failedPage(makeFailedPage()) {
    m_table->setInventory(inventory);
    for (QWidget *page : {static_cast<QWidget *>(m_table), m_emptyPage, m_loadingPage, m_failedPage})
        addWidget(page);
    setCurrentWidget(m_loadingPage);
}

void DeviceTab::showContent(Content content, bool isSite) {
    m_siteHint->setVisible(isSite);
    if (content == Content::Loading)
        setCurrentWidget(m_loadingPage);
    else if (content == Content::Failed)
        setCurrentWidget(m_failedPage);
    else
        setCurrentWidget(m_table->rowCount() > 0 ? static_cast<QWidget *>(m_table) : m_emptyPage);
}

QWidget *DeviceTab::makeEmptyPage() {
    auto *page = new QWidget;
    page->setObjectName(QStringLiteral("emptyPage"));
    auto *add = new QPushButton(tr("Add Device"));
    add->setObjectName(QStringLiteral("emptyAddDeviceButton"));
    add->setEnabled(false);
    connect(add, &QPushButton::clicked, this, &DeviceTab::addDeviceRequested);
    m_siteHint->setObjectName(QStringLiteral("siteHintLabel"));
    auto *layout = new QVBoxLayout(page);
    layout->setSpacing(12);
    layout->addStretch();
    layout->addWidget(picture(QStringLiteral(":/images/empty_devices.svg")));
    layout->addWidget(centredLabel(tr("No Device"), "heading"));
    layout->addWidget(m_siteHint);
    layout->addWidget(add, 0, Qt::AlignHCenter);
    layout->addStretch();
    return page;
}

QWidget *DeviceTab::makeLoadingPage() {
    auto *page = new QWidget;
    page->setObjectName(QStringLiteral("loadingPage"));
    auto *layout = new QVBoxLayout(page);
    layout->setSpacing(12);
    layout->addStretch();
    layout->addWidget(new WaitingSpinner, 0, Qt::AlignHCenter);
    layout->addWidget(centredLabel(tr("Loading devices..."), "quiet"));
    layout->addStretch();
    return page;
}

QWidget *DeviceTab::makeFailedPage() {
    auto *page = new QWidget;
    page->setObjectName(QStringLiteral("failedPage"));
    auto *layout = new QVBoxLayout(page);
    layout->setSpacing(12);
    layout->addStretch();
    layout->addWidget(centredLabel(tr("The device list could not be read"), "heading"));
    layout->addWidget(centredLabel(tr("It is read again as soon as the server answers."), "quiet"));
    layout->addStretch();
    return page;
}
