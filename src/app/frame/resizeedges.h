#pragma once

#include <QCursor>
#include <QPoint>
#include <QSize>

/// The edges by which a window without the desktop's frame is resized.
namespace ResizeEdges {

inline constexpr int margin = 4;

/// The edges of a window of this size that are near the position.
Qt::Edges at(const QPoint &position, const QSize &window);

/// The pointer's shape over them; the arrow over none.
Qt::CursorShape cursorOf(Qt::Edges edges);

} // namespace ResizeEdges
