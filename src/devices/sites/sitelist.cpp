#include "devices/sites/sitelist.h"

#include <QHash>
#include <QSet>

#include <nlohmann/json.hpp>

namespace Sites {

namespace {

/// Nobody nests sites deeper; what draws, opens and deletes the rows of a tree goes down level by level on
/// the stack.
constexpr int maxLevels = 64;

List readRecords(const JSON &records) {
    List sites;
    QSet<QString> seen;
    for (const JSON &record : records) {
        const QString id = stringMember(record, "siteid");
        if (id.isEmpty() || id == rootId || id == overviewId || seen.contains(id))
            continue;
        seen.insert(id);
        sites.push_back({id, stringMember(record, "parentid"), stringMember(record, "sitename"),
                         QByteArray::fromStdString(dumpJson(record))});
    }
    return sites;
}

/// Appends the sites below a parent, level by level; no recursion, since the depth is the service's. What is
/// too deep goes onto the top level with what is below it.
void appendBelow(const QString &root, int firstLevel, const QMultiHash<QString, Site> &byParent,
                 QSet<QString> &placed, List &ordered) {
    List level;
    const auto childrenOf = [&](const QString &parent) {
        // A multi-hash gives the latest first; the service's order is the one to keep.
        const QList<Site> children = byParent.values(parent);
        return List(children.crbegin(), children.crend());
    };
    level = childrenOf(root);
    for (int depth = firstLevel; !level.empty(); ++depth) {
        List next;
        const bool isTooDeep = depth > maxLevels;
        if (isTooDeep)
            depth = 1;
        for (Site &site : level) {
            if (placed.contains(site.id))
                continue;
            if (isTooDeep)
                site.parentId = rootId;
            placed.insert(site.id);
            ordered.push_back(site);
            const List children = childrenOf(site.id);
            next.insert(next.end(), children.begin(), children.end());
        }
        level = std::move(next);
    }
}

} // namespace

List parse(const JSON &records) {
    return records.is_array() ? arranged(readRecords(records)) : List();
}

List arranged(List sites) {
    QSet<QString> known{rootId};
    for (const Site &site : sites)
        known.insert(site.id);
    QMultiHash<QString, Site> byParent;
    for (Site &site : sites) {
        if (!known.contains(site.parentId))
            site.parentId = rootId;
        byParent.insert(site.parentId, site);
    }
    List ordered;
    QSet<QString> placed;
    appendBelow(rootId, 1, byParent, placed, ordered);
    // What is left hangs in a cycle: its first member becomes a top-level site, which breaks the cycle.
    for (Site site : sites) {
        if (placed.contains(site.id))
            continue;
        site.parentId = rootId;
        placed.insert(site.id);
        ordered.push_back(site);
        appendBelow(site.id, 2, byParent, placed, ordered);
    }
    return ordered;
}

} // namespace Sites
