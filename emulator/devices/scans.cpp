#include "devices/scans.h"

#include "http/response.h"
#include "simulation/devicemaker.h"
#include "simulation/ipv4.h"
#include "tables/devicetable.h"

#include <algorithm>
#include <charconv>
#include <limits>
#include <optional>
#include <utility>

namespace emulator {

namespace {

constexpr std::uint64_t firstNeighbour = 1000000;
constexpr std::uint64_t neighbourCount = 40;
constexpr std::size_t maxNeighbours = 2000;
// A search of the whole network meets managed devices too; a few of them are enough to see the difference.
constexpr std::size_t managedInSearch = 5;
constexpr std::int64_t firstResponseMs = 400;
constexpr std::int64_t lastResponseMs = 2000;

std::uint32_t checkedAddress(const std::string &text) {
    const auto number = addressNumber(text);
    if (!number)
        throw Refusal(Code::Malformed, "\"" + text + "\" is no address");
    return *number;
}

std::int64_t checkedPort(const std::string &text) {
    int port = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), port);
    if (error != std::errc() || end != text.data() + text.size() || port < 1 || port > 65535)
        throw Refusal(Code::Malformed, "\"" + text + "\" is no port");
    return port;
}

bool listensOn(const Json &record, std::int64_t port) {
    return port == 0 || record.value("d_http", Json()) == port || record.value("d_https", Json()) == port;
}

} // namespace

void Scans::seedNeighbours(std::uint64_t seed) {
    for (std::uint64_t n = 0; n < neighbourCount; ++n) {
        Appearance appearance = appearanceOf(seed, firstNeighbour + n);
        appearance.ip = "10.99.0." + std::to_string(10 + n);
        Json record = firstRecord(appearance);
        record["id"] = "";
        record["siteid"] = {overviewId};
        m_neighbours.push_back({macKeyOf(appearance.mac), checkedAddress(appearance.ip), std::move(record)});
    }
}

void Scans::start(std::int64_t nowMs) {
    search({0, std::numeric_limits<std::uint32_t>::max(), 0}, managedInSearch, nowMs);
}

void Scans::startAddress(const std::string &address, std::int64_t nowMs) {
    const auto colon = address.find(':');
    const std::uint32_t number = checkedAddress(address.substr(0, colon));
    const std::int64_t port = colon == std::string::npos ? 0 : checkedPort(address.substr(colon + 1));
    search({number, number, port}, 1, nowMs);
}

void Scans::startRange(const std::string &first, const std::string &last, std::int64_t nowMs) {
    const Target target{checkedAddress(first), checkedAddress(last), 0};
    if (target.first > target.last)
        throw Refusal(Code::Malformed, "the range of addresses ends before it begins");
    search(target, std::numeric_limits<std::size_t>::max(), nowMs);
}

std::string Scans::foundText(std::int64_t nowMs) const {
    std::string text;
    for (const Found &found : m_found)
        if (found.at <= nowMs)
            text += (text.empty() ? "" : ",") + found.record;
    return '[' + text + ']';
}

void Scans::release(const Device &device) {
    const auto address = addressNumber(device.ip);
    const bool known = std::any_of(m_neighbours.begin(), m_neighbours.end(), [&](const Neighbour &neighbour) {
        return neighbour.macKey == device.macKey;
    });
    if (!address || known || device.macKey.empty())
        return;
    const Json whole = Json::parse(device.body);
    Json record;
    for (const char *shown : {"d_model", "d_ip", "d_mac", "d_http", "d_https", "d_svrtype"})
        if (const auto value = whole.find(shown); value != whole.end())
            record[shown] = *value;
    record["id"] = "";
    record["siteid"] = {overviewId};
    m_neighbours.push_back({device.macKey, *address, std::move(record)});
    if (m_neighbours.size() > maxNeighbours)
        m_neighbours.pop_front();
}

void Scans::search(const Target &target, std::size_t maxManaged, std::int64_t nowMs) {
    const auto covers = [&](std::uint32_t number) { return number >= target.first && number <= target.last; };
    m_found.clear();
    for (const Neighbour &neighbour : m_neighbours)
        if (covers(neighbour.address) && listensOn(neighbour.record, target.port) &&
            !m_devices.findByMac(neighbour.macKey))
            m_found.push_back({0, jsonText(neighbour.record)});
    std::size_t managed = 0;
    for (std::size_t i = 0; i < m_devices.size() && managed < maxManaged; ++i) {
        const Device &device = m_devices.at(i);
        const auto number = device.reachable ? addressNumber(device.ip) : std::nullopt;
        if (number && covers(*number) && listensOn(Json::parse(device.body), target.port)) {
            m_found.push_back({0, recordText(device)});
            ++managed;
        }
    }
    const auto count = static_cast<std::int64_t>(m_found.size());
    for (std::int64_t i = 0; i < count; ++i) {
        m_found[static_cast<std::size_t>(i)].at =
            nowMs + firstResponseMs + (lastResponseMs - firstResponseMs) * (i + 1) / count;
    }
}

} // namespace emulator
