#pragma once

#include <QString>

/// A text as desktops get it: one line without control characters, cut off where none would show more.
QString toastLine(const QString &text);

/// The part of an application name behind its maker.
QString shortApplicationName(const QString &applicationName);
