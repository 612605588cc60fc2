#include "modelgroups.h"

#include <algorithm>

namespace ModelGroups {

namespace {

QStringList versionsOf(const std::vector<int> &members, const OperationTargets::List &targets) {
    QHash<QString, int> counts;
    for (const int each : members)
        ++counts[targets[static_cast<std::size_t>(each)].device->text(DeviceColumn::Firmware)];
    QStringList versions = counts.keys();
    std::sort(versions.begin(), versions.end(), [&](const QString &a, const QString &b) {
        return counts[a] != counts[b] ? counts[a] > counts[b] : a < b;
    });
    return versions;
}

} // namespace

std::vector<ModelGroup> of(const OperationTargets::List &targets) {
    std::vector<ModelGroup> groups;
    QHash<QString, std::size_t> places;
    for (std::size_t i = 0; i < targets.size(); ++i) {
        const QString &model = targets[i].device->text(DeviceColumn::Model);
        const std::size_t place = places.value(model, groups.size());
        if (place == groups.size()) {
            places.insert(model, place);
            groups.push_back({model, {}, {}});
        }
        groups[place].targets.push_back(static_cast<int>(i));
    }
    for (ModelGroup &group : groups)
        group.versions = versionsOf(group.targets, targets);
    std::stable_sort(groups.begin(), groups.end(), [](const ModelGroup &a, const ModelGroup &b) {
        return a.targets.size() > b.targets.size();
    });
    return groups;
}

std::vector<int> mixed(const std::vector<ModelGroup> &groups, const std::vector<int> &targets,
                       const std::vector<bool> &doubtful) {
    struct Turn {
        bool late;
        std::size_t round;
    };
    std::vector<Turn> turns(doubtful.size());
    for (const ModelGroup &group : groups) {
        std::size_t rounds[2] = {0, 0};
        for (const int each : group.targets) {
            const bool late = doubtful[static_cast<std::size_t>(each)];
            turns[static_cast<std::size_t>(each)] = {late, rounds[late ? 1 : 0]++};
        }
    }
    std::vector<int> order = targets;
    std::stable_sort(order.begin(), order.end(), [&](int a, int b) {
        const Turn &left = turns[static_cast<std::size_t>(a)];
        const Turn &right = turns[static_cast<std::size_t>(b)];
        return left.late != right.late ? right.late : left.round < right.round;
    });
    return order;
}

} // namespace ModelGroups
