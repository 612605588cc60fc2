#include "devices/passwordpolicy.h"

#include "http/jsonaccess.h"
#include "tables/records.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace emulator {

namespace {

constexpr std::int64_t factoryLength = 8;
constexpr int unlikeAccount = 32;
constexpr std::string_view specials = "!%-.@^_~";

bool isLower(char c) {
    return c >= 'a' && c <= 'z';
}
bool isUpper(char c) {
    return c >= 'A' && c <= 'Z';
}
bool isDigit(char c) {
    return c >= '0' && c <= '9';
}
bool isLetter(char c) {
    return isLower(c) || isUpper(c);
}
bool isSpecial(char c) {
    return specials.find(c) != std::string_view::npos;
}

struct Demand {
    int bit;
    bool (*isMet)(char);
};

constexpr std::array<Demand, 5> demands = {
    {{1, &isLetter}, {2, &isSpecial}, {4, &isDigit}, {8, &isLower}, {16, &isUpper}}};

std::int64_t integerOr(const Json &object, const char *name, std::int64_t otherwise) {
    const auto found = object.find(name);
    return found != object.end() && found->is_number_integer() ? found->get<std::int64_t>() : otherwise;
}

Json policyOf(const Device &device) {
    const Json policy = Json::parse(device.body).value("d_policy", Json());
    return policy.is_object() ? policy : Json::object();
}

} // namespace

bool allowsPassword(const Device &device, const std::string &account, const std::string &password) {
    const Json policy = policyOf(device);
    const auto mask = integerOr(policy, "type", 0);
    const bool known = std::all_of(password.begin(), password.end(),
                                   [](char c) { return isLetter(c) || isDigit(c) || isSpecial(c); });
    const bool longEnough =
        static_cast<std::int64_t>(password.size()) >= integerOr(policy, "plen", factoryLength);
    const bool unlike = (mask & unlikeAccount) == 0 || password != account;
    return known && longEnough && unlike && !password.empty() &&
           std::all_of(demands.begin(), demands.end(), [&](const Demand &demand) {
               return (mask & demand.bit) == 0 || std::any_of(password.begin(), password.end(), demand.isMet);
           });
}

} // namespace emulator
