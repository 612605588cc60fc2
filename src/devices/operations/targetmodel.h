#pragma once

#include "devices/operations/operationtargets.h"
#include "widgets/lists/checklistmodel.h"

/// The targets of an operation, each with a check mark and what speaks against it.
class TargetModel : public CheckListModel {
    Q_OBJECT

public:
    explicit TargetModel(QObject *parent = nullptr) : CheckListModel(parent) {}

    /// Takes other targets, all of them checked.
    void setTargets(OperationTargets::List targets);

    const OperationTargets::List &targets() const { return m_targets; }
    const OperationTarget &target(int item) const { return m_targets[static_cast<std::size_t>(item)]; }

    /// The targets that are checked, in the order in which they were given.
    std::vector<int> checkedItems() const;
    QStringList checkedIds() const;

    void setWarnings(const std::vector<TargetWarning> &warnings);

    int columnCount(const QModelIndex &parent = {}) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

protected:
    QString text(int item, int column) const override;
    std::vector<int> find(const QString &search) const override;
    int compare(int left, int right, int column, bool ascending) const override;

private:
    OperationTargets::List m_targets;
    std::vector<QString> m_notes;
};
