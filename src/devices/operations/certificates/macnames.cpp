#include "devices/operations/certificates/macnames.h"

namespace MacNames {

namespace {

constexpr int digitCount = 12;

/// The value of a hex digit, or -1.
int digitOf(QChar c) {
    const char letter = c.toLower().toLatin1();
    if (letter >= '0' && letter <= '9')
        return letter - '0';
    return letter >= 'a' && letter <= 'f' ? letter - 'a' + 10 : -1;
}

/// Reads an address from a place on, which then stands behind it; 0 where there is none.
quint64 readFrom(const QString &text, qsizetype &at) {
    quint64 address = 0;
    for (int digits = 0; digits < digitCount; ++digits) {
        if (digits > 0 && at < text.size() && !text[at].isLetterOrNumber())
            ++at;
        const int digit = at < text.size() ? digitOf(text[at]) : -1;
        if (digit < 0)
            return 0;
        address = address << 4 | static_cast<quint64>(digit);
        ++at;
    }
    return address;
}

} // namespace

std::vector<quint64> in(const QString &text) {
    std::vector<quint64> found;
    for (qsizetype start = 0; start < text.size(); ++start) {
        qsizetype at = start;
        const quint64 address = digitOf(text[start]) < 0 ? 0 : readFrom(text, at);
        if (address != 0)
            found.push_back(address);
    }
    return found;
}

} // namespace MacNames
