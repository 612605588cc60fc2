#include "widgets/dialogs/transientmessage.h"

#include "widgets/controls/waitingspinner.h"
#include "widgets/style/icons.h"

#include <QAccessible>
#include <QTimer>

#include <algorithm>

namespace {

constexpr int shownMs = 4000;
constexpr int errorShownMs = 10000;
constexpr int bottomDistance = 72;
constexpr int sideDistance = 24;
constexpr int markSize = 16;
constexpr int markLeft = 14;
constexpr int textIndent = 22;

QString iconOf(TransientMessage::Kind kind) {
    return kind == TransientMessage::Kind::Success
               ? QStringLiteral(":/images/icon_general_success_solid_green.svg")
               : QStringLiteral(":/images/icon_general_error_solid.svg");
}

} // namespace

TransientMessage::TransientMessage(QWidget *window, Kind kind) : QLabel(window) {
    setObjectName(QStringLiteral("transientMessage"));
    setTextFormat(Qt::PlainText);
    setAttribute(Qt::WA_TransparentForMouseEvents);
    if (kind != Kind::Plain)
        addMark(kind);
}

/// What tells the kind without words: a turning ring or an icon, left of the text.
void TransientMessage::addMark(Kind kind) {
    QWidget *mark = nullptr;
    if (kind == Kind::Loading) {
        mark = new WaitingSpinner(this);
    } else {
        auto *icon = new QLabel(this);
        icon->setPixmap(Icons::pixmap(iconOf(kind), {markSize, markSize}, devicePixelRatioF()));
        mark = icon;
    }
    mark->setObjectName(QStringLiteral("transientMark"));
    mark->setFixedSize(markSize, markSize);
    setIndent(textIndent);
}

void TransientMessage::fit() {
    const int widest = parentWidget()->width() - 2 * sideDistance;
    adjustSize();
    if (width() > widest) {
        setWordWrap(true);
        resize(widest, heightForWidth(widest));
    }
    move((parentWidget()->width() - width()) / 2,
         std::max(0, parentWidget()->height() - bottomDistance - height()));
    if (auto *mark = findChild<QWidget *>(QStringLiteral("transientMark")))
        mark->move(markLeft, (height() - markSize) / 2);
}

void TransientMessage::show(QWidget *over, const QString &text, Kind kind) {
    clear(over);
    auto *message = new TransientMessage(over->window(), kind);
    message->setText(text);
    message->fit();
    message->raise();
    message->QLabel::show();
    QAccessibleEvent alert(message, QAccessible::Alert);
    QAccessible::updateAccessibility(&alert);
    if (kind != Kind::Loading)
        QTimer::singleShot(kind == Kind::Error ? errorShownMs : shownMs, message, &QObject::deleteLater);
}

void TransientMessage::clear(QWidget *over) {
    for (TransientMessage *earlier :
         over->window()->findChildren<TransientMessage *>(Qt::FindDirectChildrenOnly)) {
        earlier->hide();
        earlier->deleteLater();
    }
}
