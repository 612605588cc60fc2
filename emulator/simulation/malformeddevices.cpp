#include "simulation/malformeddevices.h"

#include "simulation/devicemaker.h"
#include "tables/devicetable.h"

#include <string>
#include <utility>

namespace emulator {

namespace {

constexpr std::uint64_t oddSeed = 0x0dd;

Json soundRecord(std::uint64_t n) {
    Appearance appearance = appearanceOf(oddSeed, n);
    appearance.ip = "10.98.0." + std::to_string(n + 1);
    Json record = firstRecord(appearance);
    fillDetails(record, "odd-" + std::to_string(n));
    return record;
}

void spoil(Json &record, const Json &oddities) {
    for (const auto &[name, value] : oddities.items())
        record[name] = value;
}

Json wrongTypes() {
    return {{"d_model", 4210},      {"d_http", "80"},       {"d_https", nullptr},
            {"d_sdusage", "full"},  {"https_enable", "on"}, {"d_hostname", Json::array({"a", "b"})},
            {"d_policy", "strong"}, {"d_powerfreq", 50.5},  {"d_cert_expires", "soon"}};
}

void add(DeviceTable &devices, Json record, bool sitesAsText = false) {
    Device device;
    device.id = devices.newId();
    device.sites = {overviewId};
    device.sitesAsText = sitesAsText;
    device.authorization = Authorization::Authorized;
    setRecord(device, std::move(record));
    devices.add(std::move(device));
}

} // namespace

void addOddRecords(DeviceTable &devices) {
    add(devices, Json::object());
    const Json oddities[] = {
        wrongTypes(),
        {{"d_ip", "not-an-address"}},
        {{"d_model", "<b>NC-4210</b><img src=\"http://10.98.0.1/x.png\">"}},
        {{"d_model", std::string(10000, 'N')}},
        {{"d_hostname", "line one\nline two\t\x01"}, {"d_fw", nullptr}},
        {{"d_hostname", "%n%s%1"}, {"d_sdusage", -7}, {"d_http", 99999999}},
    };
    std::uint64_t n = 0;
    for (const Json &oddity : oddities) {
        Json record = soundRecord(n++);
        spoil(record, oddity);
        add(devices, std::move(record));
    }
    add(devices, soundRecord(n), true);
}

} // namespace emulator
