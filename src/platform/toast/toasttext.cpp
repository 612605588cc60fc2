#include "platform/toast/toasttext.h"

namespace {

constexpr qsizetype longest = 300;

QString cutOff(QString text) {
    if (text.size() <= longest)
        return text;
    text.truncate(longest - 1);
    // Half a character is no valid text.
    if (text.back().isHighSurrogate())
        text.chop(1);
    return text + QChar(0x2026);
}

} // namespace

QString toastLine(const QString &text) {
    QString line;
    for (const QChar character : text) {
        // Words that stood on two lines stay apart.
        if (character.isSpace())
            line += u' ';
        else if (character.category() != QChar::Other_Control)
            line += character;
    }
    return cutOff(line);
}

QString shortApplicationName(const QString &applicationName) {
    return applicationName.section(u'/', -1);
}
