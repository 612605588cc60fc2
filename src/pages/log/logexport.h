#pragma once

#include "pages/log/loglist.h"

#include <functional>

/// Writes log entries as a file that a spreadsheet can open.
namespace LogExport {

/// Writes the entries at the places, in that order, to a file that appears whole or not at all. A field with
/// a comma or quotation mark is quoted; line breaks become spaces. opened: called on this thread when the
/// file is open. False when the file could not be written; why is logged. Any thread.
bool write(const QString &path, const LogList &list, const std::vector<int> &places,
           const std::function<void()> &opened = {});

} // namespace LogExport
