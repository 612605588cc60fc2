#include "widgets/style/pluraltranslator.h"

#include <cstring>

QString PluralTranslator::translate(const char *, const char *sourceText, const char *, int n) const {
    // No text of its own for anything else.
    if (n < 0 || !sourceText || !std::strstr(sourceText, "(s)"))
        return {};
    return QString::fromUtf8(sourceText)
        .replace(QLatin1String("(s)"), n == 1 ? QString() : QStringLiteral("s"));
}
