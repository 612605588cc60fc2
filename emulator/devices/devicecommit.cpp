#include "devices/devicecommit.h"

#include "http/response.h"
#include "model.h"
#include "simulation/clock.h"
#include "simulation/devicemaker.h"

#include <algorithm>
#include <optional>
#include <unordered_map>
#include <unordered_set>
#include <utility>

namespace emulator {

namespace {

using Sites = std::optional<std::vector<std::string>>;

[[noreturn]] void refuse(const std::string &why) {
    throw Refusal(Code::Malformed, why);
}

const std::unordered_map<std::string, Json::value_t> &knownMembers() {
    using Type = Json::value_t;
    static const std::unordered_map<std::string, Type> types = {
        {"id", Type::string},
        {"d_model", Type::string},
        {"d_hostname", Type::string},
        {"d_ip", Type::string},
        {"d_mac", Type::string},
        {"d_fw", Type::string},
        {"d_svrtype", Type::string},
        {"d_sdstatus", Type::string},
        {"d_dtime", Type::string},
        {"d_audio", Type::string},
        {"d_nettype", Type::string},
        {"d_cert_subject", Type::string},
        {"d_http", Type::number_integer},
        {"d_https", Type::number_integer},
        {"d_sdusage", Type::number_integer},
        {"d_powerfreq", Type::number_integer},
        {"d_cert_expires", Type::number_integer},
        {"d_8021x_expires", Type::number_integer},
        {"https_enable", Type::boolean},
        {"ieee8021x_enable", Type::boolean},
        {"d_has_matching_cert", Type::boolean},
        {"d_has_matching_private_key", Type::boolean},
        {"d_has_matching_cert_request", Type::boolean},
        {"d_policy", Type::object},
    };
    return types;
}

bool fits(const Json &value, Json::value_t type) {
    return type == Json::value_t::number_integer ? value.is_number_integer() : value.type() == type;
}

/// A value that the service itself sent is accepted, also when its type is wrong.
void judgeMembers(const Json &record, const Json &known) {
    for (const auto &[name, value] : record.items()) {
        const auto type = knownMembers().find(name);
        if (type == knownMembers().end() || fits(value, type->second))
            continue;
        const auto held = known.find(name);
        if (held == known.end() || *held != value)
            refuse("member \"" + name + "\" of a device has a wrong type");
    }
}

Sites sitesOf(const Json &record) {
    const auto found = record.find("siteid");
    if (found == record.end())
        return std::nullopt;
    const Json list = found->is_string() ? parseJson(found->get_ref<const std::string &>()) : *found;
    if (!list.is_array())
        refuse("\"siteid\" of a device is no array");
    std::vector<std::string> sites;
    for (const Json &site : list) {
        if (!site.is_string())
            refuse("\"siteid\" of a device holds something else than texts");
        sites.push_back(site.get<std::string>());
    }
    return sites;
}

/// A device that is managed at all is in the overview.
std::vector<std::string> withOverview(std::vector<std::string> sites) {
    if (std::find(sites.begin(), sites.end(), overviewId) == sites.end())
        sites.insert(sites.begin(), overviewId);
    return sites;
}

/// A record that was typed in names no class; the service derives it from the model.
Json classified(Json record) {
    const auto type = record.find("d_svrtype");
    const auto model = record.find("d_model");
    if (type == record.end() || *type == "") {
        const bool named = model != record.end() && model->is_string();
        record["d_svrtype"] = classOf(named ? model->get<std::string>() : std::string());
    }
    return record;
}

class DeviceCommit {
public:
    explicit DeviceCommit(Model &model) : m_model(model) {}

    void judge(const Json &record) {
        if (!record.is_object())
            refuse("a device is no object");
        const Device *known = deviceOf(record);
        judgeMembers(record, known ? Json::parse(known->body) : Json::object());
        judgeMac(record, known);
        judgeSites(sitesOf(record), known);
    }

    void apply(const Json &record) {
        Device *known = deviceOf(record);
        const Sites sites = sitesOf(record);
        if (known && sites && sites->empty()) {
            m_removed.insert(known->id);
        } else if (known) {
            m_removed.erase(known->id);
            change(*known, record, sites);
        } else {
            add(record, sites);
        }
    }

    void finish() { removeDevices(m_model, {m_removed.begin(), m_removed.end()}); }

private:
    Device *deviceOf(const Json &record) const {
        const std::string id = optionalText(record, "id");
        if (!id.empty())
            return &m_model.devices.get(id);
        const std::string key = macKeyOf(textMember(record, "d_mac"));
        if (key.empty())
            refuse("a device has neither an id nor a MAC");
        return m_model.devices.findByMac(key);
    }

    /// A MAC has one holder, and within one commit one claimant.
    void judgeMac(const Json &record, const Device *known) {
        const auto mac = record.find("d_mac");
        if (mac == record.end() || !mac->is_string())
            return;
        const std::string key = macKeyOf(mac->get_ref<const std::string &>());
        const Device *holder = m_model.devices.findByMac(key);
        const auto claim = m_claims.try_emplace(key, known).first;
        if ((holder && holder != known) || (claim->second != known && !key.empty()))
            refuse("the MAC belongs to another device");
    }

    void judgeSites(const Sites &sites, const Device *known) const {
        if (!known && sites && sites->empty())
            throw Refusal(Code::UnknownId, "a device to be removed is unknown");
        for (const std::string &site : sites.value_or(std::vector<std::string>()))
            if (site != overviewId && !m_model.sites.contains(site))
                throw Refusal(Code::UnknownId, "no site " + site);
    }

    void change(Device &known, const Json &record, const Sites &sites) {
        Device changed = known;
        Json merged = Json::parse(known.body);
        merged.update(record);
        if (sites) {
            changed.sites = withOverview(*sites);
            changed.sitesAsText = false;
        }
        setRecord(changed, classified(std::move(merged)));
        m_model.devices.update(known, std::move(changed));
    }

    void add(const Json &record, const Sites &sites) {
        Device device;
        device.id = m_model.devices.newId();
        device.sites = withOverview(sites.value_or(std::vector<std::string>()));
        setRecord(device, classified(record));
        const bool factoryFresh = device.macKey.ends_with("0");
        device.authorization = factoryFresh ? Authorization::SetPassword : Authorization::Unauthorized;
        m_model.devices.add(std::move(device));
    }

    Model &m_model;
    std::unordered_map<std::string, const Device *> m_claims;
    std::unordered_set<std::string> m_removed;
};

} // namespace

void commitDevices(Model &model, const Json &records) {
    DeviceCommit commit(model);
    for (const Json &record : records)
        commit.judge(record);
    Transaction transaction(model.store.database());
    for (const Json &record : records)
        commit.apply(record);
    commit.finish();
    transaction.commit();
}

void removeDevices(Model &model, const std::vector<std::string> &ids) {
    for (const std::string &id : ids)
        model.scans.release(model.devices.get(id));
    model.engine.forget({ids.begin(), ids.end()}, nowMs());
    model.devices.remove({ids.begin(), ids.end()});
}

} // namespace emulator
