#include "processsetup.h"

#include <csignal>

namespace ProcessSetup {

void ignoreBrokenPipes() {
#ifdef SIGPIPE
    std::signal(SIGPIPE, SIG_IGN);
#endif
}

} // namespace ProcessSetup
