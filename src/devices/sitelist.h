#pragma once

#include "json.h"

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

    bool operator==(const Site &) const = default;
};

using List = std::vector<Site>;

/// Reads site records, ordered so that parents come first. A record without an id or with one seen before is
/// left out; a site whose parent is unknown, or that is its own ancestor, becomes a top-level one.
List parse(const JSON &records);

} // namespace Sites
