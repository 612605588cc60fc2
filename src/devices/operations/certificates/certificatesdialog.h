#pragma once

#include "devices/inventory/deviceinventory.h"
#include "widgets/dialogs/framelessdialog.h"

class CertificateListModel;
class QLabel;
class QLineEdit;
class QStackedWidget;
class QTableView;

/// All certificates that devices work with, for HTTPS and IEEE 802.1X, the next to expire first. A double
/// click, or the enter key, leads to the device.
class CertificatesDialog : public FramelessDialog {
    Q_OBJECT

public:
    explicit CertificatesDialog(const DeviceSnapshotPtr &devices, QWidget *parent = nullptr);

signals:
    void deviceChosen(const QString &deviceId);

private:
    QWidget *buildHead();
    QWidget *buildTable();
    QWidget *buildFooter();
    QLabel *addPage(const char *name, const QString &text);
    void choose(const QModelIndex &index);
    void showState();

    CertificateListModel *m_model;
    QStackedWidget *m_pages;
    QTableView *m_table = nullptr;
    QLineEdit *m_search = nullptr;
    QLabel *m_expired = nullptr;
    QLabel *m_empty = nullptr;
    QLabel *m_count = nullptr;
};
