#pragma once

#include <string_view>
#include <vector>

/// The texts of a JSON array's elements, in their order: views into the array's text. They are told apart
/// without being parsed, so each may still be no JSON. Throws std::invalid_argument where the text is no array
/// or does not end as one.
std::vector<std::string_view> elementTexts(std::string_view array);
