#include "widgets/dialogs/warningline.h"

#include "widgets/style/icons.h"

#include <QLabel>
#include <QTextDocumentFragment>

namespace {
constexpr QSize iconSize{12, 12};
} // namespace

WarningLine::WarningLine(QLabel *icon, QLabel *text) : m_icon(icon), m_text(text) {
    m_text->setWordWrap(true);
    setText({});
}

void WarningLine::setText(const QString &text, const QString &icon) {
    show(text, Qt::PlainText, icon);
}

void WarningLine::setLinkedText(const QString &html) {
    show(html, Qt::RichText, defaultIcon);
}

void WarningLine::show(const QString &text, Qt::TextFormat format, const QString &icon) {
    const bool linked = format == Qt::RichText;
    m_text->setTextFormat(format);
    m_text->setTextInteractionFlags(linked ? Qt::LinksAccessibleByMouse | Qt::LinksAccessibleByKeyboard
                                           : Qt::NoTextInteraction);
    m_icon->setPixmap(text.isEmpty() ? QPixmap()
                                     : Icons::pixmap(icon, iconSize, m_icon->devicePixelRatioF()));
    m_text->setText(text);
    m_text->setAccessibleDescription(linked ? QTextDocumentFragment::fromHtml(text).toPlainText() : text);
}
