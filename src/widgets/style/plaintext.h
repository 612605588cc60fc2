#pragma once

#include <QString>

/// Text from outside for places that guess whether a text is markup.
namespace PlainText {

/// The text as a tool tip that shows it as it stands, however it begins; cut where it would fill the screen.
QString toolTip(const QString &text);

} // namespace PlainText
