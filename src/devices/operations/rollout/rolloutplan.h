#pragma once

#include "devices/operations/files/filecheck.h"

#include <QStringList>

#include <memory>

/// What a rollout is to do. Never changed once it has begun, so threads share it freely.
struct RolloutPlan {
    FileCheck image;
    QString fwid;
    QString actionTime;       ///< of the first wave: Unix ms as text, empty for now
    QStringList deviceIds;    ///< those of the first wave in front
    int firstCount = 1;       ///< how many these are
    int waitMinutes = 0;      ///< between the waves
    int maxFailedPercent = 0; ///< of the first wave, for the second one to begin by itself

    QStringList firstWave() const { return deviceIds.mid(0, firstCount); }
    QStringList rest() const { return deviceIds.mid(firstCount); }
};

using RolloutPlanPtr = std::shared_ptr<const RolloutPlan>;
