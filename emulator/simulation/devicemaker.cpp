#include "simulation/devicemaker.h"

#include "simulation/random.h"
#include "tables/devicetable.h"

#include <array>
#include <charconv>
#include <cstdio>
#include <utility>

namespace emulator {

namespace {

template <std::size_t N>
const char *pick(Random &random, const std::array<const char *, N> &choices) {
    return choices[random.below(N)];
}

std::string modelOf(Random &random) {
    static constexpr std::array cameras = {"NC-4210", "NC-9381", "NC-2100", "NC-5530"};
    static constexpr std::array recorders = {"NR-1608", "NR-3216"};
    const auto draw = random.below(100);
    return draw < 85 ? pick(random, cameras) : draw < 95 ? pick(random, recorders) : "NA-220";
}

std::string macOf(std::uint64_t seed, std::uint64_t n) {
    // An odd factor keeps the last three bytes of the first sixteen million devices apart.
    const auto tail = static_cast<unsigned>((n * 0x9e3779b1ULL + mixed(seed)) & 0xffffffU);
    std::array<char, 20> text{};
    std::snprintf(text.data(), text.size(), "00:1A:07:%02X:%02X:%02X", tail >> 16, (tail >> 8) & 255U,
                  tail & 255U);
    return text.data();
}

std::string firmwareOf(Random &random) {
    static constexpr std::array older = {"2.3.0", "2.2.7", "1.9.12"};
    return random.chance(0.8) ? "2.4.1" : pick(random, older);
}

std::string deviceTimeOf(Random &random) {
    // Some clocks run an hour behind, as clocks without a time server do.
    const auto second = random.below(3600);
    const int hour = random.chance(0.1) ? 8 : 9;
    std::array<char, 40> text{};
    std::snprintf(text.data(), text.size(), "2026/01/15 %02d:%02d:%02d", hour, static_cast<int>(second / 60),
                  static_cast<int>(second % 60));
    return text.data();
}

void addCard(Json &facts, Random &random, bool camera) {
    static constexpr std::array states = {"ready",    "ready", "ready", "ready",   "ready",
                                          "readonly", "Error", "Empty", "detached"};
    const std::string state = camera ? pick(random, states) : "ready";
    facts["d_sdstatus"] = state;
    facts["d_sdusage"] = state == "ready" || state == "readonly" ? random.below(100) : 0;
}

void addCertificate(Json &facts, Random &random, const std::string &hostName) {
    // From 60 days before to three years after the middle of January 2026: some have run out.
    constexpr std::int64_t middle = 1768464000000;
    constexpr std::int64_t dayMs = 86400000;
    const bool installed = random.chance(0.3);
    facts["d_has_matching_cert"] = installed;
    facts["d_has_matching_private_key"] = installed || random.chance(0.1);
    facts["d_has_matching_cert_request"] = !installed && random.chance(0.1);
    const auto days = static_cast<std::int64_t>(random.below(60 + 3 * 365)) - 60;
    if (installed) {
        facts["d_cert_subject"] = "CN=" + hostName + ",O=Norvell Inc";
        facts["d_cert_expires"] = middle + days * dayMs;
    }
    const bool portSecurity = random.chance(0.1);
    facts["ieee8021x_enable"] = portSecurity;
    if (portSecurity)
        facts["d_8021x_expires"] = middle + (days + 30) * dayMs;
}

/// A MAC that is none counts as 0; its device is as good as any other.
std::uint64_t numberOfMac(const std::string &mac) {
    const std::string key = macKeyOf(mac);
    std::uint64_t number = 0;
    std::from_chars(key.data(), key.data() + key.size(), number, 16);
    return number;
}

Json factsOf(const std::string &mac, const std::string &model, const std::string &hostName) {
    Random random(numberOfMac(mac));
    Json facts;
    facts["d_hostname"] = hostName;
    facts["d_fw"] = firmwareOf(random);
    facts["https_enable"] = random.chance(0.7);
    facts["d_dtime"] = deviceTimeOf(random);
    facts["d_powerfreq"] = random.chance(0.6) ? 50 : 60;
    facts["d_audio"] = random.chance(0.4) ? "mute" : "unmute";
    facts["d_apstate"] = random.below(2);
    facts["d_nettype"] = random.chance(0.7) ? "static" : "dhcp";
    facts["d_policy"] = {{"plen", 8}, {"type", random.chance(0.5) ? 7 : 15}};
    addCard(facts, random, classOf(model) == "Camera");
    addCertificate(facts, random, hostName);
    return facts;
}

std::string textOr(const Json &record, const char *name) {
    const auto found = record.find(name);
    return found != record.end() && found->is_string() ? found->get<std::string>() : std::string();
}

} // namespace

std::string addressOf(std::uint32_t number) {
    const std::uint32_t host = number % 254 + 1;
    const std::uint32_t net = number / 254;
    return "10." + std::to_string(20 + net / 256) + '.' + std::to_string(net % 256) + '.' +
           std::to_string(host);
}

Appearance appearanceOf(std::uint64_t seed, std::uint64_t n) {
    Random random(mixed(seed) ^ mixed(n + 1));
    Appearance appearance;
    appearance.model = modelOf(random);
    appearance.mac = macOf(seed, n);
    appearance.http = random.chance(0.95) ? 80 : 8080;
    appearance.https = random.chance(0.95) ? 443 : 8443;
    return appearance;
}

void fillDetails(Json &record, const std::string &hostName) {
    Json facts = factsOf(textOr(record, "d_mac"), textOr(record, "d_model"), hostName);
    for (auto &[name, value] : facts.items())
        if (!record.contains(name))
            record[name] = std::move(value);
}

std::string classOf(const std::string &model) {
    return model.starts_with("NC") ? "Camera" : model.starts_with("NR") ? "NVR" : "Encoder";
}

Json firstRecord(const Appearance &appearance) {
    return {{"d_model", appearance.model}, {"d_ip", appearance.ip},
            {"d_mac", appearance.mac},     {"d_http", appearance.http},
            {"d_https", appearance.https}, {"d_svrtype", classOf(appearance.model)}};
}

Device withMembers(const Device &device, const Json &members) {
    Device changed = device;
    Json record = Json::parse(device.body);
    // A member that is to go comes as null, as in a merge patch.
    record.merge_patch(members);
    setRecord(changed, std::move(record));
    return changed;
}

void setRecord(Device &device, Json record) {
    record.erase("siteid");
    record["id"] = device.id;
    device.macKey = macKeyOf(textOr(record, "d_mac"));
    device.ip = textOr(record, "d_ip");
    device.body = jsonText(record);
}

} // namespace emulator
