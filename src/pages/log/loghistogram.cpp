#include "pages/log/loghistogram.h"

#include <QDateTime>

#include <algorithm>
#include <numeric>

namespace {

constexpr qint64 hourMs = 3'600'000;
constexpr qint64 dayMs = 24 * hourMs;
constexpr qint64 maxHoursShown = 4 * dayMs;
constexpr qint64 maxDays = 366;

QDate dateOf(qint64 at) {
    return QDateTime::fromMSecsSinceEpoch(at).date();
}

/// The part of a frame in which there are entries with a time.
TimeRange occupied(const TimeRange &frame, const LogList &list) {
    const std::vector<int> &order = list.order(LogColumn::Time, Qt::AscendingOrder);
    const auto first = std::partition_point(order.begin(), order.end(),
                                            [&](int place) { return list.at(place).at < frame.from; });
    const auto last = std::partition_point(order.begin(), order.end(),
                                           [&](int place) { return list.at(place).at <= frame.to; });
    return first == last ? frame : TimeRange{list.at(*first).at, list.at(*(last - 1)).at};
}

} // namespace

LogHistogram::LogHistogram(TimeRange frame, const LogList &list) {
    if (frame.to < frame.from)
        return;
    if (frame.to - frame.from > maxDays * dayMs && list.size() > 0)
        frame = occupied(frame, list);
    if (frame.to - frame.from <= maxHoursShown)
        addHours(frame);
    else
        addDays(frame);
    m_counts.resize(m_edges.size() - 1);
}

void LogHistogram::addHours(const TimeRange &frame) {
    m_unit = Unit::Hour;
    // Full hours of the clock on the wall, which some time zones do not share with the others.
    const QTime wall = QDateTime::fromMSecsSinceEpoch(frame.from).time();
    qint64 edge = frame.from - QTime(0, 0).msecsTo(QTime(0, wall.minute(), wall.second(), wall.msec()));
    for (; edge <= frame.to; edge += hourMs)
        m_edges.push_back(edge);
    m_edges.push_back(edge);
}

void LogHistogram::addDays(const TimeRange &frame) {
    const QDate first = dateOf(frame.from);
    const qint64 days = first.daysTo(dateOf(frame.to)) + 1;
    const qint64 step = (days + maxDays - 1) / maxDays;
    m_unit = step == 1 ? Unit::Day : Unit::Days;
    for (qint64 day = 0; day < days + step; day += step)
        m_edges.push_back(first.addDays(day).startOfDay().toMSecsSinceEpoch());
}

void LogHistogram::count(const LogList &list, const std::vector<int> &places) {
    std::fill(m_counts.begin(), m_counts.end(), Counts{});
    std::size_t bin = 0;
    for (const int place : places) {
        const LogEntry &entry = list.at(place);
        while (bin < m_counts.size() && entry.at >= m_edges[bin + 1])
            ++bin;
        if (bin == m_counts.size())
            return;
        if (entry.at >= m_edges[bin])
            ++m_counts[bin][static_cast<std::size_t>(entry.type)];
    }
}

TimeRange LogHistogram::frame(int first, int last) const {
    return {m_edges[static_cast<std::size_t>(first)], m_edges[static_cast<std::size_t>(last) + 1] - 1};
}

int LogHistogram::total(int bin) const {
    return std::accumulate(counts(bin).begin(), counts(bin).end(), 0);
}

int LogHistogram::highest() const {
    int highest = 0;
    for (int bin = 0; bin < size(); ++bin)
        highest = std::max(highest, total(bin));
    return highest;
}

std::optional<std::pair<int, int>> LogHistogram::binsOf(const TimeRange &span) const {
    if (m_counts.empty() || span.to < m_edges.front() || span.from >= m_edges.back())
        return std::nullopt;
    const auto binAt = [this](qint64 at) {
        const auto after = std::upper_bound(m_edges.begin(), m_edges.end(), at);
        return std::clamp(static_cast<int>(after - m_edges.begin()) - 1, 0, size() - 1);
    };
    return std::pair(binAt(span.from), binAt(span.to));
}
