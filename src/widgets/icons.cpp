#include "icons.h"

#include "theme.h"

#include <QBuffer>
#include <QFile>
#include <QImageReader>

namespace Icons {

namespace {

constexpr qreal ratios[] = {1.0, 1.5, 2.0, 3.0};

QByteArray coloured(QByteArray svg, const QColor &colour) {
    if (!colour.isValid())
        return svg;
    // Opacity as an attribute of its own: the picture format knows no colour with alpha.
    svg.replace("#ffffff", colour.name(QColor::HexRgb).toUtf8());
    if (colour.alpha() < 255)
        svg.replace("<svg ", "<svg opacity=\"" + QByteArray::number(colour.alphaF(), 'f', 3) + "\" ");
    return svg;
}

void addPixmaps(QIcon &icon, const QString &resource, QSize size, const QColor &colour, QIcon::Mode mode,
                QIcon::State state) {
    for (const qreal ratio : ratios)
        icon.addPixmap(pixmap(resource, size, ratio, colour), mode, state);
}

} // namespace

QPixmap pixmap(const QString &resource, QSize size, qreal ratio, const QColor &colour) {
    QFile file(resource);
    if (!file.open(QIODevice::ReadOnly))
        return {};
    QByteArray svg = coloured(file.readAll(), colour);
    QBuffer buffer(&svg);
    QImageReader reader(&buffer, "svg");
    reader.setScaledSize((QSizeF(size) * ratio).toSize());
    QPixmap picture = QPixmap::fromImage(reader.read());
    picture.setDevicePixelRatio(ratio);
    return picture;
}

QIcon icon(const QString &resource, QSize size) {
    QIcon icon;
    addPixmaps(icon, resource, size, Theme::textDim, QIcon::Normal, QIcon::Off);
    addPixmaps(icon, resource, size, Theme::text, QIcon::Active, QIcon::Off);
    addPixmaps(icon, resource, size, Theme::accent, QIcon::Normal, QIcon::On);
    addPixmaps(icon, resource, size, Theme::textOff, QIcon::Disabled, QIcon::Off);
    return icon;
}

QIcon plainIcon(const QString &resource, QSize size) {
    QIcon icon;
    addPixmaps(icon, resource, size, {}, QIcon::Normal, QIcon::Off);
    return icon;
}

} // namespace Icons
