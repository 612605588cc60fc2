#pragma once

#include <QIcon>
#include <QString>

#include <string_view>

/// What a device's three status texts come down to.
enum class DeviceStatusCode : quint8 {
    Unauthorized = 0,
    AccessDenied = 1,
    Authorized = 2,
    Unreachable = 3,
    Maintaining = 4,
    SetPassword = 5,
    InvalidPassword = 6,
    AccountBlocked = 7
};

/// What the states of devices come down to for somebody who looks after them.
enum class DeviceStatusGroup : quint8 { Authorized, Unreachable, Attention };
inline constexpr int deviceStatusGroupCount = 3;

namespace DeviceStatus {

DeviceStatusGroup groupOf(DeviceStatusCode code);

/// Judges "connect_status", "auth_status" and "action_status", compared exactly.
DeviceStatusCode codeOf(std::string_view connect, std::string_view auth, std::string_view action);

/// The text of a code as the status column shows it, behind two blanks; just these for a code that is none.
QString text(DeviceStatusCode code);
/// The one of all texts with most letters.
QString maxTextLength();

/// The icon of a code, or a null icon for a code that is none. User-interface thread.
const QIcon &icon(DeviceStatusCode code);

} // namespace DeviceStatus
