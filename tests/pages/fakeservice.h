#pragma once

#include "platform/crypto/ciphers.h"
#include "store/localstore.h"
#include "support/scriptedpeer.h"

#include <mutex>

/// A service that has a log and settings, as odd as a test wants them, and is logged in to.
class FakeService {
public:
    FakeService() {
        m_peer.follow([this](const ScriptedPeer::Request &request) { return answer(request); });
        logIn();
    }
    ~FakeService() { CLocalStore::instance().clearLoginInfo(); }

    /// Begins a session, in place of an earlier one.
    void logIn() {
        const std::string cipher = Ciphers::sealSecret("session-token_0123456789").value_or("");
        CLocalStore::instance().setLoginInfo("127.0.0.1", m_peer.port(), "admin",
                                             QByteArray::fromStdString(cipher));
    }

    void setLog(std::vector<nlohmann::json> items) {
        const std::lock_guard lock(m_mutex);
        m_items = std::move(items);
    }
    void setSettings(nlohmann::json settings) {
        const std::lock_guard lock(m_mutex);
        m_settings = std::move(settings);
    }
    nlohmann::json settings() {
        const std::lock_guard lock(m_mutex);
        return m_settings;
    }
    /// From now on the requests to the path answer with this code; 0 takes that back.
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
        if (const int code = m_codes[request.path]; code != 0)
            return ScriptedPeer::json({{"code", code}});
        if (request.path == "/v1/logs/list")
            return ScriptedPeer::sealed({{"items", m_items}});
        if (request.path == "/v1/config/get")
            return ScriptedPeer::sealed(m_settings);
        nlohmann::json changed = request.json();
        changed.erase("id");
        m_settings.update(changed);
        return ScriptedPeer::json({{"code", 0}});
    }

    std::mutex m_mutex;
    nlohmann::json m_items = nlohmann::json::array();
    nlohmann::json m_settings = nlohmann::json::object();
    std::map<std::string, int> m_codes;
    std::map<std::string, std::vector<nlohmann::json>> m_sent;
    ScriptedPeer m_peer;
};
