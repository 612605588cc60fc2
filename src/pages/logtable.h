#pragma once

#include "customtable.h"
#include "loglist.h"

/// One page of the log, in the order in which the entries are given.
class LogTable : public CustomTable {
    Q_OBJECT

public:
    explicit LogTable(QWidget *parent = nullptr);

    /// Shows the entries at the places. Nothing is selected after it, and the first row is in view.
    void showEntries(const LogListPtr &list, const std::vector<int> &places);
    /// The entry in the current row, or null.
    const LogEntry *currentEntry() const;
    /// What an item shows; for the items.
    QVariant cellData(int row, int column, int role) const;

signals:
    void currentEntryChanged();

protected:
    void keyPressEvent(QKeyEvent *event) override;

private:
    void makeItems(int rows);
    void copySelected() const;
    void showSortMenu(const QPoint &position);

    LogListPtr m_list;
    std::vector<int> m_places;
};
