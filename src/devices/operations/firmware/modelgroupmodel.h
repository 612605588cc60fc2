#pragma once

#include "devices/operations/firmware/firmwareheader.h"
#include "devices/operations/firmware/modelgroups.h"
#include "widgets/lists/checklistmodel.h"

/// The models among the targets of an upload, each with a check mark and whether the image is for it. A group
/// is checked while any of its targets is.
class ModelGroupModel : public CheckListModel {
    Q_OBJECT

public:
    using CheckListModel::CheckListModel;

    void setGroups(std::vector<ModelGroup> groups);
    const std::vector<ModelGroup> &groups() const { return m_groups; }

    /// Takes over which targets are ticked.
    void setTicked(const std::vector<int> &targets);
    /// isKnown: whether there is an image at all.
    void setImage(const FirmwareHeader &head, bool isKnown);
    FirmwareHeader::Fit fitOf(std::size_t group) const;

    int columnCount(const QModelIndex &parent = {}) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    /// The mark of a group follows its targets, so a click on it only asks for them.
    bool setData(const QModelIndex &index, const QVariant &value, int role) override;

signals:
    /// The user wants the targets of a group ticked or unticked.
    void groupToggled(int group, bool checked);

protected:
    QString text(int item, int column) const override;
    std::vector<int> find(const QString &search) const override;
    int compare(int left, int right, int column, bool ascending) const override;

private:
    const ModelGroup &group(int item) const { return m_groups[static_cast<std::size_t>(item)]; }
    int tickedIn(int item) const { return m_ticked[static_cast<std::size_t>(item)]; }
    QString countText(int item) const;
    QString fitText(int item) const;

    std::vector<ModelGroup> m_groups;
    std::vector<int> m_ticked; ///< how many targets of a group are
    FirmwareHeader m_head;
    bool m_hasImage = false;
};
