#pragma once

#include <QColor>
#include <QIcon>
#include <QPixmap>
#include <QSize>

/// The program's own pictures. White ones take any colour.
namespace Icons {

/// A picture of the resource tree (":/images/….svg") at the given size in device-independent pixels. An
/// invalid colour leaves it as it was drawn. A picture that is missing yields a null pixmap.
QPixmap pixmap(const QString &resource, QSize size, qreal ratio, const QColor &colour = {});

/// The same as an icon, at 1x to 3x, in the usual text colours: normal, off when disabled, accent when
/// checked.
QIcon icon(const QString &resource, QSize size);

/// An icon as it was drawn, sharp at every ratio.
QIcon plainIcon(const QString &resource, QSize size);

} // namespace Icons
