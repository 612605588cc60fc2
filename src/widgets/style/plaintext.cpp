#include "widgets/style/plaintext.h"

namespace PlainText {

namespace {
constexpr int toolTipLimit = 600;
} // namespace

QString toolTip(const QString &text) {
    if (text.isEmpty())
        return {};
    const QString shown = text.size() > toolTipLimit ? text.left(toolTipLimit) + QChar(0x2026) : text;
    return QStringLiteral("<span>%1</span>").arg(shown.toHtmlEscaped());
}

} // namespace PlainText
