#include "widgets/lists/customtable.h"

#include "widgets/style/plaintext.h"
#include "widgets/style/theme.h"

#include <QHeaderView>
#include <QHelpEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QStyledItemDelegate>
#include <QToolTip>

#include <algorithm>
#include <limits>
#include <vector>

namespace {

constexpr int cellPadding = 8;
constexpr int iconSpace = 12;
constexpr qsizetype maxShownTextLength = 300;

/// Paints a cell by hand: the style sheet's own way costs several times as much for each one.
class CellDelegate : public QStyledItemDelegate {
public:
    explicit CellDelegate(CustomTable *table) : QStyledItemDelegate(table), m_table(table) {}

    void paint(QPainter *painter, const QStyleOptionViewItem &option,
               const QModelIndex &index) const override {
        paintBackground(painter, option, index);
        QRect rest = option.rect.adjusted(cellPadding, 0, -cellPadding, 0);
        if (const QIcon icon = index.data(Qt::DecorationRole).value<QIcon>(); !icon.isNull()) {
            const QSize size = icon.availableSizes().value(0, {9, 9});
            const QRect place(rest.left(), rest.center().y() - size.height() / 2, size.width(),
                              size.height());
            icon.paint(painter, place);
            rest.setLeft(rest.left() + iconSpace);
        }
        const QString text = index.data(Qt::DisplayRole).toString();
        painter->setFont(option.font);
        painter->setPen(text == QLatin1String("--") ? Theme::textQuiet : Theme::textStrong);
        painter->drawText(rest, Qt::AlignVCenter | Qt::TextSingleLine,
                          fitted(text, option.font, rest.width()));
    }

private:
    /// The text, cut where it does not fit. Laying a text out to find that it fits costs as much as drawing
    /// it, so a sum of the letters' widths says so for most.
    QString fitted(const QString &text, const QFont &font, int width) const {
        if (m_widths.empty() || m_widthsFont != font)
            measureLetters(font);
        qreal sum = 0;
        const qsizetype shown = std::min(text.size(), maxShownTextLength);
        for (qsizetype i = 0; i < shown && sum <= width; ++i) {
            const char16_t letter = text[i].unicode();
            sum += letter < m_widths.size() ? m_widths[letter] : width + 1;
        }
        if (shown == text.size() && sum <= width)
            return text;
        // Blanks in front stay: a text that is cut begins where the others do.
        QString line = text.left(maxShownTextLength);
        std::replace_if(
            line.begin(), line.end(), [](QChar each) { return each.isSpace(); }, QChar(u' '));
        return QFontMetrics(font).elidedText(line, Qt::ElideRight, width);
    }

    void measureLetters(const QFont &font) const {
        const QFontMetricsF metrics(font);
        m_widthsFont = font;
        m_widths.assign(127, std::numeric_limits<qreal>::max());
        for (char16_t letter = 32; letter < m_widths.size(); ++letter)
            m_widths[letter] = metrics.horizontalAdvance(QChar(letter));
    }

    void paintBackground(QPainter *painter, const QStyleOptionViewItem &option,
                         const QModelIndex &index) const {
        if (option.state & QStyle::State_Selected)
            painter->fillRect(option.rect, Theme::selection);
        else if (index.row() == m_table->hoveredRow())
            painter->fillRect(option.rect, Theme::raised);
        painter->setPen(Theme::rowLine);
        painter->drawLine(option.rect.bottomLeft(), option.rect.bottomRight());
        const QModelIndex current = m_table->currentIndex();
        if (m_table->hasFocus() && current.row() == index.row()) {
            painter->setPen(Theme::accent);
            painter->drawLine(option.rect.topLeft(), option.rect.topRight());
            painter->drawLine(option.rect.bottomLeft(), option.rect.bottomRight());
        }
    }

    CustomTable *m_table;
    mutable std::vector<qreal> m_widths; ///< of the plain letters, by their codes
    mutable QFont m_widthsFont;
};

} // namespace

CustomTable::CustomTable(QWidget *parent) : QTableWidget(parent) {
    setItemDelegate(new CellDelegate(this));
    setSelectionBehavior(QAbstractItemView::SelectRows);
    setSelectionMode(QAbstractItemView::ExtendedSelection);
    setEditTriggers(QAbstractItemView::NoEditTriggers);
    setHorizontalScrollMode(QAbstractItemView::ScrollPerPixel);
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    setShowGrid(false);
    setWordWrap(false);
    setMouseTracking(true);
    setTabKeyNavigation(false);
    verticalHeader()->hide();
    verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    verticalHeader()->setMinimumSectionSize(Theme::rowHeight);
    verticalHeader()->setDefaultSectionSize(Theme::rowHeight);
    horizontalHeader()->setHighlightSections(false);
    horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    horizontalHeader()->setStretchLastSection(true);
    horizontalHeader()->setFixedHeight(34);
}

bool CustomTable::viewportEvent(QEvent *event) {
    if (event->type() == QEvent::MouseMove)
        setHoveredRow(rowAt(static_cast<QMouseEvent *>(event)->position().toPoint().y()));
    else if (event->type() == QEvent::Leave)
        setHoveredRow(-1);
    else if (event->type() == QEvent::ToolTip)
        return showClippedText(static_cast<QHelpEvent *>(event));
    return QTableWidget::viewportEvent(event);
}

/// Tells the whole text of a cell that shows a part of it.
bool CustomTable::showClippedText(QHelpEvent *event) {
    const QModelIndex index = indexAt(event->pos());
    const QString text = index.data(Qt::DisplayRole).toString();
    const bool hasIcon = !index.data(Qt::DecorationRole).value<QIcon>().isNull();
    const int room = visualRect(index).width() - 2 * cellPadding - (hasIcon ? iconSpace : 0);
    if (index.isValid() && fontMetrics().horizontalAdvance(text) > room)
        QToolTip::showText(event->globalPos(), PlainText::toolTip(text), viewport());
    else
        QToolTip::hideText();
    return true;
}

void CustomTable::setHoveredRow(int row) {
    if (row == m_hoveredRow)
        return;
    updateRow(m_hoveredRow);
    updateRow(row);
    m_hoveredRow = row;
}

void CustomTable::updateRow(int row) {
    if (row >= 0)
        viewport()->update(0, rowViewportPosition(row), viewport()->width(), Theme::rowHeight);
}

// The current row is marked as a whole, while the view itself updates its one cell.
void CustomTable::currentChanged(const QModelIndex &current, const QModelIndex &previous) {
    QTableWidget::currentChanged(current, previous);
    updateRow(previous.row());
    updateRow(current.row());
}

void CustomTable::focusInEvent(QFocusEvent *event) {
    QTableWidget::focusInEvent(event);
    updateRow(currentRow());
}

void CustomTable::focusOutEvent(QFocusEvent *event) {
    QTableWidget::focusOutEvent(event);
    updateRow(currentRow());
}
