#pragma once

#include "devices/inventory/devicerecord.h"

#include <QStackedWidget>

class DeviceInventory;
class MainConsoleTable;
class QLabel;
class QPushButton;

/// One tab of the console: a device table, or in its place why there is nothing to show.
class DeviceTab : public QStackedWidget {
    Q_OBJECT

public:
    enum class Content {
        Loading, ///< nothing was read yet
        Failed,  ///< the first reading has failed
        Read     ///< the table, or that there is no device
    };

    DeviceTab(DeviceClass deviceClass, const DeviceInventory *inventory, QWidget *parent = nullptr);

    MainConsoleTable *table() const { return m_table; }

    /// Shows the right page for what is known of the devices; isSite: a site is shown, not the overview.
    void showContent(Content content, bool isSite);

signals:
    void addDeviceRequested();
    void clearFilterRequested();

private:
    QWidget *makeEmptyPage();
    QWidget *makeNoMatchPage();
    QWidget *makeLoadingPage();
    QWidget *makeFailedPage();

    MainConsoleTable *m_table;
    QLabel *m_siteHint;
    QWidget *m_emptyPage;
    QWidget *m_noMatchPage;
    QWidget *m_loadingPage;
    QWidget *m_failedPage;
};
