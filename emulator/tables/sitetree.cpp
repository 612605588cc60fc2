#include "tables/sitetree.h"

#include "http/response.h"
#include "tables/store.h"

#include <algorithm>
#include <unordered_map>
#include <utility>

namespace emulator {

namespace {

constexpr int maxDepth = 5;

/// A copy of the tree that is changed and checked before it replaces the tree.
class Draft {
public:
    explicit Draft(std::vector<Site> sites) : m_sites(std::move(sites)) {
        for (std::size_t i = 0; i < m_sites.size(); ++i)
            m_index.emplace(m_sites[i].id, i);
    }

    void put(Site site) {
        const auto [entry, isNew] = m_index.try_emplace(site.id, m_sites.size());
        if (isNew)
            m_sites.push_back(std::move(site));
        else
            m_sites[entry->second] = std::move(site);
    }

    void judge() const {
        for (const Site &site : m_sites)
            judgeAncestors(site);
    }

    /// Removes the sites and everything below them.
    std::unordered_set<std::string> drop(std::unordered_set<std::string> ids) {
        for (bool grown = true; std::exchange(grown, false);)
            for (const Site &site : m_sites)
                grown |= ids.contains(site.parent) && ids.insert(site.id).second;
        std::erase_if(m_sites, [&](const Site &site) { return ids.contains(site.id); });
        return ids;
    }

    std::vector<Site> take() { return std::move(m_sites); }

private:
    void judgeAncestors(const Site &site) const {
        const Site *at = &site;
        // A cycle never reaches the root, so the limit of the levels catches it as well.
        for (int level = 1; at->parent != rootSiteId; ++level) {
            const auto parent = m_index.find(at->parent);
            if (parent == m_index.end())
                throw Refusal(Code::Malformed, "site " + at->id + " has an unknown parent");
            if (level == maxDepth)
                throw Refusal(Code::Malformed, "site " + site.id + " is in a cycle or nests too deeply");
            at = &m_sites[parent->second];
        }
    }

    std::vector<Site> m_sites;
    std::unordered_map<std::string, std::size_t> m_index;
};

std::string ownIdOf(const Json &record) {
    std::string id = filledTextMember(record, "siteid");
    if (id == rootSiteId || id == overviewId)
        throw Refusal(Code::Malformed, "site id " + id + " is reserved");
    return id;
}

Site siteOf(const Json &record) {
    Site site{
        ownIdOf(record), filledTextMember(record, "sitename"), filledTextMember(record, "parentid"), {}};
    Json extra = record;
    for (const char *known : {"siteid", "sitename", "parentid", "deleted"})
        extra.erase(known);
    site.extra = extra.empty() ? std::string() : jsonText(extra);
    return site;
}

bool isDeletion(const Json &record) {
    const auto deleted = record.find("deleted");
    if (deleted == record.end())
        return false;
    if (!deleted->is_boolean())
        throw Refusal(Code::Malformed, "member \"deleted\" is of a wrong type");
    return deleted->get<bool>();
}

Json recordOf(const Site &site) {
    Json record = site.extra.empty() ? Json::object() : Json::parse(site.extra);
    record["siteid"] = site.id;
    record["sitename"] = site.name;
    record["parentid"] = site.parent;
    return record;
}

} // namespace

SiteTree::SiteTree(Store &store) : m_store(store) {
    m_sites = store.sites();
    for (const Site &site : m_sites)
        m_ids.insert(site.id);
}

std::string SiteTree::pageText(Page page) const {
    Json records = Json::array();
    for (std::size_t i = page.start; i < m_sites.size() && records.size() < page.count; ++i)
        records.push_back(recordOf(m_sites[i]));
    return jsonText(records);
}

std::string SiteTree::add(const std::string &name, const std::string &parent, std::int64_t nowMs) {
    std::string id;
    do {
        id = "SR" + std::to_string(nowMs++);
    } while (contains(id));
    Draft draft(m_sites);
    draft.put({id, name, parent, {}});
    draft.judge();
    replaceAll(draft.take());
    return id;
}

void SiteTree::rename(const std::string &id, const std::string &name) {
    const auto known =
        std::find_if(m_sites.begin(), m_sites.end(), [&](const Site &s) { return s.id == id; });
    if (known == m_sites.end())
        throw Refusal(Code::UnknownId, "no such site");
    Draft draft(m_sites);
    draft.put({id, name, known->parent, known->extra});
    draft.judge();
    replaceAll(draft.take());
}

std::unordered_set<std::string> SiteTree::commit(const Json &records) {
    Draft draft(m_sites);
    std::unordered_set<std::string> deleted;
    for (const Json &record : records) {
        if (!record.is_object())
            throw Refusal(Code::Malformed, "a site is no object");
        if (isDeletion(record))
            deleted.insert(ownIdOf(record));
        else
            draft.put(siteOf(record));
    }
    draft.judge();
    // A site that came and went between two commits is unknown here, and its deletion is still right.
    auto gone = draft.drop(std::move(deleted));
    replaceAll(draft.take());
    return gone;
}

std::unordered_set<std::string> SiteTree::remove(const std::string &id) {
    if (!contains(id))
        throw Refusal(Code::UnknownId, "no such site");
    Draft draft(m_sites);
    auto gone = draft.drop({id});
    replaceAll(draft.take());
    return gone;
}

void SiteTree::replaceAll(std::vector<Site> sites) {
    m_store.replaceSites(sites);
    m_sites = std::move(sites);
    m_ids.clear();
    for (const Site &site : m_sites)
        m_ids.insert(site.id);
}

} // namespace emulator
