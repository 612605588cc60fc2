#include "devices/deviceconfiguration.h"

#include "http/response.h"
#include "tables/records.h"

#include <yaml-cpp/yaml.h>

#include <array>
#include <optional>

namespace emulator {

namespace {

constexpr std::size_t maxTemplateLength = 1U << 20;

enum class Kind { Text, Port, Frequency, Audio, Switch, Shown };

/// An item of a section and the member of the record that holds it; what is only shown cannot be set.
struct Item {
    const char *section;
    const char *name;
    const char *member;
    Kind kind;
};

constexpr std::array<Item, 23> items = {{
    {"System", "hostname", "d_hostname", Kind::Text},
    {"System", "model", "d_model", Kind::Shown},
    {"System", "firmware", "d_fw", Kind::Shown},
    {"System", "datetime", "d_dtime", Kind::Shown},
    {"System", "timezone", "d_timezone", Kind::Text},
    {"System", "timesync", "d_timesync", Kind::Text},
    {"System", "daylight", "d_daylight", Kind::Switch},
    {"Media", "powerfreq", "d_powerfreq", Kind::Frequency},
    {"Media", "audio", "d_audio", Kind::Audio},
    {"Network", "ip", "d_ip", Kind::Shown},
    {"Network", "mac", "d_mac", Kind::Shown},
    {"Network", "type", "d_nettype", Kind::Shown},
    {"Network", "http", "d_http", Kind::Port},
    {"Network", "https", "d_https", Kind::Port},
    {"Network", "https_enable", "https_enable", Kind::Switch},
    {"Network", "ieee8021x_enable", "ieee8021x_enable", Kind::Shown},
    {"Storage", "status", "d_sdstatus", Kind::Shown},
    {"Storage", "usage", "d_sdusage", Kind::Shown},
    {"Custom", "platform", "d_apstate", Kind::Shown},
    {"Custom", "packages", "d_packages", Kind::Shown},
    {"Custom", "policy", "d_policy", Kind::Shown},
    {"Custom", "description", "d_description", Kind::Text},
    {"Custom", "location", "d_location", Kind::Text},
}};

[[noreturn]] void refuse(const std::string &why) {
    throw Refusal(Code::Malformed, why);
}

std::optional<Json> portOf(const std::string &text) {
    const bool digits = text.find_first_not_of("0123456789") == std::string::npos;
    const int port = digits && !text.empty() && text.size() <= 5 ? std::stoi(text) : 0;
    return port >= 1 && port <= 65535 ? std::optional<Json>(port) : std::nullopt;
}

std::optional<Json> valueOf(const std::string &text, Kind kind) {
    switch (kind) {
    case Kind::Text:
        return Json(text);
    case Kind::Port:
        return portOf(text);
    case Kind::Frequency:
        return text == "50" || text == "60" ? std::optional<Json>(std::stoi(text)) : std::nullopt;
    case Kind::Audio:
        return text == "mute" || text == "unmute" ? std::optional<Json>(text) : std::nullopt;
    case Kind::Switch:
        return text == "true" || text == "false" ? std::optional<Json>(text == "true") : std::nullopt;
    case Kind::Shown:
        break;
    }
    return std::nullopt;
}

void addChange(Json &changes, const YAML::Node &root, const Item &item) {
    const YAML::Node section = root[item.section];
    if (item.kind == Kind::Shown || !section || !section.IsMap())
        return;
    const YAML::Node node = section[item.name];
    if (!node || node.IsNull())
        return;
    const auto value = node.IsScalar() ? valueOf(node.Scalar(), item.kind) : std::nullopt;
    if (!value)
        refuse(std::string("item \"") + item.name + "\" of the template cannot have this value");
    changes[item.member] = *value;
}

} // namespace

Json configurationOf(const Device &device) {
    const Json record = Json::parse(device.body);
    Json all = Json::object();
    for (const Item &item : items) {
        Json &section = all[item.section];
        const auto held = record.find(item.member);
        section[item.name] = held == record.end() ? Json("") : *held;
    }
    return all;
}

Json templateChanges(const std::string &yaml) {
    if (yaml.size() > maxTemplateLength)
        refuse("the template is too long");
    try {
        const YAML::Node root = YAML::Load(yaml);
        if (!root.IsMap())
            refuse("the template holds no sections");
        Json changes = Json::object();
        for (const Item &item : items)
            addChange(changes, root, item);
        return changes;
    } catch (const YAML::Exception &error) {
        refuse(std::string("the template is no YAML: ") + error.what());
    }
}

} // namespace emulator
