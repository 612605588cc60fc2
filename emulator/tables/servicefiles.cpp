#include "tables/servicefiles.h"

#include "tables/database.h"

#include <stdexcept>
#include <string>
#include <utility>

namespace emulator {

namespace {

constexpr auto beforeState = "\nSERVICE_NAME: nvldm \n"
                             "        TYPE               : 10  WIN32_OWN_PROCESS  \n"
                             "        STATE              : ";
constexpr auto afterState = " \n"
                            "        WIN32_EXIT_CODE    : 0  (0x0)\n"
                            "        SERVICE_EXIT_CODE  : 0  (0x0)\n"
                            "        CHECKPOINT         : 0x0\n"
                            "        WAIT_HINT          : 0x0\n";

std::filesystem::path madeFolder(std::filesystem::path folder) {
    std::filesystem::create_directories(folder.parent_path().empty() ? "." : folder.parent_path());
    platform::makePrivateFolder(folder);
    return folder;
}

} // namespace

ServiceFiles::ServiceFiles(std::filesystem::path folder)
    : m_folder(madeFolder(std::move(folder))), m_claim(m_folder / "nvldm-emulator.lock") {}

void ServiceFiles::discardStore() const {
    for (const char *suffix : {"", "-wal", "-shm"})
        std::filesystem::remove(storePath() += suffix);
}

int ServiceFiles::lastPort() const {
    const auto path = m_folder / "nvldmsvc.sdb";
    if (!std::filesystem::exists(path))
        return 0;
    const Database database(path);
    // A run that was killed at its start has left a file without the table.
    Statement table(database, "SELECT 1 FROM sqlite_master WHERE name = 'svcMainT'");
    if (!table.step())
        return 0;
    Statement query(database, "SELECT json_extract(value, '$.port') FROM svcMainT "
                              "WHERE key = 'kSvcAndTrayServerPort' AND json_valid(value)");
    return query.step() ? static_cast<int>(query.integer(0)) : 0;
}

void ServiceFiles::writePort(int port) const {
    Database database(m_folder / "nvldmsvc.sdb");
    // Readers open this file read-only, which a write-ahead log does not allow.
    database.run("PRAGMA journal_mode=DELETE");
    database.run("CREATE TABLE IF NOT EXISTS svcMainT(key TEXT PRIMARY KEY, value TEXT)");
    const std::string value = R"({"port": )" + std::to_string(port) + '}';
    Statement write(database, "INSERT OR REPLACE INTO svcMainT VALUES('kSvcAndTrayServerPort',?)");
    write.bind(value).run();
}

void ServiceFiles::writeRunning() const {
    writeState("4  RUNNING");
}

void ServiceFiles::writeStopped() const {
    writeState("1  STOPPED");
}

void ServiceFiles::writeState(const char *state) const {
    const auto path = m_folder / "nvldm.state";
    const auto fresh = m_folder / "nvldm.state.new";
    platform::writePrivateFile(fresh, std::string(beforeState) + state + afterState);
    std::filesystem::rename(fresh, path);
}

} // namespace emulator
