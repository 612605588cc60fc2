#pragma once

#include <QHash>
#include <QString>

#include <vector>

/// How the rows of a list become those of its next state: which go, and which come. Rows that stay keep their
/// order among each other; one that changes it goes and comes anew.
struct RowDiff {
    struct Range {
        int first;
        int last;
    };
    std::vector<Range>
        removed; ///< in the old list, the last range first, so that they can be taken out in turn
    std::vector<Range> inserted; ///< in the new list, the first range first

    /// Keys must differ within each list.
    static RowDiff between(const std::vector<QString> &before, const std::vector<QString> &after);
};
