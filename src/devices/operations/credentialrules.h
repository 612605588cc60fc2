#pragma once

#include <QString>

/// What names and passwords of the accounts on devices may be made of. Each returns what is wrong with the
/// text, nothing where it is good.
namespace CredentialRules {

QString nameProblem(const QString &name);
QString passwordProblem(const QString &password);

} // namespace CredentialRules
