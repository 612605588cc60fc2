#include "app/frame/resizeedges.h"

namespace ResizeEdges {

Qt::Edges at(const QPoint &position, const QSize &window) {
    Qt::Edges edges;
    edges.setFlag(Qt::LeftEdge, position.x() < margin);
    edges.setFlag(Qt::RightEdge, position.x() >= window.width() - margin);
    edges.setFlag(Qt::TopEdge, position.y() < margin);
    edges.setFlag(Qt::BottomEdge, position.y() >= window.height() - margin);
    return edges;
}

Qt::CursorShape cursorOf(Qt::Edges edges) {
    if (edges == (Qt::LeftEdge | Qt::TopEdge) || edges == (Qt::RightEdge | Qt::BottomEdge))
        return Qt::SizeFDiagCursor;
    if (edges == (Qt::RightEdge | Qt::TopEdge) || edges == (Qt::LeftEdge | Qt::BottomEdge))
        return Qt::SizeBDiagCursor;
    if (edges & (Qt::LeftEdge | Qt::RightEdge))
        return Qt::SizeHorCursor;
    return edges ? Qt::SizeVerCursor : Qt::ArrowCursor;
}

} // namespace ResizeEdges
