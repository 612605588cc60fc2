#pragma once

#include <QTableWidget>

class QHelpEvent;

/// The common look of the console's tables: whole rows selected, fixed row heights, a hovered row, no grid.
class CustomTable : public QTableWidget {
    Q_OBJECT

public:
    explicit CustomTable(QWidget *parent = nullptr);

    /// The row under the pointer, or -1.
    int hoveredRow() const { return m_hoveredRow; }

protected:
    bool viewportEvent(QEvent *event) override;
    void currentChanged(const QModelIndex &current, const QModelIndex &previous) override;
    void focusInEvent(QFocusEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;

private:
    bool showClippedText(QHelpEvent *event);
    void setHoveredRow(int row);
    void updateRow(int row);

    int m_hoveredRow = -1;
};
