#pragma once

#include "devices/inventory/deviceinventory.h"

#include <QString>

/// Writes the device list as a file that a spreadsheet can open.
namespace DeviceExport {

/// The file's lines for the devices at the places, in that order: nine columns, comma-separated, unquoted.
QByteArray text(const DeviceSnapshot &devices, const std::vector<int> &places);

/// Writes them to a file that appears whole or not at all; returns what went wrong, or an empty text. Any
/// thread.
QString write(const QString &path, const DeviceSnapshot &devices, const std::vector<int> &places);

} // namespace DeviceExport
