#pragma once

#include <QStringList>

/// Collects what is logged, from any thread, in place of the handler that was there. One at a time.
class LogCapture {
public:
    LogCapture();
    ~LogCapture();
    LogCapture(const LogCapture &) = delete;
    LogCapture &operator=(const LogCapture &) = delete;

    QStringList lines() const;
    /// How many lines contain the text.
    qsizetype count(const QString &text) const;

private:
    QtMessageHandler m_previous;
};
