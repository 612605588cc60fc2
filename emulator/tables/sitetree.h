#pragma once

#include "http/jsonaccess.h"
#include "tables/records.h"

#include <string>
#include <unordered_set>
#include <vector>

namespace emulator {

class Store;

/// The hierarchy of sites. Every change is judged as a whole first; Refusal leaves the tree as it was.
class SiteTree {
public:
    explicit SiteTree(Store &store);

    const std::vector<Site> &all() const { return m_sites; }
    bool contains(const std::string &id) const { return m_ids.contains(id); }
    std::string pageText(Page page) const;

    /// Adds a site and gives its id.
    std::string add(const std::string &name, const std::string &parent, std::int64_t nowMs);
    void rename(const std::string &id, const std::string &name);

    /// Applies records and deletions and gives the ids of all the sites that went.
    std::unordered_set<std::string> commit(const Json &records);
    /// Drops a site with everything below it and gives their ids.
    std::unordered_set<std::string> remove(const std::string &id);

    void replaceAll(std::vector<Site> sites);

private:
    Store &m_store;
    std::vector<Site> m_sites;
    std::unordered_set<std::string> m_ids;
};

} // namespace emulator
