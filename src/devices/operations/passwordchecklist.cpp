#include "devices/operations/passwordchecklist.h"

#include "widgets/style/icons.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QVBoxLayout>

namespace {

constexpr QSize iconSize{12, 12};
const QString metIcon = QStringLiteral(":/images/icon_general_success_solid_green.svg");
const QString unmetIcon = QStringLiteral(":/images/icon_general_warning_solid.svg");
const QString openIcon = QStringLiteral(":/images/icon_general_success_solid_gray.svg");

} // namespace

PasswordChecklist::PasswordChecklist(QWidget *parent) : QWidget(parent), m_lines(new QVBoxLayout(this)) {
    setObjectName(QStringLiteral("policyView"));
    m_lines->setContentsMargins(0, 0, 0, 0);
    m_lines->setSpacing(3);
}

void PasswordChecklist::showPolicy(const PasswordPolicy &policy, const QString &password,
                                   const QString &userName) {
    while (QLayoutItem *line = m_lines->takeAt(0)) {
        delete line->widget();
        delete line;
    }
    for (const PasswordPolicy::Line &line : policy.check(password, userName))
        addLine(line.text, password.isEmpty() ? openIcon : line.met ? metIcon : unmetIcon);
    if (policy.isEmpty())
        addLine(tr("The devices have no policy of their own."), openIcon);
}

void PasswordChecklist::addLine(const QString &text, const QString &icon) {
    auto *line = new QWidget(this);
    auto *mark = new QLabel(line);
    mark->setFixedWidth(iconSize.width());
    mark->setPixmap(Icons::pixmap(icon, iconSize, devicePixelRatioF()));
    auto *label = new QLabel(text, line);
    label->setObjectName(QStringLiteral("policyRuleLabel"));
    label->setTextFormat(Qt::PlainText);
    label->setProperty("role", "caption");
    label->setProperty("met", icon == metIcon);
    auto *layout = new QHBoxLayout(line);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->addWidget(mark);
    layout->addWidget(label, 1);
    m_lines->addWidget(line);
}
