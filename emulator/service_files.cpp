#include "service_files.h"

#include "database.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

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

void writeAll(const std::filesystem::path &path, const std::string &text) {
    const int file = ::open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0600);
    const bool written =
        file >= 0 && ::write(file, text.data(), text.size()) == static_cast<ssize_t>(text.size());
    const bool closed = file >= 0 && ::close(file) == 0;
    if (!written || !closed) {
        throw std::runtime_error("cannot write " + path.string());
    }
}

} // namespace

ServiceFiles::ServiceFiles(std::filesystem::path folder) : m_folder(std::move(folder)) {
    std::filesystem::create_directories(m_folder.parent_path().empty() ? "." : m_folder.parent_path());
    if (::mkdir(m_folder.c_str(), 0700) != 0 && !std::filesystem::is_directory(m_folder)) {
        throw std::runtime_error("cannot make the folder " + m_folder.string());
    }
    m_lock = ::open((m_folder / "nvldm-emulator.lock").c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0600);
    if (m_lock < 0 || ::flock(m_lock, LOCK_EX | LOCK_NB) != 0) {
        if (m_lock >= 0) {
            ::close(m_lock);
        }
        throw std::runtime_error("the folder " + m_folder.string() + " cannot be used or is in use");
    }
}

ServiceFiles::~ServiceFiles() {
    ::close(m_lock);
}

void ServiceFiles::discardStore() const {
    for (const char *suffix : {"", "-wal", "-shm"}) {
        std::filesystem::remove(storePath().string() + suffix);
    }
}

int ServiceFiles::lastPort() const {
    const auto path = m_folder / "nvldmsvc.sdb";
    if (!std::filesystem::exists(path)) {
        return 0;
    }
    const Database database(path);
    // A run that was killed at its start has left a file without the table.
    Statement table(database, "SELECT 1 FROM sqlite_master WHERE name = 'svcMainT'");
    if (!table.step()) {
        return 0;
    }
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
    writeAll(fresh, std::string(beforeState) + state + afterState);
    std::filesystem::rename(fresh, path);
}

} // namespace emulator
