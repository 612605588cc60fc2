#include "devices/sites/siteedits.h"

#include <QDebug>
#include <QHash>
#include <QSet>

#include <nlohmann/json.hpp>

#include <algorithm>

namespace {

/// Who is below whom in a list of sites, which may hold cycles and unknown parents.
class Hierarchy {
public:
    explicit Hierarchy(const Sites::List &sites) {
        for (const Sites::Site &site : sites) {
            m_parents.insert(site.id, site.parentId);
            m_children[site.parentId].append(site.id);
        }
    }

    /// 1 for a top-level site and 0 for the root; nothing for a site that no way leads to from the root.
    std::optional<int> level(QString id) const {
        for (int level = 0; level <= m_parents.size(); ++level) {
            if (id == Sites::rootId)
                return level;
            const auto found = m_parents.constFind(id);
            if (found == m_parents.constEnd())
                return std::nullopt;
            id = *found;
        }
        return std::nullopt;
    }

    /// The site and everything below it, level by level.
    std::vector<QStringList> below(const QString &id) const {
        std::vector<QStringList> levels;
        QSet<QString> seen{id};
        for (QStringList level{id}; !level.isEmpty();) {
            QStringList next;
            for (const QString &site : level) {
                for (const QString &child : m_children.value(site)) {
                    if (!seen.contains(child))
                        next.append(child);
                    seen.insert(child);
                }
            }
            levels.push_back(std::exchange(level, next));
        }
        return levels;
    }

    /// Whether a site, with what is below it, is within the levels that there may be.
    bool isPlaced(const QString &id) const {
        const std::optional<int> own = level(id);
        return own && *own + static_cast<int>(below(id).size()) - 1 <= SiteEdits::maxDepth;
    }

private:
    QHash<QString, QString> m_parents;
    QHash<QString, QStringList> m_children;
};

void setMember(JSON &record, const char *name, const QString &value) {
    record[name] = value.toStdString();
}

} // namespace

QStringList SiteEdits::takeReading(const Sites::List &reading) {
    QStringList dropped;
    QStringList unheard;
    m_base = reading;
    rebase(m_edits, dropped);
    if (m_sent)
        rebase(*m_sent, unheard);
    merge();
    return dropped;
}

bool SiteEdits::isCommitted(const QString &id) const {
    return std::any_of(m_base.begin(), m_base.end(), [&](const Sites::Site &site) { return site.id == id; });
}

QString SiteEdits::nameOf(const QString &id) const {
    const Sites::Site *site = find(id);
    return site ? site->name : QString();
}

QString SiteEdits::add(const QString &parentId, qint64 nowMs) {
    const std::optional<int> level = Hierarchy(m_merged).level(parentId);
    if (!level || *level >= maxDepth)
        return {};
    const auto isTaken = [this](const QString &id) {
        return contains(id) || m_edits.removed.contains(id) || m_doubtful.contains(id) || isCommitted(id);
    };
    QString id;
    do
        id = QStringLiteral("SR%1").arg(nowMs++);
    while (isTaken(id));
    m_edits.added.push_back({id, parentId, tr("Site")});
    merge();
    return id;
}

QString SiteEdits::rename(const QString &id, const QString &name) {
    const Sites::Site *site = find(id);
    if (!site)
        return tr("The site does not exist any more.");
    const QString trimmed = name.trimmed();
    if (name == site->name || trimmed == site->name)
        return {};
    if (trimmed.isEmpty())
        return tr("A site needs a name.");
    if (trimmed.size() > maxNameLength)
        return tr("The name of a site has at most %1 characters.").arg(maxNameLength);
    if (Sites::Site *added = findAdded(id))
        added->name = trimmed;
    else
        m_edits.changes[id].name = trimmed;
    qDebug("rename site to %s", qUtf8Printable(trimmed));
    QStringList dropped;
    rebase(m_edits, dropped);
    merge();
    return {};
}

QString SiteEdits::moveProblem(const QString &id, const QString &parentId) const {
    const Sites::Site *site = find(id);
    if (!site)
        return tr("The site does not exist any more.");
    if (id == parentId)
        return tr("A site cannot be moved into itself.");
    if (parentId == site->parentId)
        return tr("The site is there already.");
    const Hierarchy hierarchy(m_merged);
    const std::optional<int> level = hierarchy.level(parentId);
    if (!level)
        return tr("The target does not exist any more.");
    const std::vector<QStringList> below = hierarchy.below(id);
    if (std::any_of(below.begin(), below.end(),
                    [&](const QStringList &ids) { return ids.contains(parentId); }))
        return tr("A site cannot be moved into one of its sub-sites.");
    if (*level + static_cast<int>(below.size()) > maxDepth)
        return tr("Sites nest at most %1 levels deep.").arg(maxDepth);
    return {};
}

QString SiteEdits::move(const QString &id, const QString &parentId) {
    const QString problem = moveProblem(id, parentId);
    if (!problem.isEmpty())
        return problem;
    if (Sites::Site *added = findAdded(id))
        added->parentId = parentId;
    else
        m_edits.changes[id].parentId = parentId;
    QStringList dropped;
    rebase(m_edits, dropped);
    merge();
    return {};
}

void SiteEdits::remove(const QString &id) {
    if (!contains(id))
        return;
    QSet<QString> known;
    for (const Sites::Site &site : m_base)
        known.insert(site.id);
    QSet<QString> gone;
    for (const QStringList &level : Hierarchy(m_merged).below(id)) {
        for (const QString &site : level) {
            gone.insert(site);
            m_edits.changes.erase(site);
            if (known.contains(site) || m_doubtful.contains(site))
                m_edits.removed.insert(site);
        }
    }
    std::erase_if(m_edits.added, [&gone](const Sites::Site &site) { return gone.contains(site.id); });
    merge();
}

JSON SiteEdits::commitRecords() const {
    JSON records = JSON::array();
    for (const Sites::Site &site : m_merged) {
        // The service refuses a whole commit for a site without a name, even for one that it has itself.
        if (site.name.isEmpty() && !m_edits.changes.contains(site.id))
            continue;
        JSON record = site.json.isEmpty() ? JSON::object() : parseJson(site.json.toStdString());
        setMember(record, "siteid", site.id);
        setMember(record, "parentid", site.parentId);
        setMember(record, "sitename", site.name);
        records.push_back(std::move(record));
    }
    for (const QString &id : m_edits.removed)
        records.push_back({{"siteid", id.toStdString()}, {"deleted", true}});
    return records;
}

void SiteEdits::discard() {
    m_edits = {};
    merge();
}

JSON SiteEdits::beginCommit() {
    m_sent = m_edits;
    for (const Sites::Site &site : m_edits.added)
        m_doubtful.insert(site.id);
    return commitRecords();
}

void SiteEdits::commitSucceeded() {
    if (!m_sent)
        return;
    m_base = Sites::arranged(patched(m_base, *m_sent));
    m_sent.reset();
    m_doubtful.clear();
    ++m_commits;
    QStringList dropped;
    rebase(m_edits, dropped);
    merge();
}

void SiteEdits::commitFailed() {
    m_sent.reset();
}

const Sites::Site *SiteEdits::find(const QString &id) const {
    const auto found = std::find_if(m_merged.begin(), m_merged.end(),
                                    [&](const Sites::Site &site) { return site.id == id; });
    return found == m_merged.end() ? nullptr : &*found;
}

Sites::Site *SiteEdits::findAdded(const QString &id) {
    const auto found = std::find_if(m_edits.added.begin(), m_edits.added.end(),
                                    [&](const Sites::Site &site) { return site.id == id; });
    return found == m_edits.added.end() ? nullptr : &*found;
}

/// A list with the edits made in it, in no order. What is below a removed site goes with it, also what
/// somebody else has put there, since the service does the same.
Sites::List SiteEdits::patched(const Sites::List &base, const Edits &edits) {
    Sites::List sites = base;
    sites.insert(sites.end(), edits.added.begin(), edits.added.end());
    for (Sites::Site &site : sites) {
        const auto change = edits.changes.find(site.id);
        if (change == edits.changes.end())
            continue;
        site.name = change->second.name.value_or(site.name);
        site.parentId = change->second.parentId.value_or(site.parentId);
    }
    if (edits.removed.empty())
        return sites;
    QSet<QString> gone(edits.removed.begin(), edits.removed.end());
    for (bool grown = true; std::exchange(grown, false);) {
        for (const Sites::Site &site : sites) {
            if (gone.contains(site.parentId) && !gone.contains(site.id)) {
                gone.insert(site.id);
                grown = true;
            }
        }
    }
    std::erase_if(sites, [&gone](const Sites::Site &site) { return gone.contains(site.id); });
    return sites;
}

/// Puts edits on what the service holds now. Texts name the sites as they were called before.
void SiteEdits::rebase(Edits &edits, QStringList &dropped) const {
    if (edits.isEmpty())
        return;
    matchReading(edits, dropped);
    while (dropMisplaced(edits, dropped)) {
    }
}

void SiteEdits::matchReading(Edits &edits, QStringList &dropped) const {
    QHash<QString, const Sites::Site *> known;
    for (const Sites::Site &site : m_base)
        known.insert(site.id, &site);
    std::erase_if(edits.added, [&](const Sites::Site &site) {
        if (!known.contains(site.id))
            return false;
        edits.changes[site.id] = {site.name, site.parentId};
        return true;
    });
    std::erase_if(edits.removed,
                  [&](const QString &id) { return !known.contains(id) && !m_doubtful.contains(id); });
    for (auto entry = edits.changes.begin(); entry != edits.changes.end();) {
        const QString &id = entry->first;
        Change &change = entry->second;
        const Sites::Site *site = known.value(id);
        if (!site) {
            dropped.append(tr("The site \"%1\" was deleted by somebody else, and your changes to it with it.")
                               .arg(nameOf(id)));
            entry = edits.changes.erase(entry);
            continue;
        }
        if (change.name == site->name)
            change.name.reset();
        if (change.parentId == site->parentId)
            change.parentId.reset();
        const bool isEmpty = !change.name && !change.parentId;
        entry = isEmpty ? edits.changes.erase(entry) : std::next(entry);
    }
}

/// Drops the first edit that would put a site where it cannot be. Which one of several that clash is first
/// does not matter, but one alone may be enough for the others to fit.
bool SiteEdits::dropMisplaced(Edits &edits, QStringList &dropped) const {
    const bool movesNothing = std::none_of(edits.changes.begin(), edits.changes.end(), [](const auto &entry) {
        return entry.second.parentId.has_value();
    });
    if (edits.added.empty() && movesNothing)
        return false;
    const Hierarchy hierarchy(patched(m_base, edits));
    for (auto entry = edits.changes.begin(); entry != edits.changes.end(); ++entry) {
        if (!entry->second.parentId || hierarchy.isPlaced(entry->first))
            continue;
        dropped.append(
            tr("The site \"%1\" stays where it was, since somebody else has changed the sites there.")
                .arg(nameOf(entry->first)));
        entry->second.parentId.reset();
        if (!entry->second.name)
            edits.changes.erase(entry);
        return true;
    }
    const auto misplaced = std::find_if(edits.added.begin(), edits.added.end(), [&](const Sites::Site &site) {
        return !hierarchy.isPlaced(site.id);
    });
    if (misplaced == edits.added.end())
        return false;
    dropped.append(tr("The new site \"%1\" is gone, since somebody else has changed the sites above it.")
                       .arg(misplaced->name));
    edits.added.erase(misplaced);
    return true;
}

void SiteEdits::merge() {
    m_merged = m_edits.isEmpty() ? m_base : Sites::arranged(patched(m_base, m_edits));
}
