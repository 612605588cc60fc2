#include "widgets/lists/rowdiff.h"

#include <algorithm>

namespace {

/// Adds a row to the ranges, to the last one where it follows it.
void append(std::vector<RowDiff::Range> &ranges, int row) {
    if (!ranges.empty() && ranges.back().last + 1 == row)
        ranges.back().last = row;
    else
        ranges.push_back({row, row});
}

/// Marks the longest run of rows whose places rise, which are the rows that can stay; -1 is no place.
std::vector<bool> maxRise(const std::vector<int> &places) {
    std::vector<std::size_t> ends; // of the best run of each length, the row where it ends
    std::vector<std::size_t> before(places.size());
    for (std::size_t row = 0; row < places.size(); ++row) {
        if (places[row] < 0)
            continue;
        const auto end = std::lower_bound(ends.begin(), ends.end(), places[row],
                                          [&](std::size_t a, int place) { return places[a] < place; });
        before[row] = end == ends.begin() ? row : *(end - 1);
        if (end == ends.end())
            ends.push_back(row);
        else
            *end = row;
    }
    std::vector<bool> rises(places.size(), false);
    for (std::size_t left = ends.size(), row = ends.empty() ? 0 : ends.back(); left > 0; --left) {
        rises[row] = true;
        row = before[row];
    }
    return rises;
}

} // namespace

RowDiff RowDiff::between(const std::vector<QString> &before, const std::vector<QString> &after) {
    QHash<QString, int> oldRows;
    oldRows.reserve(static_cast<qsizetype>(before.size()));
    for (std::size_t row = 0; row < before.size(); ++row)
        oldRows.insert(before[row], static_cast<int>(row));

    std::vector<int> places(after.size());
    for (std::size_t row = 0; row < after.size(); ++row)
        places[row] = oldRows.value(after[row], -1);
    const std::vector<bool> stays = maxRise(places);

    RowDiff diff;
    std::vector<bool> kept(before.size(), false);
    for (std::size_t row = 0; row < after.size(); ++row) {
        if (stays[row])
            kept[static_cast<std::size_t>(places[row])] = true;
        else
            append(diff.inserted, static_cast<int>(row));
    }
    for (std::size_t row = 0; row < before.size(); ++row) {
        if (!kept[row])
            append(diff.removed, static_cast<int>(row));
    }
    std::reverse(diff.removed.begin(), diff.removed.end());
    return diff;
}
