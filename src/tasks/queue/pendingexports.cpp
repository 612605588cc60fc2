#include "tasks/queue/pendingexports.h"

#include "store/storewriter.h"
#include "tasks/service/taskrecord.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <algorithm>

using namespace std::chrono_literals;

namespace {

constexpr std::size_t maxEntries = 500;
constexpr auto firstPause = 30s;
constexpr int maxDoublings = 7;

PendingExport fromJson(const JSON &value) {
    const auto asked = value.is_object() ? value.find("asked") : value.end();
    return {stringMember(value, "tid"),
            stringMember(value, "server"),
            stringMember(value, "account"),
            stringMember(value, "folder"),
            asked != value.end() && asked->is_number_integer() ? asked->get<qint64>() : 0,
            stringMember(value, "target")};
}

JSON toJson(const PendingExport &pending) {
    return {{"tid", pending.tid.toStdString()},
            {"server", pending.server.toStdString()},
            {"account", pending.account.toStdString()},
            {"folder", pending.folder.toStdString()},
            {"asked", pending.askedAt},
            {"target", pending.target.toStdString()}};
}

} // namespace

QString PendingExports::serverOf(const LoginInfo &login) {
    return login.address + QLatin1Char(':') + QString::number(login.port);
}

void PendingExports::add(PendingExport pending) {
    {
        const std::lock_guard lock(m_mutex);
        load();
        m_entries.push_back({std::move(pending)});
        if (m_entries.size() > maxEntries)
            m_entries.erase(m_entries.begin());
        save();
    }
    StoreWriter::flush();
}

void PendingExports::remove(const PendingExport &pending) {
    const std::lock_guard lock(m_mutex);
    std::erase_if(m_entries, [&](const Entry &entry) { return entry.pending.isSame(pending); });
    save();
}

void PendingExports::setTarget(const PendingExport &pending, const QString &target) {
    {
        const std::lock_guard lock(m_mutex);
        Entry *entry = find(pending);
        if (!entry)
            return;
        entry->pending.target = target;
        save();
    }
    StoreWriter::flush();
}

std::vector<PendingExport> PendingExports::due(const LoginInfo &login, Clock::time_point now) {
    const std::lock_guard lock(m_mutex);
    load();
    const QString server = serverOf(login);
    std::vector<PendingExport> found;
    for (const Entry &entry : m_entries) {
        if (entry.pending.server == server && entry.pending.account == login.account && entry.next <= now)
            found.push_back(entry.pending);
    }
    return found;
}

bool PendingExports::postpone(const PendingExport &pending, Clock::time_point now) {
    const std::lock_guard lock(m_mutex);
    Entry *entry = find(pending);
    if (!entry)
        return false;
    entry->next = now + firstPause * (1 << std::min(entry->failures, maxDoublings));
    return entry->failures++ == 0;
}

bool PendingExports::isLost(const PendingExport &pending, bool listed) {
    const std::lock_guard lock(m_mutex);
    Entry *entry = find(pending);
    if (!entry)
        return false;
    entry->lacking = listed ? 0 : entry->lacking + 1;
    return entry->lacking >= listsWithoutAGoneTask;
}

PendingExports::Entry *PendingExports::find(const PendingExport &pending) {
    const auto found = std::find_if(m_entries.begin(), m_entries.end(),
                                    [&](const Entry &entry) { return entry.pending.isSame(pending); });
    return found == m_entries.end() ? nullptr : &*found;
}

void PendingExports::load() {
    if (std::exchange(m_loaded, true))
        return;
    const std::string text = CLocalStore::instance().pendingExports().toStdString();
    const JSON values = JSON::parse(text, nullptr, false);
    for (const JSON &value : values.is_array() ? values : JSON::array()) {
        PendingExport pending = fromJson(value);
        if (!pending.tid.isEmpty() && !pending.folder.isEmpty())
            m_entries.push_back({std::move(pending)});
    }
    m_empty = m_entries.empty();
}

/// Queued under the lock: what is written last is what is true.
void PendingExports::save() {
    JSON values = JSON::array();
    for (const Entry &entry : m_entries)
        values.push_back(toJson(entry.pending));
    m_empty = m_entries.empty();
    StoreWriter::post([text = QString::fromStdString(dumpJson(values))] {
        if (!CLocalStore::instance().setPendingExports(text))
            qWarning("The exports that are waited for could not be stored");
    });
}
