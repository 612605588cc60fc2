#pragma once

#include <QString>

#include <vector>

/// MAC addresses in the names of files.
namespace MacNames {

/// The addresses that a text may hold, whatever separates their digits: every twelve hex digits in a row,
/// with at most one other character between two of them. Several for a longer row of digits.
std::vector<quint64> in(const QString &text);

} // namespace MacNames
