#include "platform/log/repeatedlines.h"

#include <algorithm>
#include <limits>

namespace {

constexpr qint64 minuteMs = 60000;
/// Beyond these a line is written each time.
constexpr qsizetype maxLineBytes = 2000;
constexpr qsizetype maxLines = 500;

} // namespace

bool RepeatedLines::count(const Line &line, qint64 nowMs) {
    writeEnded(nowMs);
    if (line.text.size() > maxLineBytes)
        return false;
    const QByteArray key = QByteArray::number(line.line) + ' ' + line.text;
    if (const auto found = m_entries.find(key); found != m_entries.end()) {
        ++found->repeats;
        return true;
    }
    if (m_entries.size() >= maxLines)
        return false;
    m_nextEndMs = m_entries.isEmpty() ? nowMs + minuteMs : std::min(m_nextEndMs, nowMs + minuteMs);
    m_entries.insert(key, {line, nowMs + minuteMs});
    return false;
}

void RepeatedLines::writeEnded(qint64 nowMs) {
    // A clock that was set back must not hold the counts back.
    if (m_entries.isEmpty() || (nowMs < m_nextEndMs && nowMs >= m_nextEndMs - minuteMs))
        return;
    m_nextEndMs = std::numeric_limits<qint64>::max();
    for (auto entry = m_entries.begin(); entry != m_entries.end();) {
        if (nowMs < entry->endMs && nowMs >= entry->endMs - minuteMs) {
            m_nextEndMs = std::min(m_nextEndMs, entry->endMs);
            ++entry;
            continue;
        }
        writeCount(*entry);
        entry = m_entries.erase(entry);
    }
}

void RepeatedLines::writeAll() {
    for (const Entry &entry : std::as_const(m_entries))
        writeCount(entry);
    m_entries.clear();
}

void RepeatedLines::writeCount(const Entry &entry) const {
    if (entry.repeats == 0)
        return;
    Line line = entry.line;
    line.text += " [repeated " + QByteArray::number(entry.repeats) + " times within a minute]";
    m_write(line);
}
