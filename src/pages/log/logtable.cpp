#include "pages/log/logtable.h"

#include "widgets/controls/popupmenu.h"

#include <QAction>
#include <QClipboard>
#include <QGuiApplication>
#include <QHeaderView>
#include <QItemSelection>
#include <QKeyEvent>
#include <QScrollBar>

#include <algorithm>

namespace {

/// The last column takes what is left.
constexpr int columnWidths[logColumnCount - 1] = {160, 76, 70, 170};

/// An item that knows its place and asks the table for what stands there.
class LogItem : public QTableWidgetItem {
public:
    LogItem(int row, int column) : m_row(row), m_column(column) {}

    QVariant data(int role) const override {
        const auto *table = static_cast<const LogTable *>(tableWidget());
        return table ? table->cellData(m_row, m_column, role) : QVariant();
    }

private:
    int m_row;
    int m_column;
};

} // namespace

LogTable::LogTable(QWidget *parent) : CustomTable(parent) {
    setColumnCount(logColumnCount);
    QStringList titles;
    for (int column = 0; column < logColumnCount; ++column)
        titles += logColumnTitle(static_cast<LogColumn>(column));
    setHorizontalHeaderLabels(titles);
    for (int column = 0; column + 1 < logColumnCount; ++column)
        setColumnWidth(column, columnWidths[column]);
    // The whole result is sorted, not the rows of the page, so the header only says how.
    horizontalHeader()->setSectionsClickable(true);
    horizontalHeader()->setSortIndicator(static_cast<int>(LogColumn::Time), Qt::DescendingOrder);
    horizontalHeader()->setSortIndicatorShown(true);
    setContextMenuPolicy(Qt::CustomContextMenu);
    connect(this, &QWidget::customContextMenuRequested, this, &LogTable::showSortMenu);
    connect(this, &QTableWidget::currentCellChanged, this, [this](int row, int, int previousRow, int) {
        if (row != previousRow)
            emit currentEntryChanged();
    });
}

void LogTable::showEntries(const LogListPtr &list, const std::vector<int> &places) {
    const bool isSameList = list == m_list;
    const int current = isSameList ? currentPlace() : -1;
    const std::vector<int> selected = isSameList ? selectedPlaces() : std::vector<int>();
    m_list = list;
    m_places = places;
    clearSelection();
    setCurrentCell(-1, -1);
    const int rows = static_cast<int>(places.size());
    setRowCount(rows);
    makeItems(rows);
    scrollToTop();
    select(selected, current);
    viewport()->update();
    emit currentEntryChanged();
}

void LogTable::makeItems(int rows) {
    // The last rows are the ones without items, so the others need not be asked.
    for (int row = rows - 1; row >= 0 && !item(row, 0); --row) {
        for (int column = 0; column < logColumnCount; ++column)
            setItem(row, column, new LogItem(row, column));
    }
}

std::vector<int> LogTable::selectedPlaces() const {
    std::vector<int> places;
    for (const QModelIndex &index : selectionModel()->selectedRows())
        places.push_back(m_places[static_cast<std::size_t>(index.row())]);
    return places;
}

void LogTable::select(const std::vector<int> &selected, int current) {
    QItemSelection selection;
    for (int row = 0; row < rowCount(); ++row) {
        const int place = m_places[static_cast<std::size_t>(row)];
        if (std::find(selected.begin(), selected.end(), place) != selected.end())
            selection.select(model()->index(row, 0), model()->index(row, 0));
        if (place == current)
            setCurrentCell(row, 0, QItemSelectionModel::NoUpdate);
    }
    selectionModel()->select(selection, QItemSelectionModel::Select | QItemSelectionModel::Rows);
    if (currentRow() >= 0)
        scrollToItem(item(currentRow(), 0));
}

int LogTable::currentPlace() const {
    const int row = currentRow();
    return row >= 0 && row < static_cast<int>(m_places.size()) ? m_places[static_cast<std::size_t>(row)] : -1;
}

const LogEntry *LogTable::currentEntry() const {
    const int place = currentPlace();
    return place >= 0 ? &m_list->at(place) : nullptr;
}

QVariant LogTable::cellData(int row, int column, int role) const {
    if (role != Qt::DisplayRole || row >= static_cast<int>(m_places.size()))
        return {};
    const QString text =
        m_list->at(m_places[static_cast<std::size_t>(row)]).text(static_cast<LogColumn>(column));
    return text.isEmpty() ? QStringLiteral("--") : text;
}

void LogTable::keyPressEvent(QKeyEvent *event) {
    if (event->matches(QKeySequence::Copy))
        copySelected();
    else
        CustomTable::keyPressEvent(event);
}

void LogTable::copySelected() const {
    std::vector<int> rows;
    for (const QModelIndex &index : selectionModel()->selectedRows())
        rows.push_back(index.row());
    std::sort(rows.begin(), rows.end());
    QStringList lines;
    for (const int row : rows) {
        QStringList fields;
        for (int column = 0; column < logColumnCount; ++column)
            fields += cellData(row, column, Qt::DisplayRole).toString();
        lines += fields.join(QLatin1Char('\t'));
    }
    QGuiApplication::clipboard()->setText(lines.join(QLatin1Char('\n')));
}

/// The keyboard's way to what a click on the header does.
void LogTable::showSortMenu(const QPoint &position) {
    auto *menu = new PopupMenu(this);
    menu->setAttribute(Qt::WA_DeleteOnClose);
    QAction *copy = menu->addAction(tr("Copy"));
    copy->setEnabled(selectionModel()->hasSelection());
    connect(copy, &QAction::triggered, this, &LogTable::copySelected);
    menu->addSeparator();
    for (int column = 0; column < logColumnCount; ++column) {
        QAction *sort = menu->addAction(tr("Sort by %1").arg(logColumnTitle(static_cast<LogColumn>(column))));
        connect(sort, &QAction::triggered, this, [this, column] {
            const QHeaderView *header = horizontalHeader();
            const bool turns = header->sortIndicatorSection() == column &&
                               header->sortIndicatorOrder() == Qt::AscendingOrder;
            horizontalHeader()->setSortIndicator(column, turns ? Qt::DescendingOrder : Qt::AscendingOrder);
        });
    }
    menu->popup(viewport()->mapToGlobal(position));
}
