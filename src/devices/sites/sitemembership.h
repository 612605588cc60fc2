#pragma once

#include "platform/json.h"

#include <QByteArray>
#include <QStringList>

#include <optional>
#include <string>
#include <vector>

/// Which sites devices belong to: what a drag of devices carries, and what its drop changes. No widgets, any
/// thread.
namespace SiteMembership {

/// What a device table drags.
inline const QString mimeType = QStringLiteral("application/x-nvldm-devices");

/// The site ids of a device's record, an array or a text that holds one, as an array of texts.
JSON siteIdsOf(const JSON &record);

struct DraggedDevices {
    QString sourceSiteId; ///< the site that the table shows; the overview's id where it shows all
    QStringList deviceIds;
};

QByteArray encode(const DraggedDevices &devices);
/// Nothing for data that no device table made, or without any device.
std::optional<DraggedDevices> decode(const QByteArray &data);

enum class Outcome {
    Added,
    Moved,
    Removed,
    Unchanged ///< in the target already, or not in the site that it was to leave
};

struct DeviceOutcome {
    QString deviceId;
    Outcome outcome;

    bool operator==(const DeviceOutcome &) const = default;
};

struct Drop {
    QString targetSiteId;
    QString sourceSiteId;
    bool isMove = false; ///< leave the source site; nothing ever leaves the overview
};

/// Puts devices into a site. The records are an array of the service's own; those that have to be committed
/// come back in the other array, with all their other members as they were. One outcome a record, in their
/// order.
std::vector<DeviceOutcome> assign(const JSON &records, const Drop &drop, JSON &changed);

/// Takes devices out of a site; they stay in the overview. The overview itself is not left this way: the
/// service would forget the devices.
std::vector<DeviceOutcome> removeFromSite(const JSON &records, const QString &siteId, JSON &changed);

} // namespace SiteMembership
