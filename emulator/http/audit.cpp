#include "http/audit.h"

#include <unordered_map>

namespace emulator {

namespace {

/// A request in words, and the member of its body that says how many or which.
struct Deed {
    const char *words;
    const char *member = "";
};

const std::unordered_map<std::string, Deed> &deeds() {
    static const std::unordered_map<std::string, Deed> table = {
        {"/v1/accm/new", {"Account added", "email"}},
        {"/v1/accm/revpas", {"Password of an account changed", "email"}},
        {"/v1/alarm/rm", {"Alarms removed", "alids"}},
        {"/v1/cgi/commit", {"Custom commands changed", "cgis"}},
        {"/v1/dev/auth", {"Devices authorized", "devices"}},
        {"/v1/dev/commit", {"Devices changed", "devices"}},
        {"/v1/dev/scan", {"Search for devices"}},
        {"/v1/dev/scanip", {"Search for devices", "ip"}},
        {"/v1/dev/scanips", {"Search for devices in a range"}},
        {"/v1/dev/setpolicy", {"Password policy set", "devices"}},
        {"/v1/site/new", {"Site added", "sitename"}},
        {"/v1/site/update", {"Site changed", "siteid"}},
        {"/v1/site/rms", {"Site removed", "siteid"}},
        {"/v1/site/commit", {"Sites changed", "sites"}},
        {"/v1/task/rm", {"Tasks removed", "tids"}},
    };
    return table;
}

} // namespace

std::string auditText(const std::string &path, const Json &body) {
    const auto deed = deeds().find(path);
    if (deed == deeds().end())
        return {};
    const auto detail = body.find(deed->second.member);
    if (detail == body.end())
        return deed->second.words;
    return std::string(deed->second.words) + ": " +
           (detail->is_string()  ? detail->get<std::string>()
            : detail->is_array() ? std::to_string(detail->size())
                                 : jsonText(*detail));
}

} // namespace emulator
