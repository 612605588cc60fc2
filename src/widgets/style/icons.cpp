#include "widgets/style/icons.h"

#include "widgets/style/theme.h"

#include <QBuffer>
#include <QFile>
#include <QIconEngine>
#include <QImageReader>
#include <QPainter>
#include <QPixmapCache>

namespace Icons {

namespace {

QByteArray coloured(QByteArray svg, const QColor &colour) {
    if (!colour.isValid())
        return svg;
    // Opacity as an attribute of its own: the picture format knows no colour with alpha.
    svg.replace("#ffffff", colour.name(QColor::HexRgb).toUtf8());
    if (colour.alpha() < 255)
        svg.replace("<svg ", "<svg opacity=\"" + QByteArray::number(colour.alphaF(), 'f', 3) + "\" ");
    return svg;
}

/// One of the sizes in which the build has drawn a picture: the smallest that need not be enlarged.
QImage drawnFor(const QString &resource, QSize pixels) {
    const qsizetype suffixAt = resource.lastIndexOf(u'.');
    QImage image;
    for (const char *size : {"", "@1.5x", "@2x", "@6x"}) {
        const QImage larger(QString(resource).insert(suffixAt, QLatin1String(size)));
        if (larger.isNull())
            break;
        image = larger;
        if (image.width() >= pixels.width() && image.height() >= pixels.height())
            break;
    }
    return image;
}

QImage drawn(const QString &resource, QSize pixels, const QColor &colour) {
    // Converted before it is scaled: a scaled image that is converted in place would be painted as it was
    // before.
    QImage image = drawnFor(resource, pixels)
                       .convertToFormat(QImage::Format_ARGB32_Premultiplied)
                       .scaled(pixels, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    if (colour.isValid()) {
        QPainter painter(&image);
        painter.setCompositionMode(QPainter::CompositionMode_SourceIn);
        painter.fillRect(image.rect(), colour);
    }
    return image;
}

QImage drawnFromSvg(QByteArray svg, QSize pixels) {
    QBuffer buffer(&svg);
    QImageReader reader(&buffer, "svg");
    reader.setScaledSize(pixels);
    return reader.read();
}

/// The picture at a size in pixels, drawn once for each size and colour.
QPixmap rendered(const QString &resource, QSize pixels, const QColor &colour) {
    const QString key = QStringLiteral("%1/%2x%3/%4")
                            .arg(resource)
                            .arg(pixels.width())
                            .arg(pixels.height())
                            .arg(colour.isValid() ? colour.name(QColor::HexArgb) : QString());
    QPixmap picture;
    if (QPixmapCache::find(key, &picture))
        return picture;
    QFile file(resource);
    if (!file.open(QIODevice::ReadOnly))
        return {};
    const QByteArray content = file.readAll();
    // Where Qt cannot draw this format the build has done it, under the same names.
    const bool isDrawn = content.startsWith("\x89PNG");
    picture = QPixmap::fromImage(isDrawn ? drawn(resource, pixels, colour)
                                         : drawnFromSvg(coloured(content, colour), pixels));
    QPixmapCache::insert(key, picture);
    return picture;
}

/// Draws a picture when it is wanted, in the size and colour that are wanted then: most states of most icons
/// never are.
class PictureEngine : public QIconEngine {
public:
    PictureEngine(const QString &resource, QSize size, bool recoloured)
        : m_resource(resource), m_size(size), m_recoloured(recoloured) {}

    void paint(QPainter *painter, const QRect &rect, QIcon::Mode mode, QIcon::State state) override {
        const qreal ratio = painter->device()->devicePixelRatioF();
        const QSize fitted = m_size.scaled(rect.size().boundedTo(m_size), Qt::KeepAspectRatio);
        QRect place({}, fitted);
        place.moveCenter(rect.center());
        painter->drawPixmap(place, scaledPixmap((QSizeF(fitted) * ratio).toSize(), mode, state, ratio));
    }

    QPixmap pixmap(const QSize &size, QIcon::Mode mode, QIcon::State state) override {
        return scaledPixmap(size, mode, state, 1.0);
    }

    QPixmap scaledPixmap(const QSize &pixels, QIcon::Mode mode, QIcon::State state, qreal) override {
        return rendered(m_resource, pixels, m_recoloured ? colourOf(mode, state) : QColor());
    }

    QSize actualSize(const QSize &size, QIcon::Mode, QIcon::State) override {
        return m_size.scaled(size.boundedTo(m_size), Qt::KeepAspectRatio);
    }

    QList<QSize> availableSizes(QIcon::Mode, QIcon::State) override { return {m_size}; }
    bool isNull() override { return !QFile::exists(m_resource); }
    QIconEngine *clone() const override { return new PictureEngine(*this); }

private:
    static QColor colourOf(QIcon::Mode mode, QIcon::State state) {
        if (mode == QIcon::Disabled)
            return Theme::textOff;
        if (state == QIcon::On)
            return Theme::accent;
        return mode == QIcon::Active ? Theme::text : Theme::textDim;
    }

    QString m_resource;
    QSize m_size;
    bool m_recoloured;
};

} // namespace

QPixmap pixmap(const QString &resource, QSize size, qreal ratio, const QColor &colour) {
    QPixmap picture = rendered(resource, (QSizeF(size) * ratio).toSize(), colour);
    picture.setDevicePixelRatio(ratio);
    return picture;
}

QIcon icon(const QString &resource, QSize size) {
    return QIcon(new PictureEngine(resource, size, true));
}

QIcon plainIcon(const QString &resource, QSize size) {
    return QIcon(new PictureEngine(resource, size, false));
}

} // namespace Icons
