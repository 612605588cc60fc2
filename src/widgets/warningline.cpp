#include "warningline.h"

#include "icons.h"

#include <QLabel>

namespace {
constexpr QSize iconSize{12, 12};
} // namespace

WarningLine::WarningLine(QLabel *icon, QLabel *text) : m_icon(icon), m_text(text) {
    m_text->setTextFormat(Qt::PlainText);
    m_text->setWordWrap(true);
    setText({});
}

void WarningLine::setText(const QString &text) {
    m_icon->setPixmap(text.isEmpty()
                          ? QPixmap()
                          : Icons::pixmap(QStringLiteral(":/images/icon_general_warning_solid.svg"), iconSize,
                                          m_icon->devicePixelRatioF()));
    m_text->setText(text);
    m_text->setAccessibleDescription(text);
}
