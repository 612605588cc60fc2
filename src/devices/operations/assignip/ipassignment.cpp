#include "devices/operations/assignip/ipassignment.h"

#include <QCoreApplication>

namespace {

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(IpAssignment)
};

quint32 addressOf(const DeviceRecord &device) {
    return AddressPattern::numberOf(device.text(DeviceColumn::Ip));
}

/// The warning for those of the items that the test holds of.
template <typename Test>
void warn(std::vector<TargetWarning> &warnings, const std::vector<int> &items, Test test,
          std::function<QString(int)> summary, const QString &note) {
    TargetWarning warning{std::move(summary), note, {}};
    std::copy_if(items.begin(), items.end(), std::back_inserter(warning.targets), test);
    if (!warning.targets.empty())
        warnings.push_back(std::move(warning));
}

} // namespace

IpAssignment::IpAssignment(const OperationTargets::List &targets, const DeviceSnapshot &managed)
    : m_addresses(targets.size()), m_typed(targets.size()) {
    for (const OperationTarget &target : targets)
        m_ids += target.device->id;
    setManaged(managed);
}

void IpAssignment::setManaged(const DeviceSnapshot &managed) {
    m_managed.clear();
    for (int i = 0; i < managed.size(); ++i) {
        if (const quint32 address = addressOf(*managed.at(i)))
            ++m_managed[address];
    }
    m_current.clear();
    for (const QString &id : m_ids) {
        const int index = managed.indexOf(id);
        m_current.push_back(index < 0 ? 0 : addressOf(*managed.at(index)));
    }
}

int IpAssignment::waitingCount(const std::vector<int> &items) const {
    return static_cast<int>(std::count_if(items.begin(), items.end(), [this](int item) {
        return m_typed[static_cast<std::size_t>(item)] == 0;
    }));
}

QSet<quint32> IpAssignment::takenByOthers(const std::vector<int> &items) const {
    QHash<quint32, int> others = m_managed;
    for (const int item : items) {
        if (const auto found = others.find(m_current[static_cast<std::size_t>(item)]); found != others.end())
            --*found;
    }
    QSet<quint32> taken;
    for (auto each = others.cbegin(); each != others.cend(); ++each) {
        if (*each > 0)
            taken.insert(each.key());
    }
    return taken;
}

bool IpAssignment::handOut(const Network &network, const std::vector<int> &items) {
    AddressPattern::Limits limits{network.mask, network.gateway, takenByOthers(items)};
    std::vector<int> waiting;
    std::fill(m_addresses.begin(), m_addresses.end(), 0);
    for (const int item : items) {
        if (m_typed[static_cast<std::size_t>(item)] != 0)
            limits.taken.insert(m_typed[static_cast<std::size_t>(item)]);
        else
            waiting.push_back(item);
    }
    const std::vector<quint32> addresses = AddressPattern::lowest(network.patterns, waiting.size(), limits);
    for (std::size_t i = 0; i < addresses.size(); ++i)
        m_addresses[static_cast<std::size_t>(waiting[i])] = addresses[i];
    for (std::size_t i = 0; i < m_typed.size(); ++i) {
        if (m_typed[i] != 0)
            m_addresses[i] = m_typed[i];
    }
    return addresses.size() == waiting.size();
}

void IpAssignment::setTyped(int item, quint32 address) {
    m_typed[static_cast<std::size_t>(item)] = address;
    m_addresses[static_cast<std::size_t>(item)] = address;
}

void IpAssignment::clear() {
    std::fill(m_addresses.begin(), m_addresses.end(), 0);
}

std::vector<TargetWarning> IpAssignment::conflicts(const Network &network,
                                                   const std::vector<int> &items) const {
    QHash<quint32, int> uses;
    for (const int item : items)
        ++uses[address(item)];
    const QSet<quint32> taken = takenByOthers(items);
    std::vector<TargetWarning> found;
    warn(
        found, items, [&](int item) { return address(item) != 0 && uses.value(address(item)) > 1; },
        [](int count) { return Texts::tr("Addresses given twice: %n device(s).", nullptr, count); },
        Texts::tr("Address given twice"));
    warn(
        found, items, [&](int item) { return taken.contains(address(item)); },
        [](int count) { return Texts::tr("Addresses of other devices: %n.", nullptr, count); },
        Texts::tr("Address in use"));
    warn(
        found, items,
        [&](int item) {
            return address(item) != 0 &&
                   !AddressPattern::isUsable(address(item), {network.mask, network.gateway, {}});
        },
        [](int count) {
            return Texts::tr("Network, broadcast, gateway or reserved addresses: %n.", nullptr, count);
        },
        Texts::tr("No device address"));
    return found;
}

std::vector<TargetWarning> IpAssignment::doubts(const Network &network, const std::vector<int> &items) const {
    std::vector<TargetWarning> found;
    warn(
        found, items,
        [&](int item) {
            return address(item) != 0 && network.gateway != 0 &&
                   (address(item) & network.mask) != (network.gateway & network.mask);
        },
        [](int count) {
            return Texts::tr("%n device(s) would not reach the gateway: it is in another subnet.", nullptr,
                             count);
        },
        Texts::tr("Gateway in another subnet"));
    return found;
}
