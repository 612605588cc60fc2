#pragma once

#include <QWidget>

/// A title area: moves its top-level window through the window system and tells of double clicks.
class WindowDragger : public QWidget {
    Q_OBJECT

public:
    explicit WindowDragger(QWidget *parent = nullptr);

signals:
    void doubleClicked();
    /// The user begins to move the window.
    void dragged();

protected:
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseDoubleClickEvent(QMouseEvent *event) override;

private:
    QPoint m_pressedAt;
    bool m_pressed = false;
};
