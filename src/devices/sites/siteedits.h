#pragma once

#include "devices/sites/sitelist.h"

#include <QCoreApplication>
#include <QStringList>

#include <map>
#include <optional>
#include <set>

/// The sites of the service as last read, with what the user has changed since then and not sent yet.
///
/// A value without threads of its own: a copy may be brought up to date and sent by a runner while the
/// original stays with the tree.
class SiteEdits {
    Q_DECLARE_TR_FUNCTIONS(SiteEdits)

public:
    static constexpr int maxDepth = 5;
    static constexpr int maxNameLength = 255;

    /// Takes over a new reading. The edits stay on top of it; those that make no sense any more are dropped,
    /// and told as texts for the user.
    QStringList takeReading(const Sites::List &reading);

    /// What the service holds, as far as known.
    const Sites::List &reading() const { return m_base; }
    /// What the user sees: the reading with the edits.
    const Sites::List &merged() const { return m_merged; }
    /// Forgets the edits; those that are on their way to the service arrive all the same.
    void discard();
    bool isDirty() const { return !m_edits.isEmpty(); }

    bool contains(const QString &id) const { return find(id) != nullptr; }
    /// Whether the service has the site: a new one is not there before its commit has succeeded.
    bool isCommitted(const QString &id) const;
    /// The name of a site of the merged list; empty where there is none.
    QString nameOf(const QString &id) const;

    /// Adds a site with the default name and returns its id, made from the time; empty when its parent is not
    /// there or lies on the last level.
    QString add(const QString &parentId, qint64 nowMs);
    /// These return why it cannot be, as a text for the user, or nothing when it is done.
    QString rename(const QString &id, const QString &name);
    QString move(const QString &id, const QString &parentId);
    QString moveProblem(const QString &id, const QString &parentId) const;
    /// Removes a site with everything below it.
    void remove(const QString &id);

    /// What the service's commit takes: all sites, and the deleted ones marked.
    JSON commitRecords() const;
    /// The same, remembering that the present edits are on their way. Exactly one of the two ends follows;
    /// edits made before it are kept for the next commit.
    JSON beginCommit();
    void commitSucceeded();
    void commitFailed();
    bool isCommitting() const { return m_sent.has_value(); }
    /// How many commits have succeeded: a reading that was begun under a smaller number is out of date.
    int commitCount() const { return m_commits; }

private:
    struct Change {
        std::optional<QString> name;
        std::optional<QString> parentId;
    };
    struct Edits {
        Sites::List added;
        std::map<QString, Change> changes; ///< of sites that the service has
        std::set<QString> removed;

        bool isEmpty() const { return added.empty() && changes.empty() && removed.empty(); }
    };

    static Sites::List patched(const Sites::List &base, const Edits &edits);
    const Sites::Site *find(const QString &id) const;
    Sites::Site *findAdded(const QString &id);
    void rebase(Edits &edits, QStringList &dropped) const;
    void matchReading(Edits &edits, QStringList &dropped) const;
    bool dropMisplaced(Edits &edits, QStringList &dropped) const;
    void merge();

    Sites::List m_base;
    Edits m_edits;
    Sites::List m_merged;
    std::optional<Edits> m_sent;
    /// New sites that were sent: until a commit succeeds, the service may have them or not.
    std::set<QString> m_doubtful;
    int m_commits = 0;
};
