#pragma once

#include <chrono>
#include <filesystem>
#include <optional>
#include <string>

/// What the emulator needs of the operating system; nothing else in it asks which one that is.
namespace emulator::platform {

/// To be called before there is a second thread: makes new files the user's own and keeps stop signals for
/// waitForStop.
void prepare();

/// Returns when a stop signal arrives or requestStop is called.
void waitForStop();
void requestStop();

/// What has come on standard input: an empty text when nothing did in the time, nothing at its end.
std::optional<std::string> readInput(std::chrono::milliseconds time);

/// A folder and files that belong to the user alone. They throw std::runtime_error.
void makePrivateFolder(const std::filesystem::path &folder);
void makePrivateFile(const std::filesystem::path &path);
void writePrivateFile(const std::filesystem::path &path, const std::string &text);

/// A file that one process at a time holds; it throws std::runtime_error when another one does.
class FileClaim {
public:
    explicit FileClaim(const std::filesystem::path &path);
    ~FileClaim();
    FileClaim(const FileClaim &) = delete;
    FileClaim &operator=(const FileClaim &) = delete;

private:
    std::intptr_t m_file = -1;
};

/// Ends a connection at once without closing its descriptor, which the library owns and closes later.
void cutConnection(int descriptor);
bool callerHasLeft(int descriptor);
/// Lets a port be taken again whose last connections are still dying, and no other.
void reclaimPort(std::intptr_t descriptor);

} // namespace emulator::platform
