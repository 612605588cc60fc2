#pragma once

#include "pages/log/loglist.h"
#include "widgets/lists/customtable.h"

/// One page of the log, in the order in which the entries are given.
class LogTable : public CustomTable {
    Q_OBJECT

public:
    explicit LogTable(QWidget *parent = nullptr);

    /// Shows the entries at the places. Those of the same list that were selected still are, where they are
    /// among them; the current one is in view then, else the first row.
    void showEntries(const LogListPtr &list, const std::vector<int> &places);
    const LogListPtr &list() const { return m_list; }
    /// The entry in the current row, or null.
    const LogEntry *currentEntry() const;
    /// Its place in the list, or -1.
    int currentPlace() const;
    /// What an item shows; for the items.
    QVariant cellData(int row, int column, int role) const;

signals:
    void currentEntryChanged();

protected:
    void keyPressEvent(QKeyEvent *event) override;

private:
    void makeItems(int rows);
    std::vector<int> selectedPlaces() const;
    void select(const std::vector<int> &selected, int current);
    void copySelected() const;
    void showSortMenu(const QPoint &position);

    LogListPtr m_list;
    std::vector<int> m_places;
};
