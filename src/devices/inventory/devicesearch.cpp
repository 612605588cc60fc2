#include "devices/inventory/devicesearch.h"

#include "base/macaddress.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace {

constexpr std::size_t macLength = 12;

/// The digits of a MAC, or of a part of one; empty for anything else.
QByteArray macDigitsOf(const QString &text) {
    const std::string digits = MacAddress::digits(text.toLatin1().toStdString());
    return digits.size() >= 2 && digits.size() <= macLength ? QByteArray::fromStdString(digits)
                                                            : QByteArray();
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

/// A network, or a range whose ends are both addresses; the second may be the last number of one alone. A
/// host name may begin with an address and a dash, too.
bool DeviceSearch::readRange(const QString &text, Word &word) {
    const qsizetype slash = text.indexOf(QLatin1Char('/'));
    const qsizetype sign = slash > 0 ? slash : text.indexOf(QLatin1Char('-'));
    if (sign <= 0)
        return false;
    const QStringView end = QStringView(text).mid(sign + 1);
    const quint64 first = DeviceRecords::ipSortKey(QStringView(text).left(sign));
    if (first == DeviceRecord::unknownKey)
        return false;
    bool isNumber = false;
    const uint number = end.toUInt(&isNumber);
    if (slash > 0) {
        if (!isNumber || number > 32)
            return false;
        const quint64 hosts = (quint64{1} << (32 - number)) - 1;
        word.firstIp = first & ~hosts;
        word.lastIp = word.firstIp | hosts;
        return true;
    }
    const quint64 last =
        isNumber && number <= 255 ? (first & ~quint64{255}) | number : DeviceRecords::ipSortKey(end);
    if (last == DeviceRecord::unknownKey)
        return false;
    word.firstIp = first;
    word.lastIp = last;
    return true;
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
