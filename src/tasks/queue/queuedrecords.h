#pragma once

#include "platform/json.h"
#include "store/localstore.h"

#include <QtGlobal>

#include <mutex>
#include <string>
#include <unordered_map>
#include <vector>

/// The records of a queue in the order of their insertion; they are never removed. Any thread.
class QueuedRecords {
public:
    QueuedRecords();
    ~QueuedRecords();

    /// Appends a record as one that waits for its turn in the session, with an id that begins with the
    /// prefix, and returns the id. Empty, and nothing appended, for a record that would stop every walk: no
    /// object, or with a state that is no text.
    std::string append(JSON record, const char *type, const char *idPrefix, const LoginInfo &login);

    /// Copies the next record that waits, from the place on. False at the end, which counts as a whole walk;
    /// records that were appended meanwhile are reached. Throws for a record without type or state.
    bool takeNext(std::size_t &place, JSON &record);
    /// True while a record may wait: one has been appended since the last whole walk.
    bool hasPending() const;

    enum class Secret { Keep, Wipe };
    /// False when there is no such record or it is in that state already.
    bool setState(const std::string &ctid, const char *state, Secret secret);
    void wipeSecret(const std::string &ctid);
    /// Wipes the secrets of other sessions' records and copies those that wait.
    std::vector<JSON> abandonOtherSessions(quint64 presentSession);

    /// Null where there is no such record.
    JSON find(const std::string &ctid) const;

    static quint64 sessionOf(const JSON &record);
    /// The session that a record was inserted in, without its token.
    static LoginInfo loginOf(const JSON &record);

private:
    JSON *recordOf(const std::string &ctid);

    mutable std::mutex m_mutex;
    std::vector<JSON> m_records;
    std::unordered_map<std::string, std::size_t> m_places; ///< by id
    bool m_unwalked = false;
};
