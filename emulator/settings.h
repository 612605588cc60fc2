#pragma once

#include "json_access.h"

namespace emulator {

class Store;

/// The service's settings.
class Settings {
public:
    explicit Settings(Store &store);

    std::string text() const { return jsonText(m_values); }

    /// How many devices may get firmware at a time; 0 for no limit.
    std::size_t firmwareLimit() const;

    /// Takes over the members that are settings and leaves the others alone. Throws Refusal(Malformed), and
    /// changes nothing, when one has a wrong type.
    void change(const Json &members);

private:
    Store &m_store;
    Json m_values;
};

} // namespace emulator
