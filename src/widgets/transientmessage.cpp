#include "transientmessage.h"

#include <QTimer>

namespace {
constexpr int shownMs = 4000;
constexpr int bottomDistance = 56;
} // namespace

TransientMessage::TransientMessage(QWidget *window) : QLabel(window) {
    setObjectName(QStringLiteral("transientMessage"));
    setTextFormat(Qt::PlainText);
    setAttribute(Qt::WA_TransparentForMouseEvents);
}

void TransientMessage::show(QWidget *over, const QString &text) {
    QWidget *window = over->window();
    for (QObject *earlier : window->findChildren<TransientMessage *>(Qt::FindDirectChildrenOnly))
        earlier->deleteLater();
    auto *message = new TransientMessage(window);
    message->setText(text);
    message->setMaximumWidth(window->width() - 2 * bottomDistance);
    message->adjustSize();
    message->move((window->width() - message->width()) / 2,
                  window->height() - bottomDistance - message->height());
    message->raise();
    message->QLabel::show();
    QTimer::singleShot(shownMs, message, &QObject::deleteLater);
}
