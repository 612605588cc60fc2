#include "app/remote/orborganization.h"

#include <QCollator>

#include <nlohmann/json.hpp>

#include <algorithm>

namespace {

template <typename Record>
void sortByName(std::vector<Record> &records) {
    QCollator collator;
    collator.setNumericMode(true);
    collator.setCaseSensitivity(Qt::CaseInsensitive);
    std::stable_sort(records.begin(), records.end(), [&](const Record &left, const Record &right) {
        return collator.compare(left.name, right.name) < 0;
    });
}

QString nameOr(const JSON &record, const char *name, const QString &id) {
    const QString text = stringMember(record, name).simplified();
    return text.isEmpty() ? id : text;
}

std::vector<OrbOrganization::Site> readSites(const JSON &organization) {
    std::vector<OrbOrganization::Site> sites;
    const auto list = organization.find("sites");
    if (list == organization.end() || !list->is_array())
        return sites;
    for (const JSON &site : *list) {
        const QString id = stringMember(site, "id");
        if (!id.isEmpty())
            sites.push_back({id, nameOr(site, "name", id)});
    }
    sortByName(sites);
    return sites;
}

} // namespace

std::vector<OrbOrganization> readOrganizations(const JSON &list) {
    std::vector<OrbOrganization> organizations;
    if (!list.is_array())
        return organizations;
    for (const JSON &record : list) {
        const QString id = stringMember(record, "organizationID");
        if (id.isEmpty())
            continue;
        const auto access = record.find("enableRemoteAccess");
        const bool refused = access != record.end() && access->is_boolean() && !access->get<bool>();
        organizations.push_back({id, nameOr(record, "organizationName", id), !refused, readSites(record)});
    }
    sortByName(organizations);
    return organizations;
}
