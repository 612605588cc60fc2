#include "base/spreadsheetcell.h"

namespace SpreadsheetCell {

namespace {

constexpr char mark = '\'';

bool isFormula(std::string_view text) {
    constexpr std::string_view starts = "=+-@\t\r";
    return !text.empty() && starts.find(text.front()) != std::string_view::npos;
}

} // namespace

std::string harmless(std::string_view text) {
    return isFormula(text) ? mark + std::string(text) : std::string(text);
}

std::string_view original(std::string_view cell) {
    const bool isMarked = !cell.empty() && cell.front() == mark && isFormula(cell.substr(1));
    return isMarked ? cell.substr(1) : cell;
}

} // namespace SpreadsheetCell
