#include "pages/log/loglist.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QHash>
#include <QSet>
#include <QStringMatcher>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <cmath>
#include <numeric>
#include <stdexcept>

namespace {

// The years that have four digits.
constexpr qint64 firstTime = -62'135'596'800'000;
constexpr qint64 lastTime = 253'402'300'799'999;

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(LogWindow)
};

constexpr const char *columnTitles[logColumnCount] = {
    QT_TRANSLATE_NOOP("LogWindow", "Date/Time"), QT_TRANSLATE_NOOP("LogWindow", "Source"),
    QT_TRANSLATE_NOOP("LogWindow", "Type"), QT_TRANSLATE_NOOP("LogWindow", "User"),
    QT_TRANSLATE_NOOP("LogWindow", "Description")};

constexpr const char *sourceNames[] = {QT_TRANSLATE_NOOP("LogWindow", "Device"),
                                       QT_TRANSLATE_NOOP("LogWindow", "System")};
constexpr const char *typeNames[] = {QT_TRANSLATE_NOOP("LogWindow", "Alarm"),
                                     QT_TRANSLATE_NOOP("LogWindow", "Event"),
                                     QT_TRANSLATE_NOOP("LogWindow", "Audit")};

/// The place of a text in a list of names, or the number of names.
template <std::size_t count>
std::size_t placeOf(std::string_view text, const char *const (&names)[count]) {
    return static_cast<std::size_t>(std::find(std::begin(names), std::end(names), text) - std::begin(names));
}

qint64 timeOf(const JSON &row) {
    const auto found = row.find("Date/Time");
    if (found == row.end())
        return LogEntry::noTime;
    double time = std::nan("");
    if (found->is_number()) {
        time = found->get<double>();
    } else if (found->is_string()) {
        bool isNumber = false;
        const double read = stringMember(row, "Date/Time").toDouble(&isNumber);
        time = isNumber ? read : time;
    }
    // A number of this kind is exact far beyond the last year.
    return time >= firstTime && time <= lastTime ? static_cast<qint64>(time) : LogEntry::noTime;
}

/// Reads rows, and keeps one copy of the texts that most of them share.
class RowReader {
public:
    LogEntry read(const JSON &row) {
        LogEntry entry;
        if (!row.is_object())
            return entry;
        entry.at = timeOf(row);
        const std::size_t source = placeOf(textMember(row, "Source"), sourceNames);
        const std::size_t type = placeOf(textMember(row, "Type"), typeNames);
        entry.source = static_cast<LogEntry::Source>(source);
        entry.type = static_cast<LogEntry::Type>(type);
        entry.sourceText = shared(source < std::size(sourceNames) ? logSourceText(entry.source)
                                                                  : stringMember(row, "Source"));
        entry.typeText =
            shared(type < std::size(typeNames) ? logTypeText(entry.type) : stringMember(row, "Type"));
        entry.user = shared(stringMember(row, "User"));
        entry.description = stringMember(row, "Description");
        return entry;
    }

private:
    QString shared(const QString &text) { return *m_texts.insert(text); }

    QSet<QString> m_texts;
};

/// The other direction, with entries that are alike still in the order they were in.
template <typename Alike>
std::vector<int> turned(const std::vector<int> &order, Alike alike) {
    std::vector<int> result;
    result.reserve(order.size());
    auto end = order.end();
    while (end != order.begin()) {
        auto begin = end - 1;
        while (begin != order.begin() && alike(*(begin - 1), *begin))
            --begin;
        result.insert(result.end(), begin, end);
        end = begin;
    }
    return result;
}

/// Numbers in the order of the entries' texts, case apart. Most texts stand in many entries, so each one is
/// compared with others once only.
std::vector<int> ranksOf(const std::vector<LogEntry> &entries, LogColumn column) {
    QHash<QString, int> numbers;
    std::vector<int> ranks;
    ranks.reserve(entries.size());
    for (const LogEntry &entry : entries) {
        const auto found = numbers.constFind(entry.text(column));
        ranks.push_back(found != numbers.cend() ? *found
                                                : *numbers.insert(entry.text(column), int(numbers.size())));
    }
    std::vector<std::pair<QString, int>> texts;
    for (auto number = numbers.cbegin(); number != numbers.cend(); ++number)
        texts.emplace_back(number.key().toCaseFolded(), number.value());
    std::sort(texts.begin(), texts.end());
    std::vector<int> rankOfNumber(texts.size());
    for (std::size_t i = 0, rank = 0; i < texts.size(); ++i) {
        if (i > 0 && texts[i].first != texts[i - 1].first)
            rank = i;
        rankOfNumber[static_cast<std::size_t>(texts[i].second)] = static_cast<int>(rank);
    }
    for (int &rank : ranks)
        rank = rankOfNumber[static_cast<std::size_t>(rank)];
    return ranks;
}

/// A word of a search. A single letter is found faster without a table to leap by.
class SearchWord {
public:
    explicit SearchWord(const QString &word) : m_word(word), m_matcher(word) {}

    bool isIn(const QString &text) const {
        return m_word.size() == 1 ? text.contains(m_word.front()) : m_matcher.indexIn(text) >= 0;
    }

private:
    QString m_word;
    QStringMatcher m_matcher;
};

std::vector<SearchWord> wordsOf(const QString &search) {
    std::vector<SearchWord> words;
    for (const QString &word : search.toCaseFolded().split(QLatin1Char(' '), Qt::SkipEmptyParts))
        words.emplace_back(word);
    return words;
}

} // namespace

QString logColumnTitle(LogColumn column) {
    return Texts::tr(columnTitles[static_cast<int>(column)]);
}

QString logSourceText(LogEntry::Source source) {
    return Texts::tr(sourceNames[static_cast<int>(source)]);
}

QString logTypeText(LogEntry::Type type) {
    return type == LogEntry::Type::Other ? Texts::tr("Other") : Texts::tr(typeNames[static_cast<int>(type)]);
}

QString logTimeText(qint64 at) {
    if (at == LogEntry::noTime)
        return {};
    return QDateTime::fromMSecsSinceEpoch(at).toString(QStringLiteral("yyyy/MM/dd hh:mm:ss"));
}

QString LogEntry::text(LogColumn column) const {
    switch (column) {
    case LogColumn::Time:
        return logTimeText(at);
    case LogColumn::Source:
        return sourceText;
    case LogColumn::Type:
        return typeText;
    case LogColumn::User:
        return user;
    case LogColumn::Description:
        return description;
    }
    return {};
}

LogListPtr LogList::parse(const JSON &table) {
    if (!table.is_array())
        throw std::runtime_error("the log is no array");
    auto list = std::make_shared<LogList>();
    list->m_entries.reserve(table.size());
    list->m_searchTexts.reserve(table.size());
    RowReader reader;
    for (const JSON &row : table) {
        const LogEntry &entry = list->m_entries.emplace_back(reader.read(row));
        list->m_searchTexts.push_back(QStringList{logTimeText(entry.at), entry.sourceText, entry.typeText,
                                                  entry.user, entry.description}
                                          .join(QLatin1Char('\n'))
                                          .toCaseFolded());
    }
    list->sortByTime();
    for (const LogColumn column :
         {LogColumn::Source, LogColumn::Type, LogColumn::User, LogColumn::Description})
        list->sortByText(column);
    return list;
}

const std::vector<int> &LogList::order(LogColumn column, Qt::SortOrder direction) const {
    return m_orders[static_cast<std::size_t>(column)][direction == Qt::DescendingOrder ? 1 : 0];
}

void LogList::sortByTime() {
    auto &[ascending, descending] = m_orders[static_cast<std::size_t>(LogColumn::Time)];
    descending.resize(m_entries.size());
    std::iota(descending.begin(), descending.end(), 0);
    std::stable_sort(descending.begin(), descending.end(),
                     [this](int a, int b) { return at(a).at > at(b).at; });
    ascending = turned(descending, [this](int a, int b) { return at(a).at == at(b).at; });
}

void LogList::sortByText(LogColumn column) {
    const std::vector<int> ranks = ranksOf(m_entries, column);
    const auto rank = [&](int place) { return ranks[static_cast<std::size_t>(place)]; };
    auto &[ascending, descending] = m_orders[static_cast<std::size_t>(column)];
    ascending = order(LogColumn::Time, Qt::DescendingOrder);
    std::stable_sort(ascending.begin(), ascending.end(), [&](int a, int b) { return rank(a) < rank(b); });
    descending = turned(ascending, [&](int a, int b) { return rank(a) == rank(b); });
}

std::vector<int> LogList::order(LogColumn column, Qt::SortOrder direction, const std::vector<char> &matches,
                                const std::optional<TimeRange> &span) const {
    std::vector<int> places;
    places.reserve(m_entries.size());
    for (const int place : order(column, direction)) {
        if (matches[static_cast<std::size_t>(place)] && (!span || span->contains(at(place).at)))
            places.push_back(place);
    }
    return places;
}

std::vector<char> LogFilter::matches(const LogList &list) const {
    const std::vector<SearchWord> words = wordsOf(search);
    std::vector<char> result(static_cast<std::size_t>(list.size()));
    for (int place = 0; place < list.size(); ++place) {
        const LogEntry &entry = list.at(place);
        result[static_cast<std::size_t>(place)] =
            (!source || entry.source == *source) && (!type || entry.type == *type) &&
            std::all_of(words.begin(), words.end(),
                        [&](const SearchWord &word) { return word.isIn(list.searchText(place)); });
    }
    return result;
}
