#pragma once

#include "rollout.h"

/// Rollouts in words.
namespace RolloutTexts {

/// Where it stands, as whole sentences. now: Unix ms.
QString standing(const Rollout &rollout, qint64 now);

} // namespace RolloutTexts
