#include "widgets/controls/passwordedit.h"

#include "widgets/style/icons.h"

#include <QAction>

namespace {
const QString hiddenIcon = QStringLiteral(":/images/icon_general_hide_line.svg");
const QString shownIcon = QStringLiteral(":/images/icon_general_show_line.svg");
} // namespace

PasswordEdit::PasswordEdit(QWidget *parent)
    : QLineEdit(parent), m_eye(addAction(QIcon(), QLineEdit::TrailingPosition)) {
    m_eye->setObjectName(QStringLiteral("showPasswordAction"));
    connect(m_eye, &QAction::triggered, this, [this] { setShown(echoMode() == QLineEdit::Password); });
    setShown(false);
}

void PasswordEdit::setShown(bool shown) {
    setEchoMode(shown ? QLineEdit::Normal : QLineEdit::Password);
    m_eye->setIcon(Icons::icon(shown ? shownIcon : hiddenIcon, {16, 16}));
    m_eye->setToolTip(shown ? tr("Hide password") : tr("Show password"));
}
