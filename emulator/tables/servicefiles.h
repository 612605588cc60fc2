#pragma once

#include "platform.h"

#include <filesystem>

namespace emulator {

/// The files in which others look for the service, all readable by their owner only.
class ServiceFiles {
public:
    /// Makes the folder and claims it for this process. Throws std::runtime_error when that fails or another
    /// emulator has it.
    explicit ServiceFiles(std::filesystem::path folder);

    std::filesystem::path storePath() const { return m_folder / "nvldm-emulator.sdb"; }
    void discardStore() const;
    void discardIdentity() const { std::filesystem::remove(identityPath()); }
    /// The server's key and certificate; without the file the next run makes others.
    std::filesystem::path identityPath() const { return m_folder / "nvldm-emulator.pem"; }

    /// The port of the last run, or 0 where there was none.
    int lastPort() const;
    void writePort(int port) const;
    void writeRunning() const;
    void writeStopped() const;

private:
    void writeState(const char *state) const;

    std::filesystem::path m_folder;
    platform::FileClaim m_claim;
};

} // namespace emulator
