#pragma once

#include <QString>

class QWidget;

/// The user guide: HTML pages that stand beside the program and are shown by the system's browser.
namespace UserGuide {

/// The page about the part of the window that holds the widget, or an empty text for none of its own.
QString pageFor(const QWidget *widget);

/// Shows a page, or the first one for an empty name. False when there is no guide.
bool open(const QString &page);

} // namespace UserGuide
