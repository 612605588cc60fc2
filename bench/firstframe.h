#pragma once

#include <QEvent>
#include <QWidget>

#include <chrono>
#include <cstdio>
#include <cstdlib>

/// Prints the microseconds from the moment that the environment names (BENCH_STARTED_NS, of the monotonic
/// clock) to a window's first frame, and ends the program there.
class FirstFrame : public QObject {
public:
    explicit FirstFrame(QWidget &window) : QObject(&window) { window.installEventFilter(this); }

    bool eventFilter(QObject *, QEvent *event) override {
        // The update request that follows the exposure paints the frame; the queued call comes after it.
        if (event->type() == QEvent::Paint && !m_seen) {
            m_seen = true;
            QMetaObject::invokeMethod(
                this, [] { report(); }, Qt::QueuedConnection);
        }
        return false;
    }

private:
    static void report() {
        using namespace std::chrono;
        const auto now = duration_cast<nanoseconds>(steady_clock::now().time_since_epoch()).count();
        const char *started = std::getenv("BENCH_STARTED_NS");
        std::fprintf(stderr, "first frame: %lld us\n", (now - std::atoll(started ? started : "0")) / 1000);
        // The event loop has not begun yet where the program waits for its window.
        std::_Exit(0);
    }

    bool m_seen = false;
};
