#include "tasks/service/existingdevices.h"

#include "api/client/apiresult.h"
#include "api/session/pagereader.h"
#include "platform/json.h"
#include "tasks/service/tasktargets.h"

#include <QHash>

#include <nlohmann/json.hpp>

ExistingDevices ExistingDevices::among(const QStringList &deviceIds, ServiceSession &session) {
    QHash<QString, QString> macs;
    const unsigned result = PageReader::readAll(
        session, &CApiClient::listDevices, PageReader::recordsOfPage, [&](const JSON &page) {
            for (const JSON &device : page)
                macs.insert(stringMember(device, "id"), TaskTargets::plainMac(stringMember(device, "d_mac")));
        });
    if (result != ApiOk)
        return {deviceIds, {}, {}};
    ExistingDevices left;
    for (const QString &id : deviceIds) {
        const auto found = macs.constFind(id);
        if (found == macs.cend()) {
            left.vanished += id;
            continue;
        }
        left.ids += id;
        left.macs.insert(*found);
    }
    return left;
}
