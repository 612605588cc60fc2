#pragma once

#include "devices/operations/rollout/rollout.h"

/// Rollouts in words.
namespace RolloutTexts {

/// Where it stands, as whole sentences.
QString standing(const Rollout &rollout);

} // namespace RolloutTexts
