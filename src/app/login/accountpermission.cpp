#include "app/login/accountpermission.h"

#include "api/client/apilocalclient.h"
#include "store/configstore.h"

#include <QDebug>

#include <nlohmann/json.hpp>

namespace {

constexpr int pageSize = 500;
constexpr int maxPages = 20;

AccountPermission permissionOf(const JSON &account) {
    const std::string_view text = textMember(account, "permi");
    if (text == "admin")
        return AccountPermission::Administrator;
    if (text == "operator")
        return AccountPermission::Operator;
    return text == "viewer" ? AccountPermission::Viewer : AccountPermission::Unknown;
}

} // namespace

AccountPermission permissionOnThisComputer(const QString &email) {
    const quint32 port = CConfigStore().serverPort();
    qDebug("get local server port: %d", static_cast<int>(port));
    for (int page = 0; page < maxPages; ++page) {
        JSON members;
        if (CApiLocalClient(port).memberList(page * pageSize, pageSize, members) != ApiOk)
            break;
        const auto list = members.is_object() ? members.find("data") : members.end();
        if (list == members.end() || !list->is_array())
            break;
        for (const JSON &account : *list) {
            if (stringMember(account, "email").compare(email, Qt::CaseInsensitive) == 0)
                return permissionOf(account);
        }
        if (list->size() < pageSize)
            break;
    }
    return AccountPermission::Unknown;
}
