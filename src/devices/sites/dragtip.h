#pragma once

#include <QWidget>

/// A tip that follows the cursor while something is dragged and says what a drop would do.
class DragTip : public QWidget {
    Q_OBJECT

public:
    explicit DragTip(QWidget *parent);

    /// Shows the text, as it stands, beside the cursor.
    void showAt(const QPoint &cursor, const QString &text);
    const QString &text() const { return m_text; }

protected:
    void paintEvent(QPaintEvent *event) override;

private:
    QString m_text;
};
