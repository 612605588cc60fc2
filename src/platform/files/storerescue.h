#pragma once

#include <string>

namespace SQLite {
class Database;
}

/// What can still be read of a damaged store file.
namespace StoreRescue {

/// Creates the damaged file's tables in the target and copies every row that is readable. The damaged file is
/// left as it is. Returns the number of rows; never throws for damage, only for a target that cannot be
/// written.
int copyReadableRows(const std::string &damaged, SQLite::Database &target);

} // namespace StoreRescue
