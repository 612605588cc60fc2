#pragma once

#include <QByteArray>
#include <QHash>
#include <QMessageLogContext>

#include <functional>

/// Counts lines that repeat within a minute, so that they need not be written each time. Not thread-safe.
class RepeatedLines {
public:
    struct Line {
        QtMsgType type;
        const char *file;
        int line;
        const char *function;
        QByteArray text;
    };
    using Write = std::function<void(const Line &)>;

    explicit RepeatedLines(Write write) : m_write(std::move(write)) {}

    /// True when the line was counted and is not to be written.
    bool count(const Line &line, qint64 nowMs);

    /// Writes the counts of the lines whose minute is over.
    void writeEnded(qint64 nowMs);
    void writeAll();

private:
    struct Entry {
        Line line;
        qint64 endMs;
        int repeats = 0;
    };

    void writeCount(const Entry &entry) const;

    Write m_write;
    QHash<QByteArray, Entry> m_entries;
    qint64 m_nextEndMs = 0;
};
