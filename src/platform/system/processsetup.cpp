#include "platform/system/processsetup.h"

#include <csignal>
#include <cstdlib>
#include <initializer_list>

#ifdef __unix__
#include <sys/resource.h>
#endif
#ifdef __linux__
#include <sys/prctl.h>
#endif
#ifdef _WIN32
#include <windows.h>

#include <cstdio>
#endif

namespace ProcessSetup {

void dropRelativeFolders() {
#ifdef __unix__
    for (const char *name : {"XDG_DATA_HOME", "XDG_CONFIG_HOME", "XDG_CACHE_HOME"}) {
        const char *folder = std::getenv(name);
        if (folder && *folder != '/')
            ::unsetenv(name);
    }
#endif
}

void ignoreBrokenPipes() {
#ifdef SIGPIPE
    std::signal(SIGPIPE, SIG_IGN);
#endif
}

void keepMemoryPrivate() {
#ifdef __unix__
    const rlimit none{0, 0};
    ::setrlimit(RLIMIT_CORE, &none);
#endif
#if defined(__linux__) && defined(NDEBUG)
    // A limit does not hold where the system pipes images to a collector; debuggers need the other build.
    ::prctl(PR_SET_DUMPABLE, 0, 0, 0, 0);
#endif
}

int leave(int status) {
#ifdef _WIN32
    std::fflush(nullptr);
    ::TerminateProcess(::GetCurrentProcess(), static_cast<UINT>(status));
#endif
    return status;
}

} // namespace ProcessSetup
