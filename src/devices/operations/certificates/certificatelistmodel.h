#pragma once

#include "devices/operations/certificates/certificatelist.h"

#include <QAbstractTableModel>

/// The certificates in use as a table that a search narrows and any column sorts. It is arranged on a runner
/// and shows the former rows until that is done.
class CertificateListModel : public QAbstractTableModel {
    Q_OBJECT

public:
    using QAbstractTableModel::QAbstractTableModel;

    /// Gathers the certificates of the devices. now: Unix ms, what their dates are compared with.
    void gather(const DeviceSnapshotPtr &devices, qint64 now);
    void setSearch(const QString &text);

    int total() const { return m_list ? static_cast<int>(m_list->size()) : 0; }
    int expiredCount() const { return m_expired; }
    /// Those that expire soon.
    int soonCount() const { return m_soon; }
    const CertificateInUse &at(int row) const;

    int rowCount(const QModelIndex &parent = {}) const override;
    int columnCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    void sort(int column, Qt::SortOrder order) override;

signals:
    /// The rows are those that were asked for last.
    void arranged();
    /// They could not be arranged.
    void failed();

private:
    struct Arrangement;

    CertificateValidity validityOf(const CertificateInUse &certificate) const;
    QString text(const CertificateInUse &certificate, CertificateColumn column) const;
    void arrange();
    void show(Arrangement arrangement);

    DeviceSnapshotPtr m_devices; ///< those whose certificates are still to be gathered
    CertificateList::ListPtr m_list;
    std::vector<int> m_order; ///< places in the list of the rows
    QString m_search;
    qint64 m_now = 0;
    int m_expired = 0;
    int m_soon = 0;
    CertificateColumn m_column = CertificateColumn::Expires;
    Qt::SortOrder m_sortOrder = Qt::AscendingOrder;
    int m_asked = 0; ///< how often an arrangement was asked for; only the last one counts
};
