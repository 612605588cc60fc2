#include "settings.h"

#include "answer.h"
#include "store.h"

#include <algorithm>

namespace emulator {

namespace {

constexpr auto storeKey = "settings";

Json factorySettings() {
    return {{"nf_alarms", true},        {"nf_tasks", true},   {"svr_fw_upload_limit_enabled", false},
            {"svr_fw_upload_limit", 5}, {"log_keepdays", 30}, {"rp_download_path", ""},
            {"rp_auto", false},         {"rp_keepnum", 3},    {"sys_lang", "en"},
            {"ui_lang", "en"}};
}

bool fits(const Json &value, const Json &example) {
    if (example.is_number_integer()) {
        return value.is_number_integer() && value.get<std::int64_t>() >= 0;
    }
    return value.type() == example.type();
}

} // namespace

Settings::Settings(Store &store) : m_store(store), m_values(factorySettings()) {
    const std::string kept = store.value(storeKey);
    if (!kept.empty()) {
        m_values.update(Json::parse(kept));
    }
}

std::size_t Settings::firmwareLimit() const {
    const bool limited = m_values.at("svr_fw_upload_limit_enabled").get<bool>();
    // A limit of none at all would hold every task for ever.
    return limited ? std::max<std::size_t>(m_values.at("svr_fw_upload_limit").get<std::size_t>(), 1) : 0;
}

void Settings::change(const Json &members) {
    Json changed = m_values;
    for (const auto &[name, value] : members.items()) {
        const std::string key = name == "days" ? "log_keepdays" : name;
        const auto known = changed.find(key);
        if (known == changed.end()) {
            continue;
        }
        if (!fits(value, *known)) {
            throw Refusal(Code::Malformed, "setting \"" + name + "\" has a wrong type");
        }
        *known = value;
    }
    m_store.setValue(storeKey, jsonText(changed));
    m_values = std::move(changed);
}

} // namespace emulator
