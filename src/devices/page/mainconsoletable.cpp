#include "devices/page/mainconsoletable.h"

#include "devices/inventory/sortableiptablewidgetitem.h"
#include "devices/sites/sitelist.h"
#include "devices/sites/sitemembership.h"
#include "store/localstore.h"
#include "store/storewriter.h"
#include "widgets/style/icons.h"
#include "widgets/style/theme.h"

#include <QClipboard>
#include <QDrag>
#include <QElapsedTimer>
#include <QGuiApplication>
#include <QHeaderView>
#include <QKeyEvent>
#include <QMimeData>
#include <QScrollBar>
#include <QSignalBlocker>
#include <QStyleHints>
#include <QTimerEvent>

#include <algorithm>

namespace {

/// How long the user-interface thread may make items at a time.
constexpr int fillBudgetMs = 6;
constexpr int rowsBetweenClockLooks = 64;
/// Above and below the view; scrolling makes items anew only where it leaves them.
constexpr int rowsNearView = 64;
constexpr int saveDelayMs = 1000;
constexpr int widthSample = 200;
constexpr int maxColumnWidth = 260;
constexpr int cellMargins = 20;
constexpr int sortArrowSpace = 14;
constexpr int statusIconSpace = 12;
constexpr int maxSampledTextLength = 80;

/// An item that knows its place and asks the table for what stands there.
template <typename Base>
class CellItem : public Base {
public:
    CellItem(int row, int column) : m_row(row), m_column(column) {}

    QVariant data(int role) const override {
        const auto *table = static_cast<const MainConsoleTable *>(this->tableWidget());
        return table ? table->cellData(m_row, m_column, role) : QVariant();
    }

private:
    int m_row;
    int m_column;
};

QTableWidgetItem *makeItem(int row, int column) {
    if (column == static_cast<int>(DeviceColumn::Ip))
        return new CellItem<SortableIpTableWidgetItem>(row, column);
    return new CellItem<QTableWidgetItem>(row, column);
}

} // namespace

/// Devices by their places in the reading that was shown, since rows mean nothing in another order.
struct MainConsoleTable::Place {
    static constexpr int none = -1;

    DeviceSnapshotPtr snapshot;
    std::vector<bool> selected; ///< empty when nothing is
    int current = none;
    int currentColumn = 0;
    int top = none; ///< the device in the first visible row
    int topOffset = 0;
    std::vector<int> order;
};

MainConsoleTable::MainConsoleTable(DeviceClass deviceClass, QWidget *parent)
    : CustomTable(parent), m_filter{deviceClass, Sites::overviewId, {}, {}} {
    setColumnCount(deviceColumnCount);
    QStringList titles;
    for (int column = 0; column < deviceColumnCount; ++column)
        titles.append(DeviceRecords::columnTitle(static_cast<DeviceColumn>(column)));
    setHorizontalHeaderLabels(titles);
    horizontalHeader()->setSortIndicatorShown(false);
    horizontalHeader()->setSectionsMovable(true);
    connect(horizontalHeader(), &QHeaderView::sectionClicked, this, &MainConsoleTable::sortBy);
    setDragEnabled(true);
    setContextMenuPolicy(Qt::CustomContextMenu);
    connect(this, &QWidget::customContextMenuRequested, this, [this](const QPoint &position) {
        if (rowAt(position.y()) >= 0)
            emit rowMenuRequested(viewport()->mapToGlobal(position));
    });
    horizontalHeader()->setContextMenuPolicy(Qt::CustomContextMenu);
    connect(horizontalHeader(), &QWidget::customContextMenuRequested, this, [this](const QPoint &position) {
        emit columnMenuRequested(horizontalHeader()->mapToGlobal(position));
    });
    connect(this, &QTableWidget::itemSelectionChanged, this, &MainConsoleTable::selectedDevicesChanged);
    m_isReadAloud = QAccessible::isActive();
    QAccessible::installActivationObserver(this);
}

void MainConsoleTable::setInventory(const DeviceInventory *inventory) {
    m_inventory = inventory;
    refill();
}

void MainConsoleTable::setSite(const QString &siteId) {
    if (siteId == m_filter.siteId)
        return;
    m_filter.siteId = siteId;
    refill();
}

void MainConsoleTable::setSearch(const DeviceSearch &search) {
    m_filter.search = search;
    refill();
}

void MainConsoleTable::setStatusFilter(std::optional<DeviceStatusGroup> status) {
    if (status == m_filter.status)
        return;
    m_filter.status = status;
    refill();
}

std::vector<int> MainConsoleTable::matchingDevices() const {
    return m_filter.status && m_inventory ? DeviceOrder::matching(*m_inventory, m_filter) : m_order;
}

int MainConsoleTable::unfilteredCount() const {
    if (!m_inventory || !isFiltered())
        return static_cast<int>(m_order.size());
    return static_cast<int>(
        DeviceOrder::matching(*m_inventory, {m_filter.deviceClass, m_filter.siteId, {}, {}}).size());
}

void MainConsoleTable::refill() {
    if (!m_inventory)
        return;
    const Place place = saveViewState();
    arrange();
    const int rows = static_cast<int>(m_order.size());
    {
        // Selections of rows that go are put right below, in one step.
        const QSignalBlocker blocker(selectionModel());
        setRowCount(rows);
    }
    m_items.end = std::min(m_items.end, rows);
    m_items.first = std::min(m_items.first, m_items.end);
    fitColumns();
    restoreViewState(place);
    keepItems();
    viewport()->update();
}

void MainConsoleTable::refreshStatus() {
    if (m_sort.column == static_cast<int>(DeviceColumn::Status) || m_filter.status)
        refill();
    else
        viewport()->update();
}

void MainConsoleTable::arrange() {
    m_shown = m_inventory->snapshot();
    m_order = DeviceOrder::arrange(*m_inventory, m_filter, m_sort);
}

MainConsoleTable::Place MainConsoleTable::saveViewState() const {
    Place place;
    place.snapshot = m_shown;
    place.order = m_order;
    if (!m_shown)
        return place;
    const auto deviceAt = [this](int row) {
        const auto at = static_cast<std::size_t>(row);
        return row >= 0 && at < m_order.size() ? m_order[at] : Place::none;
    };
    const std::vector<int> devices = selectedDevices();
    if (!devices.empty()) {
        place.selected.resize(static_cast<std::size_t>(m_shown->size()));
        for (const int device : devices)
            place.selected[static_cast<std::size_t>(device)] = true;
    }
    place.current = deviceAt(currentRow());
    place.currentColumn = std::max(0, currentColumn());
    const int topRow = rowAt(0);
    place.top = verticalScrollBar()->value() > 0 ? deviceAt(topRow) : Place::none;
    place.topOffset = topRow >= 0 ? rowViewportPosition(topRow) : 0;
    return place;
}

bool MainConsoleTable::isSameOrder(const Place &place) const {
    if (place.order.size() != m_order.size() || !place.snapshot)
        return false;
    if (place.snapshot == m_shown)
        return place.order == m_order;
    for (std::size_t row = 0; row < m_order.size(); ++row) {
        if (place.snapshot->at(place.order[row])->id != m_shown->at(m_order[row])->id)
            return false;
    }
    return true;
}

/// Where a device of an earlier reading is in the present one, or Place::none.
int MainConsoleTable::placeNow(const Place &place, int device) const {
    if (device < 0 || place.snapshot == m_shown)
        return device;
    return m_shown->indexOf(place.snapshot->at(device)->id);
}

/// The remembered selection in the present order, and how many devices are in it.
std::pair<QItemSelection, int> MainConsoleTable::selectionNow(const Place &place) const {
    std::vector<bool> selected(static_cast<std::size_t>(m_shown->size()));
    for (std::size_t device = 0; device < place.selected.size(); ++device) {
        const int now = place.selected[device] ? placeNow(place, static_cast<int>(device)) : Place::none;
        if (now >= 0)
            selected[static_cast<std::size_t>(now)] = true;
    }
    QItemSelection selection;
    int count = 0;
    int first = -1;
    const int rows = rowCount();
    for (int row = 0; row <= rows; ++row) {
        const bool in =
            row < rows && selected[static_cast<std::size_t>(m_order[static_cast<std::size_t>(row)])];
        count += in;
        if (in && first < 0)
            first = row;
        if (!in && first >= 0) {
            selection.append(QItemSelectionRange(model()->index(first, 0),
                                                 model()->index(row - 1, deviceColumnCount - 1)));
            first = -1;
        }
    }
    return {selection, count};
}

void MainConsoleTable::restoreViewState(const Place &place) {
    if (!place.snapshot || isSameOrder(place))
        return;
    const auto rowOf = [this](int device) {
        const auto found = device < 0 ? m_order.end() : std::find(m_order.begin(), m_order.end(), device);
        return found == m_order.end() ? Place::none : static_cast<int>(found - m_order.begin());
    };
    const int currentRow = rowOf(placeNow(place, place.current));
    const int topRow = rowOf(placeNow(place, place.top));
    const auto [selection, count] = selectionNow(place);
    {
        // Selecting from scratch is linear; comparing two selections of many ranges is not.
        const QSignalBlocker blocker(selectionModel());
        selectionModel()->reset();
        if (currentRow >= 0)
            selectionModel()->setCurrentIndex(model()->index(currentRow, place.currentColumn),
                                              QItemSelectionModel::NoUpdate);
        selectionModel()->select(selection, QItemSelectionModel::Select);
    }
    if (topRow >= 0) {
        // Rows that came with this reading widen the scroll range only with the next layout.
        executeDelayedItemsLayout();
        verticalScrollBar()->setValue(topRow * Theme::rowHeight - place.topOffset);
    }
    if (count != std::count(place.selected.begin(), place.selected.end(), true))
        emit selectedDevicesChanged();
}

/// Widths from the titles and a sample of the rows, once: later fills must not make columns jump.
void MainConsoleTable::fitColumns() {
    if (m_columnsFitted || m_order.empty())
        return;
    m_columnsFitted = true;
    const QFontMetrics metrics = fontMetrics();
    const QFontMetrics headerMetrics(horizontalHeader()->font());
    for (int column = 0; column < deviceColumnCount; ++column) {
        // Every device may come into every state.
        QString longest = column == 0 ? DeviceStatus::maxTextLength() : QString();
        for (int row = 0; row < std::min(rowCount(), widthSample); ++row) {
            const QString text = cellData(row, column, Qt::DisplayRole).toString();
            if (text.size() > longest.size())
                longest = text;
        }
        // Measuring a text costs more than all the rest here, so only the one with most letters is; another
        // one of that length may have wider letters.
        const int measured = metrics.horizontalAdvance(longest.left(maxSampledTextLength)) * 108 / 100;
        const int text = measured + (column == 0 ? statusIconSpace : 0);
        const int title =
            headerMetrics.horizontalAdvance(horizontalHeaderItem(column)->text()) + sortArrowSpace;
        const int width = std::max(text, title);
        setColumnWidth(column, std::min(width + cellMargins, maxColumnWidth));
    }
}

void MainConsoleTable::sortBy(int column) {
    const bool same = column == m_sort.column;
    m_sort.order = same && m_sort.order == Qt::AscendingOrder ? Qt::DescendingOrder : Qt::AscendingOrder;
    m_sort.column = column;
    horizontalHeader()->setSortIndicatorShown(true);
    horizontalHeader()->setSortIndicator(column, m_sort.order);
    refill();
}

/// Makes the items of the rows in and near the view, and deletes others: they would take more memory than the
/// devices themselves.
void MainConsoleTable::keepItems() {
    if (m_isReadAloud) {
        // A screen reader asks the model for any row. A table that nobody sees has time.
        makeAllItems(isVisible() ? fillBudgetMs : 0);
        return;
    }
    const int first = std::max(0, rowAt(0));
    const int last = rowAt(viewport()->height() - 1);
    const int end = last < 0 ? std::min(rowCount(), first + rowsNearView) : last + 1;
    if (m_items.first <= first && m_items.end >= end)
        return;
    const Rows wanted{std::max(0, first - rowsNearView), std::min(rowCount(), end + rowsNearView)};
    const QSignalBlocker blocker(model());
    for (int row = m_items.first; row < m_items.end; ++row) {
        if (!wanted.contains(row))
            deleteItems(row);
    }
    for (int row = wanted.first; row < wanted.end; ++row) {
        if (!m_items.contains(row))
            makeItems(row);
    }
    m_items = wanted;
}

void MainConsoleTable::makeAllItems(int budgetMs) {
    QElapsedTimer clock;
    clock.start();
    const QSignalBlocker blocker(model());
    const int rows = rowCount();
    for (int made = 1; m_items.first > 0 || m_items.end < rows; ++made) {
        makeItems(m_items.end < rows ? m_items.end++ : --m_items.first);
        if (made % rowsBetweenClockLooks == 0 && clock.elapsed() >= budgetMs)
            break;
    }
    if (m_items.first > 0 || m_items.end < rows)
        m_fillTimer.start(0, this);
    else
        m_fillTimer.stop();
}

// Setting and taking an item announces a change; nobody needs to hear that of items without data of their
// own, so the callers block the model's signals.
void MainConsoleTable::makeItems(int row) {
    for (int column = 0; column < deviceColumnCount; ++column)
        setItem(row, column, makeItem(row, column));
}

void MainConsoleTable::deleteItems(int row) {
    for (int column = 0; column < deviceColumnCount; ++column)
        delete takeItem(row, column);
}

void MainConsoleTable::accessibilityActiveChanged(bool active) {
    m_isReadAloud = active;
    m_fillTimer.start(0, this);
}

void MainConsoleTable::paintEvent(QPaintEvent *event) {
    keepItems();
    CustomTable::paintEvent(event);
}

/// Goes to the next row that begins with what is typed, as every view does, but by the records.
void MainConsoleTable::keyboardSearch(const QString &search) {
    const bool goesOn = m_sinceTyped.isValid() &&
                        m_sinceTyped.elapsed() < QGuiApplication::styleHints()->keyboardInputInterval();
    m_sinceTyped.start();
    m_typed = goesOn ? m_typed + search : search;
    if (m_typed.isEmpty())
        return;
    // The same letter again and again walks through the rows that begin with it.
    const bool sameLetter = m_typed.count(m_typed.back()) == m_typed.size();
    const QString wanted = sameLetter ? m_typed.left(1) : m_typed;
    const int rows = rowCount();
    const int begin = currentRow() + (sameLetter || !goesOn ? 1 : 0);
    const int column = std::max(0, currentColumn());
    for (int i = 0; i < rows; ++i) {
        const int row = (std::max(0, begin) + i) % rows;
        if (cellData(row, column, Qt::DisplayRole).toString().startsWith(wanted, Qt::CaseInsensitive)) {
            setCurrentCell(row, column);
            return;
        }
    }
}

void MainConsoleTable::keepColumns() {
    QHeaderView *header = horizontalHeader();
    const QByteArray kept = QByteArray::fromBase64(CLocalStore::instance().layout(objectName()).toLatin1());
    if (!kept.isEmpty() && header->restoreState(kept)) {
        m_columnsFitted = true;
        if (header->isSortIndicatorShown())
            m_sort = {header->sortIndicatorSection(), header->sortIndicatorOrder()};
        refill();
    }
    const auto later = [this] { m_saveTimer.start(saveDelayMs, this); };
    connect(header, &QHeaderView::sectionMoved, this, later);
    connect(header, &QHeaderView::sectionResized, this, later);
    connect(header, &QHeaderView::sortIndicatorChanged, this, later);
}

MainConsoleTable::~MainConsoleTable() {
    QAccessible::removeActivationObserver(this);
    if (m_saveTimer.isActive())
        saveColumns();
}

void MainConsoleTable::saveColumns() const {
    StoreWriter::post([name = objectName(), state = horizontalHeader()->saveState().toBase64()] {
        CLocalStore::instance().setLayout(name, QString::fromLatin1(state));
    });
}

void MainConsoleTable::resetColumns() {
    QHeaderView *header = horizontalHeader();
    for (int column = 0; column < deviceColumnCount; ++column) {
        header->setSectionHidden(column, false);
        header->moveSection(header->visualIndex(column), column);
    }
    header->setSortIndicator(0, Qt::AscendingOrder);
    header->setSortIndicatorShown(false);
    m_sort = {};
    m_columnsFitted = false;
    refill();
}

void MainConsoleTable::timerEvent(QTimerEvent *event) {
    if (event->timerId() == m_saveTimer.timerId()) {
        m_saveTimer.stop();
        saveColumns();
        return;
    }
    if (event->timerId() != m_fillTimer.timerId()) {
        CustomTable::timerEvent(event);
        return;
    }
    m_fillTimer.stop();
    keepItems();
}

void MainConsoleTable::keyPressEvent(QKeyEvent *event) {
    if (event->key() == Qt::Key_Delete)
        emit deleteRequested();
    else if (event->matches(QKeySequence::Copy))
        copySelection();
    else
        CustomTable::keyPressEvent(event);
}

void MainConsoleTable::startDrag(Qt::DropActions) {
    QStringList ids;
    for (const DeviceRecordPtr &device : selectedRecords())
        ids += device->id;
    if (ids.isEmpty())
        return;
    auto *drag = new QDrag(this);
    auto *dragged = new QMimeData;
    dragged->setData(SiteMembership::mimeType, SiteMembership::encode({m_filter.siteId, ids}));
    drag->setMimeData(dragged);
    const QPixmap hand =
        Icons::pixmap(QStringLiteral(":/images/icon_closed_hand_cursor.svg"), {24, 24}, devicePixelRatioF());
    drag->setDragCursor(hand, Qt::CopyAction);
    drag->setDragCursor(hand, Qt::MoveAction);
    drag->exec(Qt::CopyAction | Qt::MoveAction, Qt::CopyAction);
}

QStringList MainConsoleTable::visibleTexts(int row) const {
    QStringList texts;
    const QHeaderView *header = horizontalHeader();
    for (int visual = 0; visual < header->count(); ++visual) {
        const int column = header->logicalIndex(visual);
        if (header->isSectionHidden(column))
            continue;
        const QString text = row < 0 ? horizontalHeaderItem(column)->text()
                                     : cellData(row, column, Qt::DisplayRole).toString();
        texts += text.simplified();
    }
    return texts;
}

void MainConsoleTable::copySelection() const {
    QGuiApplication::clipboard()->setText(selectionText());
}

QString MainConsoleTable::selectionText() const {
    QStringList lines{visibleTexts(-1).join(QLatin1Char('\t'))};
    for (const int row : selectedRows())
        lines += visibleTexts(row).join(QLatin1Char('\t'));
    return lines.join(QLatin1Char('\n'));
}

QVariant MainConsoleTable::cellData(int row, int column, int role) const {
    if (!m_inventory || row < 0 || static_cast<std::size_t>(row) >= m_order.size())
        return {};
    const int index = m_order[static_cast<std::size_t>(row)];
    const DeviceRecord &record = *m_shown->at(index);
    const auto which = static_cast<DeviceColumn>(column);
    const bool isStatus = which == DeviceColumn::Status;
    switch (role) {
    case Qt::DisplayRole:
        return isStatus ? DeviceStatus::text(m_inventory->status(index)) : record.text(which);
    case Qt::DecorationRole:
        return isStatus ? QVariant(DeviceStatus::icon(m_inventory->status(index))) : QVariant();
    case deviceIdRole:
        return record.id;
    default:
        return {};
    }
}

bool MainConsoleTable::selectDevice(int place) {
    const auto found = std::find(m_order.begin(), m_order.end(), place);
    if (found == m_order.end())
        return false;
    const QModelIndex index = model()->index(static_cast<int>(found - m_order.begin()), 0);
    selectionModel()->setCurrentIndex(index, QItemSelectionModel::ClearAndSelect | QItemSelectionModel::Rows);
    // Qt scrolls to no cell of a hidden column.
    executeDelayedItemsLayout();
    const int above = (viewport()->height() - Theme::rowHeight) / 2;
    verticalScrollBar()->setValue(index.row() * Theme::rowHeight - above);
    return true;
}

std::vector<int> MainConsoleTable::selectedRows() const {
    std::vector<int> rows;
    for (const QItemSelectionRange &range : selectionModel()->selection()) {
        for (int row = range.top(); row <= range.bottom(); ++row)
            rows.push_back(row);
    }
    std::sort(rows.begin(), rows.end());
    rows.erase(std::unique(rows.begin(), rows.end()), rows.end());
    return rows;
}

std::vector<int> MainConsoleTable::selectedDevices() const {
    const std::vector<int> rows = selectedRows();
    std::vector<int> devices;
    devices.reserve(rows.size());
    for (const int row : rows) {
        if (static_cast<std::size_t>(row) < m_order.size())
            devices.push_back(m_order[static_cast<std::size_t>(row)]);
    }
    return devices;
}

std::vector<DeviceRecordPtr> MainConsoleTable::selectedRecords() const {
    std::vector<DeviceRecordPtr> records;
    for (const int device : selectedDevices())
        records.push_back(m_shown->at(device));
    return records;
}
