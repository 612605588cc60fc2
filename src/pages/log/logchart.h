#pragma once

#include "pages/log/loghistogram.h"

#include <QWidget>

/// Bars of the entries of each hour or day, by type. A span of them is chosen with the pointer, or with the
/// arrow keys, Shift and Enter; Escape gives it up.
class LogChart : public QWidget {
    Q_OBJECT

public:
    explicit LogChart(QWidget *parent = nullptr);

    void setBins(const LogHistogram &bins);
    /// Marks the span that the table is narrowed to.
    void setSpan(const std::optional<TimeRange> &span);

    QSize sizeHint() const override { return {400, 132}; }
    QSize minimumSizeHint() const override { return {200, 132}; }
    /// Where a bar and the ground above it stand.
    QRectF binRect(int bin) const;

signals:
    void spanChosen(const TimeRange &span);
    void spanGivenUp();

protected:
    void paintEvent(QPaintEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void focusInEvent(QFocusEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;
    bool event(QEvent *event) override;

private:
    QRectF plot() const;
    int binAt(qreal x) const;
    /// The bins that are being chosen, or were.
    std::optional<std::pair<int, int>> markedBins() const;
    void moveCursor(int bin, bool extends);
    void choose();
    QString frameText(int first, int last) const;
    QString binText(int first, int last) const;
    void tellCursor();
    void paintBars(QPainter &painter) const;
    void paintAxis(QPainter &painter) const;
    void paintLegend(QPainter &painter) const;
    void paintMark(QPainter &painter) const;

    LogHistogram m_bins;
    std::optional<TimeRange> m_span;
    int m_cursor = -1; ///< the bin that the keys have come to, or the pointer's other end of a drag
    int m_anchor = -1; ///< where the span began that is being chosen; -1 when none is
    bool m_dragging = false;
};
