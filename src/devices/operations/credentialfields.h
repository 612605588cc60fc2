#pragma once

class PasswordEdit;
class QComboBox;
class QLabel;
class QString;
class QWidget;

/// The fields for an account on devices, as dialogs share them.
namespace CredentialFields {

/// Proposes the usual names; others can be typed.
QComboBox *makeName(QWidget *parent);
PasswordEdit *makePassword(const char *objectName, QWidget *parent);

/// Shows what is wrong with a field in the line below it, nothing for an empty text. True when nothing is.
bool tell(QLabel *line, const QString &problem);

} // namespace CredentialFields
