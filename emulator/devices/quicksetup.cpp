#include "devices/quicksetup.h"

#include "http/response.h"
#include "simulation/clock.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <regex>

namespace emulator {

namespace {

constexpr std::size_t maxZoneLength = 64;

[[noreturn]] void refuse(const char *name) {
    throw Refusal(Code::Malformed, std::string("setting \"") + name + "\" makes no sense");
}

/// The settings come as their dialog has them: texts, numbers or booleans.
std::string looseText(const Json &value) {
    return value.is_string() ? value.get<std::string>() : jsonText(value);
}

bool switchOf(const Json &value, const char *name) {
    const std::string text = looseText(value);
    const auto isOneOf = [&](std::initializer_list<const char *> words) {
        return std::any_of(words.begin(), words.end(), [&](const char *word) { return text == word; });
    };
    if (isOneOf({"true", "1", "on", "yes", "mute"}))
        return true;
    if (!isOneOf({"false", "0", "-1", "off", "no", "unmute"}))
        refuse(name);
    return false;
}

int frequencyOf(const Json &value) {
    const std::string text = looseText(value);
    if (text != "50" && text != "60")
        refuse("powerfreq");
    return text == "50" ? 50 : 60;
}

std::smatch matched(const std::string &text, const char *pattern, const char *name) {
    std::smatch parts;
    // The expression recurses with the length of what it looks at.
    if (text.size() > maxZoneLength || !std::regex_match(text, parts, std::regex(pattern)))
        refuse(name);
    return parts;
}

std::string dateText(const Json &value) {
    const std::string text = looseText(value);
    const auto parts = matched(text, R"((\d{4})[-/.](\d{1,2})[-/.](\d{1,2}))", "date");
    const int month = std::stoi(parts[2]);
    const int day = std::stoi(parts[3]);
    if (month < 1 || month > 12 || day < 1 || day > 31)
        refuse("date");
    std::array<char, 40> date{};
    std::snprintf(date.data(), date.size(), "%04d/%02d/%02d", std::stoi(parts[1]), month, day);
    return date.data();
}

std::string timeText(const Json &value) {
    const std::string text = looseText(value);
    const auto parts = matched(text, R"((\d{1,2}):(\d{2})(?::(\d{2}))?)", "time");
    const int hour = std::stoi(parts[1]);
    const int minute = std::stoi(parts[2]);
    const int second = parts[3].matched ? std::stoi(parts[3]) : 0;
    if (hour > 23 || minute > 59 || second > 59)
        refuse("time");
    std::array<char, 40> time{};
    std::snprintf(time.data(), time.size(), "%02d:%02d:%02d", hour, minute, second);
    return time.data();
}

/// What a synchronised clock of the zone shows now, in the record's form.
std::string clockText(const std::string &zone, std::int64_t nowMs) {
    const std::tm parts = utcParts(nowMs + std::int64_t{minutesAhead(zone)} * 60000);
    std::array<char, 40> text{};
    std::strftime(text.data(), text.size(), "%Y/%m/%d %H:%M:%S", &parts);
    return text.data();
}

void addClock(Json &changes, const Json &settings, std::int64_t nowMs) {
    const bool hasDate = settings.contains("date");
    const bool hasTime = settings.contains("time");
    const std::string zone = settings.contains("posixTz") ? looseText(settings["posixTz"]) : std::string();
    if (hasDate || hasTime) {
        const std::string now = clockText(zone, nowMs);
        changes["d_dtime"] = (hasDate ? dateText(settings["date"]) : now.substr(0, 10)) + ' ' +
                             (hasTime ? timeText(settings["time"]) : now.substr(11));
    } else if (!zone.empty() || settings.contains("timesync") || settings.contains("server1")) {
        changes["d_dtime"] = clockText(zone, nowMs);
    }
}

void addServers(Json &changes, const Json &settings) {
    Json servers = Json::array();
    for (const char *name : {"server1", "server2", "server3", "server4", "server5"}) {
        const std::string server = settings.contains(name) ? looseText(settings[name]) : std::string();
        if (!server.empty())
            servers.push_back(server);
    }
    if (!servers.empty())
        changes["d_timeservers"] = servers;
}

void addPlain(Json &changes, const Json &settings) {
    struct Plain {
        const char *setting;
        const char *member;
    };
    for (const auto &[setting, member] : {Plain{"posixTz", "d_timezone"}, Plain{"timesync", "d_timesync"},
                                          Plain{"updateInterval", "d_syncinterval"}})
        if (settings.contains(setting))
            changes[member] = looseText(settings[setting]);
}

} // namespace

int minutesAhead(const std::string &posixZone) {
    if (posixZone.empty())
        return 0;
    const auto parts = matched(
        posixZone, R"((?:[A-Za-z]{3,}|<[-+A-Za-z0-9]{3,}>)([-+]?)(\d{1,3})(?::(\d{2}))?(?::\d{2})?(?:\D.*)?)",
        "posixTz");
    const int hours = std::stoi(parts[2]);
    if (hours > 24)
        refuse("posixTz");
    const int minutes = hours * 60 + (parts[3].matched ? std::stoi(parts[3]) : 0);
    // Such a zone counts the hours that are missing to UTC.
    return parts[1] == "-" ? minutes : -minutes;
}

Json quickSetupChanges(const Json &settings, std::int64_t nowMs) {
    Json changes = Json::object();
    if (settings.contains("powerfreq"))
        changes["d_powerfreq"] = frequencyOf(settings["powerfreq"]);
    if (settings.contains("mute"))
        changes["d_audio"] = switchOf(settings["mute"], "mute") ? "mute" : "unmute";
    if (settings.contains("daylightEnable"))
        changes["d_daylight"] = switchOf(settings["daylightEnable"], "daylightEnable");
    addClock(changes, settings, nowMs);
    addServers(changes, settings);
    addPlain(changes, settings);
    if (changes.empty())
        throw Refusal(Code::Malformed, "there is nothing to set up");
    return changes;
}

} // namespace emulator
