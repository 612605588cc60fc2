#pragma once

#include <QString>

/// What the service lets an account do.
enum class AccountPermission { Unknown, Administrator, Operator, Viewer };

/// Asks the service on this computer; Unknown where it does not tell. Blocks: for a runner's thread.
AccountPermission permissionOnThisComputer(const QString &email);

/// Whether the account may change the link with the remote-access service. An unknown permission is given
/// the benefit of the doubt: the service judges anyway.
inline bool mayManageService(AccountPermission permission) {
    return permission == AccountPermission::Unknown || permission == AccountPermission::Administrator;
}
