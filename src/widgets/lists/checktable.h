#pragma once

#include <QTableView>

#include <initializer_list>

class CheckListModel;

/// The table of a CheckListModel. A check mark leads each row; a click on it or on the text beside it turns
/// it, and so does the space bar in the current row.
class CheckTable : public QTableView {
    Q_OBJECT

public:
    explicit CheckTable(QWidget *parent = nullptr);

    /// Shows a model with columns of these widths, sorted by one of them. Columns without a width share what
    /// is left.
    void showList(CheckListModel *model, std::initializer_list<int> widths, int sortColumn);
};
