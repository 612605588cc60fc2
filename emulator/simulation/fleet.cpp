#include "simulation/fleet.h"

#include "model.h"
#include "simulation/devicemaker.h"
#include "simulation/random.h"
#include "tables/devicetable.h"

#include <array>
#include <cstdio>
#include <string>
#include <utility>
#include <vector>

namespace emulator {

namespace {

constexpr int maxDepth = 5;
constexpr std::int64_t firstSiteNumber = 1748736000000;

/// A site of the opening part of every fleet, by the row of its parent; -1 for the root.
struct SiteSketch {
    int parent;
    const char *name;
};

constexpr std::array<SiteSketch, 20> sketches = {{
    {-1, "Headquarters"}, {0, "Building A"},  {1, "Lobby"},      {-1, "Warehouse North"}, {3, "Loading Dock"},
    {-1, "Retail"},       {5, "Main Street"}, {0, "Building B"}, {1, "Floor 1"},          {8, "East Wing"},
    {9, "Server Room"},   {3, "Gate East"},   {5, "Station"},    {7, "Reception"},        {0, "Parking"},
    {8, "West Wing"},     {12, "Kiosk"},      {4, "Ramp 1"},     {-1, "Plant South"},     {18, "Assembly"},
}};

constexpr std::array<std::array<const char *, 4>, maxDepth> levelNames = {{
    {"Campus", "Warehouse", "Retail", "Plant"},
    {"Building", "Hall", "Store", "Yard"},
    {"Floor", "Dock", "Gate", "Department"},
    {"Wing", "Corridor", "Section", "Entrance"},
    {"Room", "Stairs", "Lobby", "Storage"},
}};

struct SiteNode {
    Site site;
    int level = 1;
};

class SiteMaker {
public:
    SiteMaker(std::size_t count, std::uint64_t seed) : m_random(mixed(seed ^ 0x517e)) {
        for (std::size_t i = 0; i < count; ++i)
            i < sketches.size() ? addSketch(sketches[i]) : addInvented();
    }

    std::vector<Site> take() const {
        std::vector<Site> sites;
        for (const SiteNode &node : m_nodes)
            sites.push_back(node.site);
        return sites;
    }

private:
    void add(const SiteNode *parent, std::string name) {
        // The numbers are those of sites that were made by hand, now and then.
        const auto number = firstSiteNumber + static_cast<std::int64_t>(m_nodes.size()) * 61043;
        SiteNode node;
        node.site = {
            "SR" + std::to_string(number), std::move(name), parent ? parent->site.id : rootSiteId, {}};
        node.level = parent ? parent->level + 1 : 1;
        m_nodes.push_back(std::move(node));
    }

    void addSketch(const SiteSketch &sketch) {
        add(sketch.parent < 0 ? nullptr : &m_nodes[static_cast<std::size_t>(sketch.parent)], sketch.name);
    }

    void addInvented() {
        const SiteNode *parent = nullptr;
        if (!m_random.chance(0.05))
            do {
                parent = &m_nodes[m_random.below(m_nodes.size())];
            } while (parent->level == maxDepth);
        const auto &names = levelNames[static_cast<std::size_t>(parent ? parent->level : 0)];
        add(parent,
            std::string(names[m_random.below(names.size())]) + ' ' + std::to_string(m_nodes.size() + 1));
    }

    Random m_random;
    std::vector<SiteNode> m_nodes;
};

std::string slugOf(const std::string &name) {
    std::string slug;
    for (const char c : name)
        slug += c == ' ' ? '-' : c >= 'A' && c <= 'Z' ? static_cast<char>(c | 0x20) : c;
    return slug;
}

/// Locations for the devices of no site, and a few names as people outside of ASCII give them.
std::string placeWithoutSite(Random &random) {
    static constexpr std::array locations = {"hall", "gate-east", "dock",       "stairs",
                                             "roof", "yard",      "fence-north"};
    static constexpr std::array farPlaces = {"eingang-süd", "entrée-nord", "入口", "склад", "παρκινγκ"};
    return random.chance(0.03) ? farPlaces[random.below(farPlaces.size())]
                               : locations[random.below(locations.size())];
}

std::string numbered(const std::string &location, std::size_t number) {
    std::array<char, 24> tail{};
    std::snprintf(tail.data(), tail.size(), "-%02zu", number);
    return location + tail.data();
}

class DeviceFactory {
public:
    DeviceFactory(Model &model, std::uint64_t seed, bool inSites)
        : m_model(model), m_seed(seed), m_inSites(inSites), m_hostNumbers(model.sites.all().size() + 1, 0) {}

    void make(std::uint64_t n, std::uint32_t address) {
        Random random(mixed(m_seed ^ 0xf1ee7) ^ mixed(n));
        Appearance appearance = appearanceOf(m_seed, n);
        appearance.ip = addressOf(address);
        Device device;
        device.id = m_model.devices.newId();
        device.sites = {overviewId};
        const std::string host = chooseSites(device, random);
        chooseState(device, random);
        Json record = firstRecord(appearance);
        if (device.authorization == Authorization::Authorized)
            fillDetails(record, host);
        setRecord(device, std::move(record));
        m_model.devices.add(std::move(device));
    }

private:
    std::string chooseSites(Device &device, Random &random) {
        const auto &sites = m_model.sites.all();
        if (!m_inSites || sites.empty() || random.chance(0.08))
            return numbered(placeWithoutSite(random), ++m_hostNumbers.back());
        const std::size_t first = random.below(sites.size());
        device.sites.push_back(sites[first].id);
        const std::size_t second = random.below(sites.size());
        if (second != first && random.chance(0.1))
            device.sites.push_back(sites[second].id);
        const std::size_t number = ++m_hostNumbers[first];
        return numbered(random.chance(0.01) ? placeWithoutSite(random) : slugOf(sites[first].name), number);
    }

    static void chooseState(Device &device, Random &random) {
        static constexpr std::array rarer = {Authorization::Unauthorized,    Authorization::Unauthorized,
                                             Authorization::Unauthorized,    Authorization::AccessDenied,
                                             Authorization::InvalidPassword, Authorization::AccountBlocked,
                                             Authorization::SetPassword,     Authorization::SetPassword};
        device.authorization =
            random.chance(0.9) ? Authorization::Authorized : rarer[random.below(rarer.size())];
        device.reachable = !random.chance(0.03);
    }

    Model &m_model;
    std::uint64_t m_seed;
    bool m_inSites;
    std::vector<std::size_t> m_hostNumbers;
};

std::vector<std::uint32_t> shuffledAddresses(std::size_t count, std::uint64_t seed) {
    std::vector<std::uint32_t> addresses(count);
    for (std::size_t i = 0; i < count; ++i)
        addresses[i] = static_cast<std::uint32_t>(i);
    Random random(mixed(seed ^ 0xadd7));
    for (std::size_t i = count; i > 1; --i)
        std::swap(addresses[i - 1], addresses[random.below(i)]);
    return addresses;
}

constexpr std::uint64_t malformedSeed = 0x0dd;

Json validRecord(std::uint64_t n) {
    Appearance appearance = appearanceOf(malformedSeed, n);
    appearance.ip = "10.98.0." + std::to_string(n + 1);
    Json record = firstRecord(appearance);
    fillDetails(record, "odd-" + std::to_string(n));
    return record;
}

void corrupt(Json &record, const Json &malformations) {
    for (const auto &[name, value] : malformations.items())
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

/// Adds records such as old or broken devices leave in a service: members missing, of wrong types, hostile.
void addMalformedDevices(DeviceTable &devices) {
    add(devices, Json::object());
    const Json malformations[] = {
        wrongTypes(),
        {{"d_ip", "not-an-address"}},
        {{"d_model", "<b>NC-4210</b><img src=\"http://10.98.0.1/x.png\">"}},
        {{"d_model", std::string(10000, 'N')}},
        {{"d_hostname", "line one\nline two\t\x01"}, {"d_fw", nullptr}},
        {{"d_hostname", "%n%s%1"}, {"d_sdusage", -7}, {"d_http", 99999999}},
    };
    std::uint64_t n = 0;
    for (const Json &malformation : malformations) {
        Json record = validRecord(n++);
        corrupt(record, malformation);
        add(devices, std::move(record));
    }
    add(devices, validRecord(n), true);
}

} // namespace

void makeFleet(Model &model, const FleetPlan &plan) {
    Transaction transaction(model.store.database());
    model.sites.replaceAll(SiteMaker(plan.sites, plan.seed).take());
    DeviceFactory factory(model, plan.seed, true);
    const auto addresses = shuffledAddresses(plan.devices, plan.seed);
    for (std::size_t n = 0; n < plan.devices; ++n)
        factory.make(n, addresses[n]);
    if (plan.malformedDevices)
        addMalformedDevices(model.devices);
    model.fleetWasMade(plan.seed, plan.devices);
    transaction.commit();
}

void addDevices(Model &model, std::size_t count) {
    Transaction transaction(model.store.database());
    const std::uint64_t made = model.devicesMade();
    DeviceFactory factory(model, model.seed(), false);
    for (std::uint64_t n = made; n < made + count; ++n)
        factory.make(n, static_cast<std::uint32_t>(n));
    model.fleetWasMade(model.seed(), made + count);
    transaction.commit();
}

} // namespace emulator
