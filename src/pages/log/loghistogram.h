#pragma once

#include "pages/log/loglist.h"

/// How many entries of each type fall into each hour, day or run of days of a time frame.
class LogHistogram {
public:
    enum class Unit { Hour, Day, Days };
    using Counts = std::array<int, LogEntry::typeCount>;

    LogHistogram() = default;
    /// Divides the frame: hours up to some days, days up to a year, runs of days beyond. A frame beyond a
    /// year is cut to where the list has entries.
    LogHistogram(TimeRange frame, const LogList &list);

    /// Counts the entries at the places, which must be in their order by time.
    void count(const LogList &list, const std::vector<int> &places);

    int size() const { return static_cast<int>(m_counts.size()); }
    Unit unit() const { return m_unit; }
    /// The time of a bin, or of a run of them.
    TimeRange frame(int bin) const { return frame(bin, bin); }
    TimeRange frame(int first, int last) const;
    const Counts &counts(int bin) const { return m_counts[static_cast<std::size_t>(bin)]; }
    int total(int bin) const;
    int highest() const;
    /// The bins that a span of time touches, as first and last; nothing when it lies beside them.
    std::optional<std::pair<int, int>> binsOf(const TimeRange &span) const;

private:
    void addHours(const TimeRange &frame);
    void addDays(const TimeRange &frame);

    Unit m_unit = Unit::Hour;
    std::vector<qint64> m_edges; ///< where each bin begins, and at the end where the last one ends
    std::vector<Counts> m_counts;
};
