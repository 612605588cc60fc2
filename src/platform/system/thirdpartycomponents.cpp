#include "platform/system/thirdpartycomponents.h"

#include <QtGlobal>

std::span<const ThirdPartyComponent> systemParts() {
#ifdef Q_OS_WIN
    static constexpr ThirdPartyComponent parts[] = {
#ifdef __MINGW32__
        {"libstdc++ and libgcc", "", "GPL 3 with GCC Runtime Library Exception"},
        {"winpthreads", "", "MIT and BSD 3-Clause"},
#endif
        {"zlib", "", "zlib"},
        {"PCRE2", "", "BSD 3-Clause"},
        {"libpng", "", "PNG Reference Library License 2"},
        {"libjpeg-turbo", "", "IJG and BSD 3-Clause"},
        {"FreeType", "", "FreeType License"},
        {"HarfBuzz", "", "MIT"},
        {"double-conversion", "", "BSD 3-Clause"},
    };
    return parts;
#else
    return {};
#endif
}
