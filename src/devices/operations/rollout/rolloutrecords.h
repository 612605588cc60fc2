#pragma once

#include "devices/operations/rollout/rollout.h"

#include <vector>

/// Rollouts as they are kept from one run of the program to the next.
namespace RolloutRecords {

struct Record {
    RolloutPlanPtr plan;
    Rollout::Progress progress;
};

/// As JSON text. Any thread.
QString toText(const std::vector<Record> &records);

/// Those of a text; records that make no sense are left out. Any thread.
std::vector<Record> parse(const QString &text);

} // namespace RolloutRecords
