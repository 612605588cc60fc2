#pragma once

class QDateTimeEdit;

/// Lets a click into a date or time field select the part under the pointer, as the keyboard does. Without it
/// the field takes no digit after a click, because it is full already.
namespace SectionClick {

void install(QDateTimeEdit *field);

} // namespace SectionClick
