#pragma once

#include "platform/json.h"

#include <QByteArray>
#include <QString>

#include <vector>

/// The sites of the service, as the tree shows them.
namespace Sites {

inline const QString overviewId = QStringLiteral("DO000000000000");
inline const QString rootId = QStringLiteral("SR000000000000");

/// One site; its parent stands in front of it in a list.
struct Site {
    QString id;
    QString parentId; ///< rootId for a top-level site
    QString name;
    /// The service's record as JSON text, with the members that this client does not know; empty for a site
    /// that the service has not seen.
    QByteArray json = {};

    bool operator==(const Site &) const = default;
};

using List = std::vector<Site>;

/// Reads site records, ordered so that parents come first. A record without an id or with one seen before is
/// left out; a site whose parent is unknown, that is its own ancestor, or that lies below the 64th level
/// becomes a top-level one.
List parse(const JSON &records);

/// Orders and heals sites in the same way. Brothers keep their order; ids must be unique.
List arranged(List sites);

} // namespace Sites
