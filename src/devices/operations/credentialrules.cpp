#include "devices/operations/credentialrules.h"

#include <QCoreApplication>
#include <QRegularExpression>

namespace CredentialRules {

namespace {

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(CredentialRules)
};

/// \z, since $ would let a line break pass at the end.
bool matches(const QString &text, const char *pattern) {
    return QRegularExpression(QLatin1String(pattern)).match(text).hasMatch();
}

} // namespace

QString nameProblem(const QString &name) {
    if (name.isEmpty())
        return Texts::tr("The field can't be empty.");
    if (!matches(name, "^[A-Za-z0-9]*\\z"))
        return Texts::tr("Only alphanumeric characters are allowed.");
    return {};
}

QString passwordProblem(const QString &password) {
    if (password.isEmpty())
        return Texts::tr("The field can't be empty.");
    if (!matches(password, "^[A-Za-z0-9!%\\-.@^_~]*\\z"))
        return Texts::tr(
            "Only alphanumeric characters and the following special characters !%-.@^_~ are allowed.");
    return {};
}

} // namespace CredentialRules
