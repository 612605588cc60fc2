#include "devicesearch.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace {

constexpr int macLength = 12;

/// The digits of a MAC, or of a part of one; empty for anything else.
QByteArray macDigitsOf(const QString &text) {
    QByteArray digits;
    for (const QChar c : text) {
        if (c == u':' || c == u'-' || c == u'.')
            continue;
        const char letter = c.toUpper().toLatin1();
        if (!std::isxdigit(static_cast<unsigned char>(letter)))
            return {};
        digits += letter;
    }
    return digits.size() >= 2 && digits.size() <= macLength ? digits : QByteArray();
}

bool macContains(quint64 key, const QByteArray &digits) {
    std::array<char, macLength> letters{};
    for (auto letter = letters.rbegin(); letter != letters.rend(); ++letter, key >>= 4)
        *letter = "0123456789ABCDEF"[key & 15];
    return std::string_view(letters.data(), letters.size()).find(digits.constData()) !=
           std::string_view::npos;
}

} // namespace

DeviceSearch::DeviceSearch(const QString &text, const QHash<QString, QString> &siteNames) {
    for (const QString &part : text.split(QLatin1Char(' '), Qt::SkipEmptyParts)) {
        Word word;
        word.text = part.toCaseFolded().toStdString();
        if (!readRange(part, word)) {
            word.macDigits = macDigitsOf(part);
            for (auto site = siteNames.begin(); site != siteNames.end(); ++site) {
                if (site.value().contains(part, Qt::CaseInsensitive))
                    word.sites.insert(site.key());
            }
        }
        m_words.push_back(std::move(word));
    }
}

bool DeviceSearch::readRange(const QString &text, Word &word) {
    const qsizetype slash = text.indexOf(QLatin1Char('/'));
    const qsizetype dash = text.indexOf(QLatin1Char('-'));
    const QStringView view(text);
    const quint64 first = DeviceRecords::ipSortKey(view.left(slash > 0 ? slash : dash));
    if ((slash <= 0 && dash <= 0) || first == DeviceRecord::unknownKey)
        return false;
    bool isNumber = false;
    if (slash > 0) {
        const int bits = view.mid(slash + 1).toInt(&isNumber);
        if (!isNumber || bits < 0 || bits > 32)
            return false;
        const quint64 hosts = (quint64{1} << (32 - bits)) - 1;
        word.firstIp = first & ~hosts;
        word.lastIp = word.firstIp | hosts;
        return true;
    }
    const QStringView end = view.mid(dash + 1);
    const uint last = end.toUInt(&isNumber);
    word.firstIp = first;
    word.lastIp = isNumber && last <= 255 ? (first & ~quint64{255}) | last : DeviceRecords::ipSortKey(end);
    return word.lastIp != DeviceRecord::unknownKey;
}

bool DeviceSearch::matches(const DeviceRecord &device) const {
    return std::all_of(m_words.begin(), m_words.end(),
                       [&](const Word &word) { return matches(word, device); });
}

bool DeviceSearch::matches(const Word &word, const DeviceRecord &device) {
    const quint64 ip = device.sortKey(DeviceColumn::Ip);
    if (word.firstIp <= word.lastIp)
        return ip >= word.firstIp && ip <= word.lastIp;
    if (device.searchText.find(word.text) != std::string::npos)
        return true;
    const quint64 mac = device.sortKey(DeviceColumn::Mac);
    if (!word.macDigits.isEmpty() && mac != DeviceRecord::unknownKey && macContains(mac, word.macDigits))
        return true;
    return !word.sites.isEmpty() && std::any_of(device.siteIds.begin(), device.siteIds.end(),
                                                [&](const QString &id) { return word.sites.contains(id); });
}
