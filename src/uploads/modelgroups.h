#pragma once

#include "operationtargets.h"

#include <QStringList>

/// The targets of one model.
struct ModelGroup {
    QString model;
    QStringList versions;     ///< of their firmware, the most frequent one first
    std::vector<int> targets; ///< places in the list of targets
};

/// Targets by their models.
namespace ModelGroups {

/// The largest group first.
std::vector<ModelGroup> of(const OperationTargets::List &targets);

/// The given targets in an order that takes one of each model in turn, those with something against them at
/// the end: whoever tries the first few has tried every model. doubtful: whether a target may fail.
std::vector<int> mixed(const std::vector<ModelGroup> &groups, const std::vector<int> &targets,
                       const std::vector<bool> &doubtful);

} // namespace ModelGroups
