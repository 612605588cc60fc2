#pragma once

#include "devicerecord.h"

#include <QByteArray>

#include <vector>

/// Reads devices from a file that a spreadsheet has written: comma-separated UTF-8, the first line is the
/// header. Any thread.
///
/// A header that names Model, IP, MAC, HTTP Port and HTTPS Port gives their order, and may name columns
/// beside them, which are passed over; below any other header the columns are HTTP port, HTTPS port, IP, MAC
/// and model. A quoted field ends with its line, so that a quotation mark too many spoils one row only.
namespace CsvDevices {

inline constexpr qint64 sizeLimit = 64 << 20;

struct RefusedRow {
    int line; ///< counted from 1
    QString reason;
};

struct Reading {
    std::vector<DeviceRecordPtr> devices;
    std::vector<RefusedRow> refused;
    QString error; ///< why the file as a whole was refused; empty where it was read
};

Reading parse(const QByteArray &text);

/// Reads and parses a file, and logs its rows.
Reading readFile(const QString &path);

/// Writes an example of such a file, whole or not at all; returns what went wrong, or an empty text.
QString writeTemplate(const QString &path);

} // namespace CsvDevices
