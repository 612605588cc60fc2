#pragma once

#include "tables/database.h"
#include "tables/records.h"

#include <filesystem>
#include <functional>

namespace emulator {

/// What survives a restart and a crash of the program. Not thread-safe; it is used under the model's lock.
/// Everything throws DatabaseError.
class Store {
public:
    explicit Store(const std::filesystem::path &path);

    Database &database() { return m_database; }

    /// Small things by name; empty where there is none.
    std::string value(const std::string &key);
    void setValue(const std::string &key, const std::string &value);

    /// The highest row that a table had ever, of those that never use one again.
    std::int64_t lastRow(const std::string &table);

    std::vector<Account> accounts();
    void saveAccount(const Account &account);
    void removeAccount(const std::string &email);

    std::vector<SessionToken> tokens();
    void saveToken(const SessionToken &token);
    void removeToken(const std::string &fingerprint);
    void removeAllTokens();

    std::vector<Site> sites();
    void replaceSites(const std::vector<Site> &sites);

    void loadDevices(const std::function<void(Device)> &take);
    void saveDevice(const Device &device);
    void saveDeviceSites(const Device &device);
    void saveDeviceState(const Device &device);
    void saveDeviceSecret(const Device &device);
    void removeDevice(const std::string &id);

private:
    Database m_database;
    struct Schema {
        explicit Schema(Database &database);
    } m_schema;
    Statement m_value;
    Statement m_setValue;
    Statement m_saveAccount;
    Statement m_removeAccount;
    Statement m_saveToken;
    Statement m_removeToken;
    Statement m_saveSite;
    Statement m_saveDevice;
    Statement m_saveDeviceSites;
    Statement m_saveDeviceState;
    Statement m_saveDeviceSecret;
    Statement m_removeDeviceSecret;
    Statement m_removeDevice;
};

} // namespace emulator
