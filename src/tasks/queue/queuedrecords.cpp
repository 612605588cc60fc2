#include "tasks/queue/queuedrecords.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <atomic>

namespace {

constexpr const char *waiting = "init";
/// The member with the session that a record belongs to.
constexpr const char *sessionMember = "session";
/// The members with the server and the account of that session.
constexpr const char *addressMember = "session_address";
constexpr const char *portMember = "session_port";
constexpr const char *accountMember = "session_account";
constexpr const char *secretMember = "pass";

std::string newId(const char *prefix) {
    static std::atomic<unsigned> counter = 0;
    return prefix + std::to_string(++counter);
}

void wipe(JSON &record) {
    const auto secret = record.find(secretMember);
    if (secret == record.end() || !secret->is_string())
        return;
    auto &text = secret->get_ref<std::string &>();
    std::fill(text.begin(), text.end(), '\0');
    record.erase(secret);
}

} // namespace

QueuedRecords::QueuedRecords() = default;

QueuedRecords::~QueuedRecords() = default;

std::string QueuedRecords::append(JSON record, const char *type, const char *idPrefix,
                                  const LoginInfo &login) {
    if (!record.is_object() || !record.emplace("state", waiting).first->is_string())
        return {};
    std::string id = newId(idPrefix);
    record["ctid"] = id;
    record["type"] = type;
    record[sessionMember] = login.generation;
    record[addressMember] = login.address.toStdString();
    record[portMember] = login.port;
    record[accountMember] = login.account.toStdString();
    const std::lock_guard lock(m_mutex);
    m_places.emplace(id, m_records.size());
    m_records.push_back(std::move(record));
    m_unwalked = true;
    return id;
}

bool QueuedRecords::takeNext(std::size_t &place, JSON &record) {
    const std::lock_guard lock(m_mutex);
    while (place < m_records.size()) {
        const JSON &each = m_records[place++];
        if (each.is_null())
            continue;
        const auto state = each.at("state").get<std::string>();
        const auto type = each.at("type").get<std::string>();
        if (state == waiting) {
            record = each;
            return true;
        }
    }
    m_unwalked = false;
    return false;
}

bool QueuedRecords::hasPending() const {
    const std::lock_guard lock(m_mutex);
    return m_unwalked;
}

bool QueuedRecords::setState(const std::string &ctid, const char *state, Secret secret) {
    const std::lock_guard lock(m_mutex);
    JSON *record = recordOf(ctid);
    if (!record || record->at("state") == state)
        return false;
    (*record)["state"] = state;
    if (secret == Secret::Wipe)
        wipe(*record);
    return true;
}

void QueuedRecords::wipeSecret(const std::string &ctid) {
    const std::lock_guard lock(m_mutex);
    if (JSON *record = recordOf(ctid))
        wipe(*record);
}

std::vector<JSON> QueuedRecords::abandonOtherSessions(quint64 presentSession) {
    std::vector<JSON> left;
    const std::lock_guard lock(m_mutex);
    for (JSON &each : m_records) {
        if (sessionOf(each) == presentSession)
            continue;
        wipe(each);
        if (each.at("state") == waiting)
            left.push_back(each);
    }
    return left;
}

JSON QueuedRecords::find(const std::string &ctid) const {
    const std::lock_guard lock(m_mutex);
    const auto place = m_places.find(ctid);
    return place == m_places.end() ? JSON() : m_records[place->second];
}

/// The lock has to be held.
JSON *QueuedRecords::recordOf(const std::string &ctid) {
    const auto place = m_places.find(ctid);
    return place == m_places.end() ? nullptr : &m_records[place->second];
}

quint64 QueuedRecords::sessionOf(const JSON &record) {
    return record.at(sessionMember).get<quint64>();
}

LoginInfo QueuedRecords::loginOf(const JSON &record) {
    LoginInfo login;
    login.address = stringMember(record, addressMember);
    login.port = record.at(portMember).get<quint32>();
    login.account = stringMember(record, accountMember);
    login.generation = sessionOf(record);
    return login;
}
