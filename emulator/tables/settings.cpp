#include "tables/settings.h"

#include "http/response.h"
#include "tables/store.h"

#include <algorithm>

namespace emulator {

namespace {

constexpr auto storeKey = "settings";
constexpr std::size_t maxPathLength = 4096;
constexpr std::size_t maxLanguageLength = 16;

/// A setting as a new service has it. A number lies between min and max, a text is no longer than max.
struct Setting {
    const char *name;
    Json value;
    std::int64_t min = 0;
    std::int64_t max = 0;

    bool takes(const Json &wanted) const {
        if (value.is_number_integer())
            return wanted.is_number_integer() && wanted >= min && wanted <= max;
        return wanted.type() == value.type() &&
               (!wanted.is_string() ||
                wanted.get_ref<const std::string &>().size() <= static_cast<std::size_t>(max));
    }
};

const std::vector<Setting> &table() {
    static const std::vector<Setting> settings = {{"nf_alarms", true},
                                                  {"nf_tasks", true},
                                                  {"svr_fw_upload_limit_enabled", false},
                                                  {"svr_fw_upload_limit", 5, 1, 50},
                                                  {"log_keepdays", 30, 1, 1095},
                                                  {"rp_download_path", "", 0, maxPathLength},
                                                  {"rp_auto", false},
                                                  {"rp_keepnum", 3, 1, 9999},
                                                  {"sys_lang", "en", 0, maxLanguageLength},
                                                  {"ui_lang", "en", 0, maxLanguageLength}};
    return settings;
}

const Setting *find(const std::string &name) {
    const auto found = std::find_if(table().begin(), table().end(),
                                    [&](const Setting &setting) { return name == setting.name; });
    return found == table().end() ? nullptr : &*found;
}

} // namespace

Settings::Settings(Store &store) : m_store(store), m_values(Json::object()) {
    const std::string text = store.value(storeKey);
    const Json kept = text.empty() ? Json::object() : Json::parse(text);
    for (const Setting &setting : table()) {
        const Json value = kept.value(setting.name, setting.value);
        m_values[setting.name] = setting.takes(value) ? value : setting.value;
    }
}

std::size_t Settings::firmwareLimit() const {
    const bool limited = m_values.at("svr_fw_upload_limit_enabled").get<bool>();
    // A limit of none at all would hold every task for ever.
    return limited ? std::max<std::size_t>(m_values.at("svr_fw_upload_limit").get<std::size_t>(), 1) : 0;
}

std::string Settings::change(const Json &members) {
    Json changed = m_values;
    std::string differences;
    for (const auto &[name, value] : members.items()) {
        const Setting *setting = find(name == "days" ? "log_keepdays" : name);
        if (!setting)
            continue;
        if (!setting->takes(value))
            throw Refusal(Code::Malformed, "setting \"" + name + "\" has a wrong type or is out of range");
        if (Json &present = changed[setting->name]; present != value) {
            differences += (differences.empty() ? "" : ", ") + std::string(setting->name) + ' ' +
                           jsonText(present) + " -> " + jsonText(value);
            present = value;
        }
    }
    if (!differences.empty()) {
        m_store.setValue(storeKey, jsonText(changed));
        m_values = std::move(changed);
    }
    return differences;
}

} // namespace emulator
