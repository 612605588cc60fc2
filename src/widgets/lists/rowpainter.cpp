#include "widgets/lists/rowpainter.h"

#include "widgets/style/theme.h"

#include <QPainter>
#include <QStyleOptionViewItem>

namespace RowPainter {

namespace {
constexpr int gap = 8;
constexpr qsizetype maxShownTextLength = 300;

/// The first line of a text, whose length is bounded: laying out a long one takes its time.
QString fitted(const QString &text, const QFont &font, int width) {
    return QFontMetrics(font).elidedText(text.left(maxShownTextLength).simplified(), Qt::ElideRight, width);
}
} // namespace

void paintBackground(QPainter *painter, const QStyleOptionViewItem &option) {
    if (option.state & QStyle::State_Selected)
        painter->fillRect(option.rect, Theme::selection);
    else if (option.state & QStyle::State_MouseOver)
        painter->fillRect(option.rect, Theme::hoverRow);
    painter->setPen(Theme::rowLine);
    painter->drawLine(option.rect.bottomLeft(), option.rect.bottomRight());
    if (option.state & QStyle::State_HasFocus) {
        painter->setPen(Theme::accent);
        painter->drawRect(option.rect.adjusted(0, 0, -1, -1));
    }
}

void paintText(QPainter *painter, const QRect &place, const QFont &font, const QColor &colour,
               const QString &text) {
    painter->setFont(font);
    painter->setPen(colour);
    painter->drawText(place, Qt::AlignVCenter | Qt::TextSingleLine, fitted(text, font, place.width()));
}

QRect paintRight(QPainter *painter, const QRect &place, const QFont &font, const QColor &colour,
                 const QString &text, int widest) {
    const QString shown = fitted(text, font, std::min(widest, place.width()));
    const int width = QFontMetrics(font).horizontalAdvance(shown);
    painter->setFont(font);
    painter->setPen(colour);
    painter->drawText(place, Qt::AlignVCenter | Qt::AlignRight | Qt::TextSingleLine, shown);
    return place.adjusted(0, 0, width > 0 ? -width - gap : 0, 0);
}

QFont smaller(QFont font) {
    font.setPixelSize(12);
    return font;
}

QFont bold(QFont font) {
    font.setWeight(QFont::DemiBold);
    return font;
}

} // namespace RowPainter
