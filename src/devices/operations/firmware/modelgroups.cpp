#include "devices/operations/firmware/modelgroups.h"

#include <algorithm>

namespace ModelGroups {

namespace {

/// Gives every text the place at which it was met first.
class Places {
public:
    explicit Places(QStringList &texts) : m_texts(texts) {}

    int of(const QString &text) {
        const auto found = m_places.constFind(text);
        if (found != m_places.constEnd())
            return *found;
        m_texts += text;
        return *m_places.insert(text, static_cast<int>(m_texts.size()) - 1);
    }

private:
    QStringList &m_texts;
    QHash<QString, int> m_places;
};

/// The most frequent one first.
QStringList versionsOf(const Index &index, const std::vector<int> &targets, const ModelGroup &group) {
    std::vector<int> all;
    for (const int member : group.targets)
        all.push_back(index.versionOf[static_cast<std::size_t>(targets[static_cast<std::size_t>(member)])]);
    std::sort(all.begin(), all.end());
    std::vector<std::pair<std::ptrdiff_t, const QString *>> counts;
    for (auto each = all.begin(); each != all.end();) {
        const auto next = std::upper_bound(each, all.end(), *each);
        counts.emplace_back(next - each, &index.versions[*each]);
        each = next;
    }
    std::sort(counts.begin(), counts.end(), [](const auto &a, const auto &b) {
        return a.first != b.first ? a.first > b.first : *a.second < *b.second;
    });
    QStringList versions;
    for (const auto &[count, version] : counts)
        versions += *version;
    return versions;
}

} // namespace

Index indexOf(const OperationTargets::List &targets) {
    Index index;
    Places models(index.models);
    Places versions(index.versions);
    for (const OperationTarget &target : targets) {
        index.modelOf.push_back(models.of(target.device->text(DeviceColumn::Model)));
        index.versionOf.push_back(versions.of(target.device->text(DeviceColumn::Firmware)));
    }
    return index;
}

std::vector<ModelGroup> of(const Index &index, const std::vector<int> &targets) {
    std::vector<ModelGroup> groups(static_cast<std::size_t>(index.models.size()));
    for (std::size_t i = 0; i < targets.size(); ++i) {
        const int model = index.modelOf[static_cast<std::size_t>(targets[i])];
        groups[static_cast<std::size_t>(model)].targets.push_back(static_cast<int>(i));
    }
    for (std::size_t i = 0; i < groups.size(); ++i) {
        groups[i].model = index.models[static_cast<int>(i)];
        groups[i].versions = versionsOf(index, targets, groups[i]);
    }
    std::erase_if(groups, [](const ModelGroup &group) { return group.targets.empty(); });
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
