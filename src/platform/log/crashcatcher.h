#pragma once

#include <string>
#include <string_view>

/// The part of crash reports that differs by system. What is called while the process dies neither allocates
/// nor locks.
namespace CrashCatcher {

/// Where the text goes, and what is at hand when it is written.
struct Plan {
    std::string path;                         ///< UTF-8; the folder is there
    std::string heading;                      ///< first line of the text
    void (*tell)(void (*)(std::string_view)); ///< hands the remembered log lines over, piece by piece
};

/// To be called once.
void install(const Plan &plan);

/// The room in which a thread that has used up its stack can still be reported. To be held by the thread's
/// outermost function.
class ThreadGuard {
public:
    ThreadGuard();
    ~ThreadGuard();
    ThreadGuard(const ThreadGuard &) = delete;
    ThreadGuard &operator=(const ThreadGuard &) = delete;

private:
    void *m_stack = nullptr;
};

} // namespace CrashCatcher
