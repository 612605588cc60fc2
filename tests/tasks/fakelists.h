#pragma once

#include "ciphers.h"
#include "localstore.h"
#include "scriptedpeer.h"

#include <mutex>

/// A service that has nothing but a list of tasks and one of alarms, and is logged in to.
class FakeLists {
public:
    FakeLists() {
        m_peer.follow([this](const ScriptedPeer::Request &request) { return answer(request); });
        const std::string cipher = Ciphers::sealSecret("session-token_0123456789").value_or("");
        CLocalStore::instance().setLoginInfo("127.0.0.1", m_peer.port(), "admin",
                                             QByteArray::fromStdString(cipher));
    }
    ~FakeLists() { CLocalStore::instance().clearLoginInfo(); }

    void setTasks(const std::vector<nlohmann::json> &tasks) { setTaskAnswer(tasks); }
    /// The whole list, right or wrong.
    void setTaskAnswer(nlohmann::json data) {
        const std::lock_guard lock(m_mutex);
        m_tasks = std::move(data);
    }
    /// The whole answer's data, right or wrong.
    void setAlarms(nlohmann::json data) {
        const std::lock_guard lock(m_mutex);
        m_alarms = std::move(data);
    }
    /// From now on the requests to the path answer with this code.
    void refuse(const std::string &path, int code) {
        const std::lock_guard lock(m_mutex);
        m_codes[path] = code;
    }
    /// The bodies that were sent to a path.
    std::vector<nlohmann::json> sentTo(const std::string &path) {
        for (const ScriptedPeer::Request &request : m_peer.takeRequests())
            m_sent[request.path].push_back(request.json());
        return m_sent[path];
    }

private:
    ScriptedPeer::Reply answer(const ScriptedPeer::Request &request) {
        const std::lock_guard lock(m_mutex);
        if (const auto code = m_codes.find(request.path); code != m_codes.end())
            return ScriptedPeer::json({{"code", code->second}});
        if (request.path == "/v1/alarm/list")
            return ScriptedPeer::sealed(m_alarms);
        if (request.path != "/v1/task/list" || !m_tasks.is_array())
            return request.path == "/v1/task/list" ? ScriptedPeer::sealed(m_tasks) : ScriptedPeer::json({{"code", 0}});
        const std::size_t start = request.json()["start"];
        const std::size_t count = request.json()["count"];
        nlohmann::json page = nlohmann::json::array();
        for (std::size_t i = start; i < std::min(start + count, m_tasks.size()); ++i)
            page.push_back(m_tasks[i]);
        return ScriptedPeer::sealed(page);
    }

    std::mutex m_mutex;
    nlohmann::json m_tasks = nlohmann::json::array();
    nlohmann::json m_alarms = {{"items", nlohmann::json::array()}, {"total_items", 0}};
    std::map<std::string, int> m_codes;
    std::map<std::string, std::vector<nlohmann::json>> m_sent;
    ScriptedPeer m_peer;
};
