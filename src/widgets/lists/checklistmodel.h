#pragma once

#include <QAbstractTableModel>

#include <vector>

/// Items with a check mark each, which a search narrows and any column sorts. The items themselves are the
/// derived class's, named by their places from 0; rows are those that the search leaves, in the sorted order.
class CheckListModel : public QAbstractTableModel {
    Q_OBJECT

public:
    using QAbstractTableModel::QAbstractTableModel;

    bool isChecked(int item) const { return m_checked[static_cast<std::size_t>(item)]; }
    int checkedCount() const { return m_checkedCount; }
    int itemCount() const { return static_cast<int>(m_checked.size()); }

    /// Checks or unchecks some items.
    void setChecked(const std::vector<int> &items, bool checked);
    /// The same for all rows that the search leaves.
    void setShownChecked(bool checked);
    /// What a check box for all shown rows says.
    Qt::CheckState shownState() const;

    /// Shows the items alone that match the text.
    void setSearch(const QString &text);

    /// All items in the order of the rows, those that the search hides among them.
    std::vector<int> sortedItems() const;
    /// The item in a row.
    int itemAt(int row) const { return m_order[static_cast<std::size_t>(row)]; }

    int rowCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    bool setData(const QModelIndex &index, const QVariant &value, int role) override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    /// Column -1 leaves the items in the order in which they came.
    void sort(int column, Qt::SortOrder order) override;

signals:
    /// Items or check marks are others now, or the search shows others.
    void changed();

protected:
    /// Tells that there are as many items now. Those that were there keep their marks, new ones get the given
    /// one.
    void setItemCount(int count, bool checked);
    /// Tells that what the cells show is different.
    void updateCells();

    virtual QString text(int item, int column) const = 0;
    /// The places of the items that match a search.
    virtual std::vector<int> find(const QString &search) const = 0;
    /// Less than 0 where the left item comes before the right one in a column's ascending order. Where one
    /// has no value in the column, it may ask for the end of the list in either order.
    virtual int compare(int left, int right, int column, bool ascending) const = 0;

private:
    void check(int item, bool checked);
    void arrange();
    void sortItems(std::vector<int> &items) const;

    std::vector<bool> m_checked;
    std::vector<int> m_order; ///< items of the rows
    int m_checkedCount = 0;
    QString m_search;
    int m_sortColumn = -1; ///< none: as the items came
    Qt::SortOrder m_sortOrder = Qt::AscendingOrder;
};
