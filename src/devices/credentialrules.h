#pragma once

#include <QString>

/// What names and passwords of the accounts on devices may be made of. Each returns what is wrong with the
/// text, nothing where it is good.
namespace CredentialRules {

/// Longer ones would not fit into the command that a device gets.
inline constexpr int longestName = 64;
inline constexpr int longestPassword = 64;

QString nameProblem(const QString &name);
QString passwordProblem(const QString &password);

} // namespace CredentialRules
