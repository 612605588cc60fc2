#pragma once

#include <QColor>
#include <QFont>
#include <QRect>
#include <QString>

class QPainter;
class QStyleOptionViewItem;

/// What the delegates of cards share.
namespace RowPainter {

/// The ground of a row: selected or hovered, with a line below, and framed when it has the focus.
void paintBackground(QPainter *painter, const QStyleOptionViewItem &option);

/// A single line, cut where it does not fit.
void paintText(QPainter *painter, const QRect &place, const QFont &font, const QColor &colour,
               const QString &text);

/// A line at the right end, no wider than the limit; returns what is left of the place.
QRect paintRight(QPainter *painter, const QRect &place, const QFont &font, const QColor &colour,
                 const QString &text, int widest = 1000);

QFont smaller(QFont font);
QFont bold(QFont font);

} // namespace RowPainter
