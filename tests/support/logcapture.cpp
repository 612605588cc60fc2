#include "logcapture.h"

#include <mutex>

namespace {

std::mutex capturedMutex;
QStringList captured;

void collect(QtMsgType, const QMessageLogContext &, const QString &message) {
    const std::lock_guard lock(capturedMutex);
    captured.append(message);
}

} // namespace

LogCapture::LogCapture() {
    {
        const std::lock_guard lock(capturedMutex);
        captured.clear();
    }
    m_previous = qInstallMessageHandler(collect);
}

LogCapture::~LogCapture() {
    qInstallMessageHandler(m_previous);
}

QStringList LogCapture::lines() const {
    const std::lock_guard lock(capturedMutex);
    return captured;
}

qsizetype LogCapture::count(const QString &text) const {
    return lines().filter(text).size();
}
