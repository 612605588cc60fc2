#pragma once

#include "devices/operations/assignip/addresspattern.h"
#include "devices/operations/operationtargets.h"

/// Addresses for devices: hands them out and looks for what is wrong with them. No widgets.
class IpAssignment {
public:
    /// targets: the devices that may get addresses. managed: all devices of the service.
    IpAssignment(const OperationTargets::List &targets, const DeviceSnapshot &managed);

    /// What all devices share.
    struct Network {
        QStringList patterns; ///< each an address or a pattern
        quint32 mask = 0;
        quint32 gateway = 0;
    };

    /// Gives each of the items the next free address, in their order, where it has none typed by hand. False
    /// when there are too few.
    bool handOut(const Network &network, const std::vector<int> &items);

    /// How many of the items have no address typed by hand, so that they need one of the patterns'.
    int waitingCount(const std::vector<int> &items) const;

    /// All devices of the service as they are now.
    void setManaged(const DeviceSnapshot &managed);

    /// An item's new address, 0 for none.
    quint32 address(int item) const { return m_addresses[static_cast<std::size_t>(item)]; }
    /// Types an address for an item by hand, which handing out leaves alone; 0 takes it back.
    void setTyped(int item, quint32 address);
    void clear();

    /// What is wrong with the addresses of the items. Conflicts forbid the assignment; a gateway that cannot
    /// be reached is the user's decision.
    std::vector<TargetWarning> conflicts(const Network &network, const std::vector<int> &items) const;
    std::vector<TargetWarning> doubts(const Network &network, const std::vector<int> &items) const;

private:
    /// The addresses of all devices but those items.
    QSet<quint32> takenByOthers(const std::vector<int> &items) const;

    QStringList m_ids;                ///< of the targets
    std::vector<quint32> m_current;   ///< of the targets
    std::vector<quint32> m_addresses; ///< new ones
    std::vector<quint32> m_typed;     ///< those given by hand, 0 for the others
    QHash<quint32, int> m_managed;    ///< how many devices have an address
};
