#include "api/client/settingvalue.h"

#include <QString>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <cmath>

namespace SettingValue {

namespace {

/// A number, however it is written.
std::optional<double> numberOf(const JSON &value) {
    if (value.is_boolean())
        return value.get<bool>() ? 1 : 0;
    if (value.is_number())
        return value.get<double>();
    bool isNumber = false;
    const double number =
        value.is_string() ? QString::fromStdString(value.get<std::string>()).toDouble(&isNumber) : 0;
    return isNumber && !std::isnan(number) ? std::optional(number) : std::nullopt;
}

} // namespace

std::optional<bool> toSwitch(const JSON &value) {
    if (value.is_string()) {
        const std::string text = value.get<std::string>();
        if (text == "true" || text == "false")
            return text == "true";
    }
    const std::optional<double> number = numberOf(value);
    return number ? std::optional(*number != 0) : std::nullopt;
}

std::optional<int> toNumber(const JSON &value, int min, int max) {
    const std::optional<double> number = numberOf(value);
    if (!number)
        return {};
    return static_cast<int>(
        std::clamp(std::trunc(*number), static_cast<double>(min), static_cast<double>(max)));
}

int uploadLimit(const JSON &settings) {
    const auto isOn = settings.find("svr_fw_upload_limit_enabled");
    const auto limit = settings.find("svr_fw_upload_limit");
    if (isOn == settings.end() || limit == settings.end() || !toSwitch(*isOn).value_or(false))
        return 0;
    return toNumber(*limit, minUploads, maxUploads).value_or(0);
}

} // namespace SettingValue
