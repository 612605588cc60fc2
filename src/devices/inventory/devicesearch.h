#pragma once

#include "devices/inventory/devicerecord.h"

#include <QHash>
#include <QSet>

#include <vector>

/// What the search box asks of a device: that each of its words is found.
///
/// A word is found in model, host name, IP, firmware, the name of a site, or in the MAC whatever separates
/// its digits. Networks ("10.4.0.0/16") and ranges ("10.4.0.10-10.4.1.20", "10.4.0.10-20") are compared with
/// the address alone.
class DeviceSearch {
public:
    DeviceSearch() = default;
    /// siteNames: the names of the sites by their ids.
    DeviceSearch(const QString &text, const QHash<QString, QString> &siteNames);

    bool isEmpty() const { return m_words.empty(); }
    bool matches(const DeviceRecord &device) const;

private:
    struct Word {
        std::string text;     ///< without case
        QByteArray macDigits; ///< empty for a word that is no part of a MAC
        QSet<QString> sites;  ///< whose names contain the word
        quint64 firstIp = 1;
        quint64 lastIp = 0; ///< below the first one for a word that is no range
    };

    static bool readRange(const QString &text, Word &word);
    static bool matches(const Word &word, const DeviceRecord &device);

    std::vector<Word> m_words;
};
