#include "devicesleft.h"

#include "apiresult.h"
#include "json.h"
#include "pagereader.h"
#include "tasktargets.h"

#include <QHash>

#include <nlohmann/json.hpp>

DevicesLeft DevicesLeft::among(const QStringList &deviceIds, ServiceSession &session) {
    QHash<QString, QString> macs;
    const unsigned result = PageReader::readAll(
        session, &CApiClient::listDevices, PageReader::recordsOfPage, [&](const JSON &page) {
            for (const JSON &device : page)
                macs.insert(stringMember(device, "id"), TaskTargets::plainMac(stringMember(device, "d_mac")));
        });
    if (result != ApiOk)
        return {deviceIds, {}, {}};
    DevicesLeft left;
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
