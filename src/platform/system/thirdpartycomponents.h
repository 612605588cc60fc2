#pragma once

#include <span>

/// A work of others that is shipped with the program or is inside it.
struct ThirdPartyComponent {
    const char *name;
    const char *version; ///< empty where it is not known
    const char *licence;
};

/// What this system's package brings along that others take from the system.
std::span<const ThirdPartyComponent> systemParts();
