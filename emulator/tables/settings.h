#pragma once

#include "http/jsonaccess.h"

namespace emulator {

class Store;

/// The service's settings.
class Settings {
public:
    explicit Settings(Store &store);

    std::string text() const { return jsonText(m_values); }
    int logDays() const { return m_values.at("log_keepdays").get<int>(); }

    /// How many devices may get firmware at a time; 0 for no limit.
    std::size_t firmwareLimit() const;

    /// Takes over the members that are settings and leaves the others alone. Throws Refusal(Malformed), and
    /// changes nothing, when one has a wrong type or is out of its range. Returns what is different now, as
    /// text for the log; empty when nothing is.
    std::string change(const Json &members);

private:
    Store &m_store;
    Json m_values;
};

} // namespace emulator
