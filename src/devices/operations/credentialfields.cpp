#include "devices/operations/credentialfields.h"

#include "widgets/controls/passwordedit.h"

#include <QComboBox>
#include <QLabel>

namespace CredentialFields {

QComboBox *makeName(QWidget *parent) {
    auto *name = new QComboBox(parent);
    name->setObjectName(QStringLiteral("nameComboBox"));
    name->setEditable(true);
    name->setInsertPolicy(QComboBox::NoInsert);
    // Names are sent as typed: a completer would put "root" in place of "ro", and "admin" in place of
    // "Admin".
    name->setCompleter(nullptr);
    name->addItems({QStringLiteral("root"), QStringLiteral("admin")});
    return name;
}

PasswordEdit *makePassword(const char *objectName, QWidget *parent) {
    auto *password = new PasswordEdit(parent);
    password->setObjectName(QLatin1String(objectName));
    return password;
}

bool tell(QLabel *line, const QString &problem) {
    line->setText(problem);
    line->setVisible(!problem.isEmpty());
    return problem.isEmpty();
}

} // namespace CredentialFields
