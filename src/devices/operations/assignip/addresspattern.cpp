#include "devices/operations/assignip/addresspattern.h"

#include "base/ipv4.h"

#include <QDebug>
#include <QRegularExpression>
#include <QStringList>

#include <algorithm>
#include <array>
#include <cstdlib>
#include <stdexcept>

namespace AddressPattern {

namespace {

constexpr int partCount = 4;
constexpr int maxPartBytes = 255;
/// A pattern that offers almost nothing usable is given up after so many addresses.
constexpr int maxPolls = 4'000'000;

struct Span {
    int first = 0;
    int last = 0;
};

Span spanOf(const QString &part) {
    if (part == QLatin1String("*"))
        return {0, maxPartBytes};
    const QStringList ends = part.split(u'-');
    const auto [low, high] = std::minmax({ends.first().toInt(), ends.last().toInt()});
    return {low, std::min(high, maxPartBytes)};
}

std::array<Span, partCount> spansOf(const QString &pattern) {
    std::array<Span, partCount> spans;
    const QStringList parts = pattern.split(u'.');
    for (std::size_t i = 0; i < spans.size(); ++i)
        spans[i] = spanOf(parts[static_cast<qsizetype>(i)]);
    return spans;
}

/// Those for loops and groups, and what is none.
bool isReserved(int firstPart) {
    return firstPart == 0 || firstPart == 127 || firstPart >= 224;
}

/// Collects the usable addresses of a pattern in ascending order.
class Collector {
public:
    Collector(const QString &pattern, std::size_t wanted, const Limits &limits)
        : m_spans(spansOf(pattern)), m_wanted(wanted), m_limits(limits) {}

    std::vector<quint32> collect() {
        descend(0, 0);
        return std::move(m_found);
    }

private:
    void descend(std::size_t part, quint32 prefix) {
        for (int number = m_spans[part].first; number <= m_spans[part].last && !isDone(); ++number) {
            if (part == 0 && isReserved(number))
                continue;
            const quint32 address = prefix << 8 | static_cast<quint32>(number);
            if (part + 1 < m_spans.size())
                descend(part + 1, address);
            else
                look(address);
        }
    }

    void look(quint32 address) {
        ++m_looks;
        if (isUsable(address, m_limits))
            m_found.push_back(address);
    }

    bool isDone() const { return m_found.size() == m_wanted || m_looks == maxPolls; }

    std::array<Span, partCount> m_spans;
    std::size_t m_wanted;
    const Limits &m_limits;
    int m_looks = 0;
    std::vector<quint32> m_found;
};

} // namespace

bool isAddress(const QString &text) {
    const std::optional<std::uint32_t> address = Ipv4::parse(text.toLatin1().toStdString());
    return address && textOf(*address) == text;
}

quint32 numberOf(const QString &text) {
    return Ipv4::parse(text.toLatin1().toStdString()).value_or(0);
}

QString textOf(quint32 address) {
    return QString::fromStdString(Ipv4::toText(address));
}

bool isMask(const QString &text) {
    return isAddress(text) && Ipv4::isMask(numberOf(text));
}

bool isPattern(const QString &text) {
    static const QRegularExpression rule(QStringLiteral(
        R"(^(\*|(?:\d{1,3}(?:-\d{1,3})?))\.(\*|(?:\d{1,3}(?:-\d{1,3})?))\.(\*|(?:\d{1,3}(?:-\d{1,3})?))\.(\*|(?:\d{1,3}(?:-\d{1,3})?))\z)"));
    return rule.match(text).hasMatch();
}

QStringList split(const QString &list) {
    static const QRegularExpression separator(QStringLiteral("[,;\\s]+"));
    return list.split(separator, Qt::SkipEmptyParts);
}

namespace {

/// Throws for a text that is no number.
int numberOf(const QString &text) {
    bool isNumber = false;
    const int number = text.toInt(&isNumber);
    if (!isNumber)
        throw std::invalid_argument('"' + text.toStdString() + "\" is no number");
    return number;
}

qint64 product(const QString &pattern) {
    qint64 product = 1;
    for (const QString &part : pattern.split(u'.')) {
        const QStringList ends = part.split(u'-');
        if (part == QLatin1String("*"))
            product *= maxPartBytes + 1;
        else if (part.contains(u'-'))
            product *= ends.size() == 2 && !ends.contains(QString())
                           ? std::abs(numberOf(ends[0]) - numberOf(ends[1])) + 1
                           : 0;
    }
    return product;
}

} // namespace

qint64 count(const QString &pattern) {
    try {
        return product(pattern);
    } catch (const std::exception &error) {
        qWarning("Counting IPs occur error - %s", error.what());
        return 0;
    }
}

bool isUsable(quint32 address, const Limits &limits) {
    const quint32 host = address & ~limits.mask;
    const bool isEnd = ~limits.mask > 1 && (host == 0 || host == ~limits.mask);
    return !isReserved(static_cast<int>(address >> 24)) && !isEnd && address != limits.gateway &&
           !limits.taken.contains(address);
}

std::vector<quint32> lowest(const QStringList &patterns, std::size_t wanted, const Limits &limits) {
    std::vector<quint32> all;
    for (const QString &pattern : patterns) {
        const std::vector<quint32> found = Collector(pattern, wanted, limits).collect();
        all.insert(all.end(), found.begin(), found.end());
    }
    std::sort(all.begin(), all.end());
    all.erase(std::unique(all.begin(), all.end()), all.end());
    all.resize(std::min(all.size(), wanted));
    return all;
}

} // namespace AddressPattern
