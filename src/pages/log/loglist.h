#pragma once

#include "platform/json.h"

#include <QString>

#include <array>
#include <memory>
#include <optional>
#include <vector>

/// The columns of the log table, in their order.
enum class LogColumn { Time, Source, Type, User, Description };
constexpr int logColumnCount = 5;

/// Title of a column, as the table and the exported file name it.
QString logColumnTitle(LogColumn column);

/// An entry of the service's log, read once from its row.
struct LogEntry {
    enum class Source { Device, System, Other };
    enum class Type { Alarm, Event, Audit, Other };
    static constexpr int typeCount = 4;
    /// The time of an entry whose record tells none that a calendar has.
    static constexpr qint64 noTime = -1'000'000'000'000'000;

    qint64 at = noTime; ///< Unix ms
    Source source = Source::Other;
    Type type = Type::Other;
    QString sourceText; ///< as it is shown; that of the service where the client has no word for it
    QString typeText;
    QString user;
    QString description;

    /// What a cell of the table shows, and a field of the exported file holds.
    QString text(LogColumn column) const;
};

/// A time as "yyyy/MM/dd hh:mm:ss" of this computer's time zone; empty for noTime.
QString logTimeText(qint64 at);

/// The words for what is known; the choices of the filters are the same.
QString logSourceText(LogEntry::Source source);
QString logTypeText(LogEntry::Type type);

/// A span of time, both ends included; Unix ms.
struct TimeRange {
    qint64 from = 0;
    qint64 to = 0;

    bool contains(qint64 at) const { return at >= from && at <= to; }
    bool operator==(const TimeRange &) const = default;
};

/// The entries of an answer with their orders by every column. Never changed once read, so threads share it
/// freely; reading it takes its time and belongs on a runner.
class LogList {
public:
    LogList() = default;

    /// table: as CApiClient::browseLogs gives it. A value of a wrong type spoils itself only. Throws for a
    /// table that is no array.
    static std::shared_ptr<const LogList> parse(const JSON &table);

    int size() const { return static_cast<int>(m_entries.size()); }
    const LogEntry &at(int place) const { return m_entries[static_cast<std::size_t>(place)]; }

    /// The places of all entries sorted by a column; those that are alike, the newest first.
    const std::vector<int> &order(LogColumn column, Qt::SortOrder direction) const;
    /// The same, but only of the entries that match and, where a span is given, lie in it.
    std::vector<int> order(LogColumn column, Qt::SortOrder direction, const std::vector<char> &matches,
                           const std::optional<TimeRange> &span = std::nullopt) const;
    /// All that an entry shows, folded for a search without regard to case.
    const QString &searchText(int place) const { return m_searchTexts[static_cast<std::size_t>(place)]; }

private:
    void sortByTime();
    void sortByText(LogColumn column);

    std::vector<LogEntry> m_entries;
    std::vector<QString> m_searchTexts;
    std::array<std::array<std::vector<int>, 2>, logColumnCount> m_orders; ///< ascending, descending
};

using LogListPtr = std::shared_ptr<const LogList>;

/// What the user wants to see of a result.
struct LogFilter {
    std::optional<LogEntry::Source> source;
    std::optional<LogEntry::Type> type;
    QString search; ///< words that an entry shows, all of them

    bool operator==(const LogFilter &) const = default;

    /// Which entries match, by their places.
    std::vector<char> matches(const LogList &list) const;
};
