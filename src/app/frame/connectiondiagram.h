#pragma once

#include <QWidget>

/// Draws the link between the device manager and the remote-access service.
class ConnectionDiagram : public QWidget {
    Q_OBJECT

public:
    enum class State { Unknown, Connected, Interrupted };

    explicit ConnectionDiagram(QWidget *parent = nullptr);

    void setState(State state);
    QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent *event) override;

private:
    State m_state = State::Unknown;
};
