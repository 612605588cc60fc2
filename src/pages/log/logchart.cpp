#include "pages/log/logchart.h"

#include "widgets/style/plaintext.h"
#include "widgets/style/theme.h"

#include <QAccessible>
#include <QDateTime>
#include <QHelpEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QToolTip>

#include <algorithm>
#include <cmath>

namespace {

constexpr int legendHeight = 20;
constexpr int axisHeight = 18;
constexpr int scaleWidth = 44;
constexpr int labelGap = 16;
constexpr qreal maxBarWidth = 26;
constexpr qreal asideOpacity = 0.35;

// From the foot of a bar upwards.
constexpr LogEntry::Type stacked[] = {LogEntry::Type::Alarm, LogEntry::Type::Event, LogEntry::Type::Audit,
                                      LogEntry::Type::Other};

QColor colourOf(LogEntry::Type type) {
    switch (type) {
    case LogEntry::Type::Alarm:
        return Theme::chartAlarm;
    case LogEntry::Type::Event:
        return Theme::chartEvent;
    case LogEntry::Type::Audit:
        return Theme::chartAudit;
    case LogEntry::Type::Other:
        break;
    }
    return Theme::chartOther;
}

int countOf(const LogHistogram::Counts &counts, LogEntry::Type type) {
    return counts[static_cast<std::size_t>(type)];
}

QString timeText(qint64 at, const char *format) {
    return QDateTime::fromMSecsSinceEpoch(at).toString(QLatin1String(format));
}

QFont axisFont(QFont font) {
    font.setPixelSize(11);
    return font;
}

} // namespace

LogChart::LogChart(QWidget *parent) : QWidget(parent) {
    setObjectName(QStringLiteral("logChart"));
    setAccessibleName(tr("Log entries over time"));
    setFocusPolicy(Qt::StrongFocus);
    setCursor(Qt::CrossCursor);
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
}

void LogChart::setBins(const LogHistogram &bins) {
    m_bins = bins;
    m_cursor = std::min(m_cursor, m_bins.size() - 1);
    m_anchor = -1;
    m_dragging = false;
    update();
}

void LogChart::setSpan(const std::optional<TimeRange> &span) {
    m_span = span;
    m_anchor = -1;
    update();
}

QRectF LogChart::plot() const {
    return QRectF(rect()).adjusted(scaleWidth, legendHeight, -1, -axisHeight);
}

QRectF LogChart::binRect(int bin) const {
    const QRectF area = plot();
    const qreal width = area.width() / std::max(m_bins.size(), 1);
    return {area.left() + bin * width, area.top(), width, area.height()};
}

int LogChart::binAt(qreal x) const {
    const QRectF area = plot();
    return std::clamp(static_cast<int>(std::floor((x - area.left()) / area.width() * m_bins.size())), 0,
                      m_bins.size() - 1);
}

std::optional<std::pair<int, int>> LogChart::markedBins() const {
    if (m_anchor >= 0 && m_cursor >= 0)
        return std::minmax({m_anchor, m_cursor});
    return m_span ? m_bins.binsOf(*m_span) : std::nullopt;
}

void LogChart::mousePressEvent(QMouseEvent *event) {
    if (event->button() != Qt::LeftButton || m_bins.size() == 0)
        return QWidget::mousePressEvent(event);
    m_dragging = true;
    m_anchor = m_cursor = binAt(event->position().x());
    update();
}

void LogChart::mouseMoveEvent(QMouseEvent *event) {
    if (!m_dragging)
        return;
    m_cursor = binAt(event->position().x());
    const auto [first, last] = std::minmax({m_anchor, m_cursor});
    QToolTip::showText(event->globalPosition().toPoint(), PlainText::toolTip(binText(first, last)), this);
    update();
}

void LogChart::mouseReleaseEvent(QMouseEvent *event) {
    if (!m_dragging || event->button() != Qt::LeftButton)
        return QWidget::mouseReleaseEvent(event);
    choose();
}

void LogChart::choose() {
    m_dragging = false;
    if (m_cursor < 0)
        return;
    const auto [first, last] = std::minmax({m_anchor < 0 ? m_cursor : m_anchor, m_cursor});
    m_anchor = -1;
    update();
    emit spanChosen(m_bins.frame(first, last));
}

void LogChart::keyPressEvent(QKeyEvent *event) {
    const bool extends = event->modifiers().testFlag(Qt::ShiftModifier);
    const int last = m_bins.size() - 1;
    if (last < 0)
        return QWidget::keyPressEvent(event);
    switch (event->key()) {
    case Qt::Key_Left:
        return moveCursor(m_cursor < 0 ? last : std::max(m_cursor - 1, 0), extends);
    case Qt::Key_Right:
        return moveCursor(std::min(m_cursor + 1, last), extends);
    case Qt::Key_Home:
        return moveCursor(0, extends);
    case Qt::Key_End:
        return moveCursor(last, extends);
    case Qt::Key_Return:
    case Qt::Key_Enter:
    case Qt::Key_Space:
        return choose();
    case Qt::Key_Escape:
        if (m_anchor < 0 && !m_span)
            return QWidget::keyPressEvent(event);
        m_dragging = false;
        if (std::exchange(m_anchor, -1) < 0)
            emit spanGivenUp();
        return update();
    default:
        QWidget::keyPressEvent(event);
    }
}

void LogChart::moveCursor(int bin, bool extends) {
    if (extends && m_anchor < 0)
        m_anchor = m_cursor < 0 ? bin : m_cursor;
    else if (!extends)
        m_anchor = -1;
    m_cursor = bin;
    tellCursor();
    update();
}

void LogChart::tellCursor() {
    const auto [first, last] = std::minmax({m_anchor < 0 ? m_cursor : m_anchor, m_cursor});
    setAccessibleDescription(binText(first, last));
    QAccessibleEvent change(this, QAccessible::DescriptionChanged);
    QAccessible::updateAccessibility(&change);
    const QPoint place = binRect(m_cursor).center().toPoint();
    QToolTip::showText(mapToGlobal(place), PlainText::toolTip(binText(first, last)), this);
}

void LogChart::focusInEvent(QFocusEvent *event) {
    QWidget::focusInEvent(event);
    update();
}

void LogChart::focusOutEvent(QFocusEvent *event) {
    QWidget::focusOutEvent(event);
    update();
}

bool LogChart::event(QEvent *event) {
    if (event->type() != QEvent::ToolTip)
        return QWidget::event(event);
    const auto *help = static_cast<QHelpEvent *>(event);
    if (m_bins.size() > 0 && plot().contains(help->pos())) {
        const int bin = binAt(help->pos().x());
        QToolTip::showText(help->globalPos(), PlainText::toolTip(binText(bin, bin)), this);
    } else {
        QToolTip::hideText();
    }
    return true;
}

QString LogChart::frameText(int first, int last) const {
    const TimeRange frame = m_bins.frame(first, last);
    if (m_bins.unit() == LogHistogram::Unit::Hour)
        return tr("%1 to %2").arg(timeText(frame.from, "yyyy/MM/dd HH:mm"), timeText(frame.to + 1, "HH:mm"));
    const QString from = timeText(frame.from, "yyyy/MM/dd");
    const QString to = timeText(frame.to, "yyyy/MM/dd");
    return from == to ? from : tr("%1 to %2").arg(from, to);
}

QString LogChart::binText(int first, int last) const {
    LogHistogram::Counts sums{};
    for (int bin = first; bin <= last; ++bin) {
        for (std::size_t type = 0; type < sums.size(); ++type)
            sums[type] += m_bins.counts(bin)[type];
    }
    QStringList parts;
    for (const LogEntry::Type type : stacked) {
        if (const int count = countOf(sums, type); count > 0)
            parts += tr("%1: %2").arg(logTypeText(type)).arg(count);
    }
    return tr("%1: %2").arg(frameText(first, last),
                            parts.isEmpty() ? tr("no entries") : parts.join(QStringLiteral(", ")));
}

void LogChart::paintEvent(QPaintEvent *) {
    QPainter painter(this);
    painter.setFont(axisFont(font()));
    paintLegend(painter);
    painter.setPen(Theme::line);
    painter.drawLine(plot().bottomLeft(), plot().bottomRight());
    if (m_bins.size() > 0) {
        paintMark(painter);
        paintBars(painter);
        paintAxis(painter);
    }
    if (hasFocus()) {
        painter.setPen(Theme::accent);
        painter.drawRect(QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5));
    }
}

void LogChart::paintMark(QPainter &painter) const {
    if (const auto marked = markedBins()) {
        const QRectF place = binRect(marked->first).united(binRect(marked->second));
        painter.fillRect(place, Theme::selection);
        painter.setPen(Theme::accent);
        painter.drawLine(place.topLeft(), place.bottomLeft());
        painter.drawLine(place.topRight(), place.bottomRight());
    }
    if (hasFocus() && m_cursor >= 0)
        painter.fillRect(binRect(m_cursor), Theme::selection);
}

void LogChart::paintBars(QPainter &painter) const {
    const int highest = std::max(m_bins.highest(), 1);
    const auto marked = markedBins();
    for (int bin = 0; bin < m_bins.size(); ++bin) {
        QRectF bar = binRect(bin);
        const qreal width = std::clamp(bar.width() - 2, 1.0, maxBarWidth);
        bar = QRectF(bar.center().x() - width / 2, bar.top(), width, bar.height());
        qreal foot = bar.bottom();
        const bool aside = marked && (bin < marked->first || bin > marked->second);
        painter.setOpacity(aside ? asideOpacity : 1);
        for (const LogEntry::Type type : stacked) {
            const int count = countOf(m_bins.counts(bin), type);
            // A single entry beside thousands is still to be seen.
            const qreal height = count > 0 ? std::max(1.0, bar.height() * count / highest) : 0;
            painter.fillRect(QRectF(bar.left(), foot - height, bar.width(), height), colourOf(type));
            foot -= height;
        }
    }
    painter.setOpacity(1);
}

void LogChart::paintAxis(QPainter &painter) const {
    const QRectF area = plot();
    const QFontMetrics metrics(painter.font());
    painter.setPen(Theme::textQuiet);
    painter.drawText(QRectF(0, area.top() - 2, scaleWidth - 6, metrics.height()), Qt::AlignRight,
                     QLocale().toString(m_bins.highest()));
    const bool hours = m_bins.unit() == LogHistogram::Unit::Hour;
    const bool oneDay = hours && m_bins.size() <= 25;
    const char *format = oneDay ? "HH:mm" : hours ? "MM/dd HH:mm" : "yyyy/MM/dd";
    const int width = metrics.horizontalAdvance(timeText(m_bins.frame(0).from, format));
    const int step = static_cast<int>(std::ceil((width + labelGap) / binRect(0).width()));
    for (int bin = 0; bin < m_bins.size(); bin += std::max(step, 1)) {
        const QRectF place(binRect(bin).left(), area.bottom() + 3, width + 1, metrics.height());
        if (place.right() <= this->width())
            painter.drawText(place, Qt::AlignLeft, timeText(m_bins.frame(bin).from, format));
    }
}

void LogChart::paintLegend(QPainter &painter) const {
    const QFontMetrics metrics(painter.font());
    int x = scaleWidth;
    for (const LogEntry::Type type : {LogEntry::Type::Alarm, LogEntry::Type::Event, LogEntry::Type::Audit}) {
        const QString text = logTypeText(type);
        painter.fillRect(x, 5, 8, 8, colourOf(type));
        painter.setPen(Theme::textDim);
        painter.drawText(x + 13, 3 + metrics.ascent() - 1, text);
        x += 13 + metrics.horizontalAdvance(text) + labelGap;
    }
}
