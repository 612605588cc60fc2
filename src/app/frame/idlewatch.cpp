#include "app/frame/idlewatch.h"

#include <QTimerEvent>

void IdleWatch::start() {
    restartTimer();
    m_active = true;
}

void IdleWatch::stop() {
    if (m_timerId != none)
        killTimer(m_timerId);
    m_timerId = none;
}

void IdleWatch::noteActivity() {
    if (isRunning())
        start();
}

void IdleWatch::restartTimer() {
    stop();
    m_timerId = startTimer(m_period, Qt::CoarseTimer);
}

void IdleWatch::timerEvent(QTimerEvent *event) {
    if (event->timerId() != m_timerId)
        return;
    m_active = false;
    emit idle();
}
