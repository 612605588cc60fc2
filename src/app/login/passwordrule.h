#pragma once

#include <QRegularExpression>

/// The rule for the passwords of the service's accounts.
namespace PasswordRule {

/// 8 to 64 letters, digits and "!%-.@^_~", with at least one lower-case letter, one upper-case letter, one
/// digit and one of those symbols.
inline bool accepts(const QString &password) {
    static const QRegularExpression rule(
        QStringLiteral("^(?=.*[a-z])(?=.*[A-Z])(?=.*\\d)(?=.*[!%\\-.@^_~])[A-Za-z\\d!%\\-.@^_~]{8,64}\\z"));
    return rule.match(password).hasMatch();
}

} // namespace PasswordRule
