#pragma once

#include <QObject>

#include <chrono>

/// Tells when nobody has pressed a mouse button for two hours. Keys and moves do not count.
class IdleWatch : public QObject {
    Q_OBJECT

public:
    using QObject::QObject;

    /// Begins a session's watch with its first activity.
    void start();
    void stop();

    /// A mouse button was pressed: the period starts anew.
    void noteActivity();

    bool isRunning() const { return m_timerId != none; }
    bool wasActiveSinceLastTick() const { return m_active; }

    /// For tests, which do not wait for hours.
    void setPeriod(std::chrono::milliseconds period) { m_period = period; }

signals:
    /// A period has passed without activity.
    void idle();

protected:
    void timerEvent(QTimerEvent *event) override;

private:
    static constexpr int none = -1;

    void restartTimer();

    std::chrono::milliseconds m_period{7200000};
    int m_timerId = none;
    bool m_active = false;
};
