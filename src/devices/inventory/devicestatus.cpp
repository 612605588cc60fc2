#include "devices/inventory/devicestatus.h"

#include "widgets/style/icons.h"

#include <QCoreApplication>

#include <array>

namespace DeviceStatus {

namespace {

struct Look {
    const char *text;
    const char *icon;
    int iconSize;
};

constexpr std::array<Look, 8> looks{{
    {QT_TRANSLATE_NOOP("DeviceStatus", "Unauthorized"), "icon_general_success_solid_gray", 9},
    {QT_TRANSLATE_NOOP("DeviceStatus", "Access Denied"), "icon_general_failed_solid_red", 9},
    {QT_TRANSLATE_NOOP("DeviceStatus", "Authorized"), "icon_general_success_solid_green", 9},
    {QT_TRANSLATE_NOOP("DeviceStatus", "Unreachable"), "icon_general_hint_solid_orange", 9},
    {QT_TRANSLATE_NOOP("DeviceStatus", "Maintaining..."), "progress_indicator_sm", 12},
    {QT_TRANSLATE_NOOP("DeviceStatus", "Set Password"), "icon_general_lock_solid", 9},
    {QT_TRANSLATE_NOOP("DeviceStatus", "Invalid Password"), "icon_general_failed_solid_red", 9},
    {QT_TRANSLATE_NOOP("DeviceStatus", "Account Blocked"), "icon_general_failed_solid_red", 9},
}};

std::array<QIcon, looks.size()> loadIcons() {
    std::array<QIcon, looks.size()> icons;
    for (std::size_t i = 0; i < looks.size(); ++i)
        icons[i] = Icons::plainIcon(QStringLiteral(":/images/%1.svg").arg(QLatin1String(looks[i].icon)),
                                    QSize(looks[i].iconSize, looks[i].iconSize));
    return icons;
}

} // namespace

DeviceStatusGroup groupOf(DeviceStatusCode code) {
    switch (code) {
    case DeviceStatusCode::Authorized:
    case DeviceStatusCode::Maintaining:
        return DeviceStatusGroup::Authorized;
    case DeviceStatusCode::Unreachable:
        return DeviceStatusGroup::Unreachable;
    default:
        return DeviceStatusGroup::Attention;
    }
}

DeviceStatusCode codeOf(std::string_view connect, std::string_view auth, std::string_view action) {
    if (connect == "Unreachable")
        return DeviceStatusCode::Unreachable;
    if (auth == "Authorized")
        return action == "Standby" ? DeviceStatusCode::Authorized : DeviceStatusCode::Maintaining;
    if (auth == "Access Denied")
        return DeviceStatusCode::AccessDenied;
    if (auth == "Invalid Password")
        return DeviceStatusCode::InvalidPassword;
    if (auth == "Account Blocked")
        return DeviceStatusCode::AccountBlocked;
    if (auth == "Set Password")
        return DeviceStatusCode::SetPassword;
    return DeviceStatusCode::Unauthorized;
}

QString text(DeviceStatusCode code) {
    const auto index = static_cast<std::size_t>(code);
    const QString blanks = QStringLiteral("  ");
    return index < looks.size() ? blanks + QCoreApplication::translate("DeviceStatus", looks[index].text)
                                : blanks;
}

QString maxTextLength() {
    QString longest;
    for (std::size_t code = 0; code < looks.size(); ++code) {
        const QString each = text(static_cast<DeviceStatusCode>(code));
        if (each.size() > longest.size())
            longest = each;
    }
    return longest;
}

const QIcon &icon(DeviceStatusCode code) {
    static const std::array<QIcon, looks.size()> icons = loadIcons();
    static const QIcon none;
    const auto index = static_cast<std::size_t>(code);
    return index < icons.size() ? icons[index] : none;
}

} // namespace DeviceStatus
