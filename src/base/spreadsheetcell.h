#pragma once

#include <string>
#include <string_view>

/// Cells of the comma-separated files that are written for spreadsheets.
namespace SpreadsheetCell {

/// The text with an apostrophe in front where a spreadsheet would otherwise take it for a formula and run it:
/// host names and descriptions come from devices, of which anybody may say anything.
std::string harmless(std::string_view text);

/// The text that harmless() was given.
std::string_view original(std::string_view cell);

} // namespace SpreadsheetCell
