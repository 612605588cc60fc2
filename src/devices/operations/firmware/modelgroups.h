#pragma once

#include "devices/operations/operationtargets.h"

#include <QStringList>

/// The targets of one model.
struct ModelGroup {
    QString model;
    QStringList versions;     ///< of their firmware, the most frequent one first
    std::vector<int> targets; ///< places in the list of targets
};

/// Targets by their models.
namespace ModelGroups {

/// The models and versions of targets, as places in the lists of those there are.
struct Index {
    QStringList models;
    QStringList versions;
    std::vector<int> modelOf;   ///< by target
    std::vector<int> versionOf; ///< by target
};

/// Reads the texts of all targets: for a runner's thread where there are many.
Index indexOf(const OperationTargets::List &targets);

/// The groups of some of the targets, the largest one first; its targets are places in the given list.
std::vector<ModelGroup> of(const Index &index, const std::vector<int> &targets);

/// The given targets in an order that takes one of each model in turn, those with something against them at
/// the end: whoever tries the first few has tried every model. doubtful: whether a target may fail.
std::vector<int> mixed(const std::vector<ModelGroup> &groups, const std::vector<int> &targets,
                       const std::vector<bool> &doubtful);

} // namespace ModelGroups
