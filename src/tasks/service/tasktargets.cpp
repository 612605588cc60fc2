#include "tasks/service/tasktargets.h"

#include "base/macaddress.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <iterator>

namespace TaskTargets {

namespace {

JSON idOf(const JSON &device) {
    return device.is_object() ? device.value("id", JSON()) : device;
}

template <typename Convert>
JSON converted(const JSON &devices, Convert convert) {
    JSON result = JSON::array();
    for (const JSON &device : devices)
        result.push_back(convert(idOf(device)));
    return result;
}

template <typename Wanted>
JSON filtered(const JSON &elements, Wanted wanted) {
    JSON result = JSON::array();
    std::copy_if(elements.begin(), elements.end(), std::back_inserter(result), wanted);
    return result;
}

} // namespace

JSON ids(const JSON &devices) {
    return converted(devices, [](JSON id) { return id; });
}

JSON ids(const QStringList &ids) {
    JSON array = JSON::array();
    for (const QString &id : ids)
        array.push_back(id.toStdString());
    return array;
}

QStringList idTexts(const JSON &devices) {
    QStringList texts;
    for (const JSON &id : ids(devices)) {
        if (id.is_string())
            texts += QString::fromStdString(id.get_ref<const std::string &>());
    }
    return texts;
}

JSON withTask(const JSON &devices, const std::string &tid) {
    return converted(devices, [&](JSON id) { return JSON{{"id", std::move(id)}, {"tid", tid}}; });
}

JSON withMembers(const JSON &devices, const JSON &record, std::initializer_list<const char *> members) {
    JSON shared = JSON::object();
    for (const char *member : members) {
        if (const auto value = record.find(member); value != record.end())
            shared[member] = *value;
    }
    return converted(devices, [&](JSON id) {
        JSON device = shared;
        device["id"] = std::move(id);
        return device;
    });
}

JSON only(const JSON &devices, const QStringList &deviceIds) {
    const QSet<QString> wanted(deviceIds.begin(), deviceIds.end());
    return filtered(devices, [&](const JSON &device) {
        const JSON id = idOf(device);
        return id.is_string() && wanted.contains(QString::fromStdString(id.get_ref<const std::string &>()));
    });
}

JSON onlyFilesOf(const JSON &files, const QSet<QString> &macs) {
    return filtered(files, [&](const JSON &file) {
        const QString mac = stringMember(file, "d_mac");
        return mac.isEmpty() || macs.contains(plainMac(mac));
    });
}

QString plainMac(const QString &mac) {
    return QString::fromStdString(MacAddress::plain(mac.toLatin1().toStdString()));
}

} // namespace TaskTargets
