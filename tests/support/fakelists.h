#pragma once

#include "platform/crypto/ciphers.h"
#include "scriptedpeer.h"
#include "store/localstore.h"

#include <mutex>

/// A service that has nothing but a list of tasks and one of alarms, makes tasks without number, says yes to
/// everything else, and is logged in to.
class FakeLists {
public:
    FakeLists() {
        m_peer.follow([this](const ScriptedPeer::Request &request) { return answer(request); });
        logIn();
    }
    ~FakeLists() { CLocalStore::instance().clearLoginInfo(); }

    /// Begins a session, in place of an earlier one.
    void logIn() {
        const std::string cipher = Ciphers::sealSecret("session-token_0123456789").value_or("");
        CLocalStore::instance().setLoginInfo("127.0.0.1", m_peer.port(), "admin",
                                             QByteArray::fromStdString(cipher));
    }

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
    /// The devices there are: a task for any other is refused from now on.
    void setDevices(nlohmann::json devices) {
        const std::lock_guard lock(m_mutex);
        m_devices = std::move(devices);
    }
    /// From now on the requests to the path answer with this code; 0 ends it.
    void refuse(const std::string &path, int code) {
        const std::lock_guard lock(m_mutex);
        m_codes[path] = code;
    }
    /// What making a task is answered with, in place of its record.
    void setTaskMade(nlohmann::json data) {
        const std::lock_guard lock(m_mutex);
        m_made = std::move(data);
    }
    /// From now on requests to the path are answered with this, ciphered.
    void setAnswer(const std::string &path, nlohmann::json data) {
        const std::lock_guard lock(m_mutex);
        m_answers[path] = std::move(data);
    }
    /// From now on requests to the path are read and never answered; an empty path ends it.
    void hold(const std::string &path) {
        const std::lock_guard lock(m_mutex);
        m_held = path;
    }
    /// From now on requests to the path get this answer, right or wrong.
    void reply(const std::string &path, ScriptedPeer::Reply reply) {
        const std::lock_guard lock(m_mutex);
        m_replies[path] = std::move(reply);
    }
    std::uint32_t port() const { return m_peer.port(); }
    /// The bodies that were sent to a path.
    std::vector<nlohmann::json> sentTo(const std::string &path) {
        std::vector<nlohmann::json> bodies;
        for (const std::string &body : rawSentTo(path))
            bodies.push_back(nlohmann::json::parse(body, nullptr, false));
        return bodies;
    }
    std::vector<std::string> rawSentTo(const std::string &path) {
        for (const ScriptedPeer::Request &request : m_peer.takeRequests())
            m_sent[request.path].push_back(request.body);
        return m_sent[path];
    }

private:
    ScriptedPeer::Reply answer(const ScriptedPeer::Request &request) {
        const std::lock_guard lock(m_mutex);
        if (request.path == m_held)
            return {{}, ScriptedPeer::End::Hold};
        if (const auto code = m_codes.find(request.path); code != m_codes.end() && code->second != 0)
            return ScriptedPeer::json({{"code", code->second}});
        if (const auto reply = m_replies.find(request.path); reply != m_replies.end())
            return reply->second;
        if (const auto given = m_answers.find(request.path); given != m_answers.end())
            return ScriptedPeer::sealed(given->second);
        if (request.path == "/v1/alarm/list")
            return ScriptedPeer::sealed(m_alarms);
        if (request.path == "/v1/dev/list" && !m_devices.is_null())
            return ScriptedPeer::sealed(m_devices);
        if (request.path == "/v1/task/init" && !hasAll(request.json()["devices"]))
            return ScriptedPeer::json({{"code", 4}});
        if (request.path == "/v1/task/init")
            return ScriptedPeer::sealed(m_made.is_null() ? makeTask(request.json()) : m_made);
        if (request.path == "/v1/site/list")
            return ScriptedPeer::sealed(nlohmann::json::array());
        if (request.path != "/v1/task/list")
            return ScriptedPeer::json({{"code", 0}, {"data", nullptr}});
        if (!m_tasks.is_array())
            return ScriptedPeer::sealed(m_tasks);
        const std::size_t start = request.json()["start"];
        const std::size_t count = request.json()["count"];
        nlohmann::json page = nlohmann::json::array();
        for (std::size_t i = start; i < std::min(start + count, m_tasks.size()); ++i)
            page.push_back(m_tasks[i]);
        return ScriptedPeer::sealed(page);
    }

    bool hasAll(const nlohmann::json &asked) const {
        const auto has = [this](const nlohmann::json &id) {
            return std::any_of(m_devices.begin(), m_devices.end(),
                               [&](const nlohmann::json &each) { return each["id"] == id; });
        };
        return m_devices.is_null() || std::all_of(asked.begin(), asked.end(), has);
    }

    /// The last character of the id, which is a hex digit, tells devices apart.
    static std::string macOf(const std::string &id) { return std::string("AA-00-00-00-00-D") + id.back(); }

    nlohmann::json makeTask(const nlohmann::json &asked) {
        nlohmann::json devices = nlohmann::json::array();
        for (const nlohmann::json &device : asked["devices"]) {
            const std::string id = device.is_object() ? device["id"] : device;
            devices.push_back({{"id", id}, {"d_mac", macOf(id)}, {"state", "pTaskFailed"}});
        }
        nlohmann::json task = {
            {"tid", "T" + std::to_string(m_tasks.size() + 1)}, {"type", asked["type"]}, {"devices", devices}};
        m_tasks.insert(m_tasks.begin(), task);
        return task;
    }

    std::mutex m_mutex;
    nlohmann::json m_tasks = nlohmann::json::array();
    nlohmann::json m_made;
    nlohmann::json m_devices;
    nlohmann::json m_alarms = {{"items", nlohmann::json::array()}, {"total_items", 0}};
    std::map<std::string, int> m_codes;
    std::map<std::string, ScriptedPeer::Reply> m_replies;
    std::map<std::string, nlohmann::json> m_answers;
    std::string m_held;
    std::map<std::string, std::vector<std::string>> m_sent;
    ScriptedPeer m_peer;
};
