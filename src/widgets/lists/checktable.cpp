#include "widgets/lists/checktable.h"

#include "widgets/lists/checklistmodel.h"
#include "widgets/lists/rowdelegate.h"
#include "widgets/style/theme.h"

#include <QHeaderView>

CheckTable::CheckTable(QWidget *parent) : QTableView(parent) {
    setItemDelegate(new RowDelegate(this));
    setSelectionBehavior(QAbstractItemView::SelectRows);
    setSelectionMode(QAbstractItemView::SingleSelection);
    setEditTriggers(QAbstractItemView::NoEditTriggers);
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    setShowGrid(false);
    setWordWrap(false);
    setTabKeyNavigation(false);
    verticalHeader()->hide();
    verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    verticalHeader()->setDefaultSectionSize(Theme::rowHeight);
    horizontalHeader()->setHighlightSections(false);
    horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    horizontalHeader()->setStretchLastSection(true);
    horizontalHeader()->setFixedHeight(34);
}

void CheckTable::showList(CheckListModel *model, std::initializer_list<int> widths, int sortColumn) {
    setModel(model);
    int column = 0;
    for (const int width : widths)
        setColumnWidth(column++, width);
    for (; column < model->columnCount(); ++column)
        horizontalHeader()->setSectionResizeMode(column, QHeaderView::Stretch);
    horizontalHeader()->setSortIndicator(sortColumn, Qt::AscendingOrder);
    setSortingEnabled(true);
}
