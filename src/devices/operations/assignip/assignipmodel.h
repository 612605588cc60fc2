#pragma once

#include "devices/operations/assignip/ipassignment.h"
#include "widgets/lists/checklistmodel.h"

/// The devices that are to get addresses, with the address that each has and the one it will get.
class AssignIpModel : public CheckListModel {
    Q_OBJECT

public:
    enum Column { ModelColumn, MacColumn, CurrentColumn, NewColumn, NoteColumn, columnTotal };

    AssignIpModel(OperationTargets::List targets, const DeviceSnapshot &managed, QObject *parent = nullptr);

    const OperationTargets::List &targets() const { return m_targets; }
    IpAssignment &assignment() { return m_assignment; }

    /// The checked devices in the order of the rows, those that the search hides among them.
    std::vector<int> checkedItems() const;

    /// Whether devices find addresses themselves, so that none can be shown or typed.
    void setAutomatic(bool automatic);
    /// The addresses are others now; warnings: what is wrong with them.
    void showAddresses(const std::vector<TargetWarning> &warnings);

    int columnCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    bool setData(const QModelIndex &index, const QVariant &value, int role) override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;

signals:
    /// An address was typed by hand.
    void addressTyped();
    /// What was typed is no address.
    void addressRefused(const QString &text);

protected:
    QString text(int item, int column) const override;
    std::vector<int> find(const QString &search) const override;
    int compare(int left, int right, int column, bool ascending) const override;

private:
    OperationTargets::List m_targets;
    IpAssignment m_assignment;
    std::vector<QString> m_notes;
    bool m_automatic = true;
};
