#pragma once

#include "devices/inventory/devicerecord.h"

#include <QByteArray>

#include <stop_token>
#include <vector>

/// Reads devices from a file that a spreadsheet has written: comma-separated UTF-8, the first line is the
/// header. Any thread.
///
/// A header that names Model, IP, MAC, HTTP Port and HTTPS Port gives their order, and may name columns
/// beside them, which are passed over; below any other header the columns are HTTP port, HTTPS port, IP, MAC
/// and model. A quoted field ends with its line, so that a quotation mark too many spoils one row only.
namespace CsvDevices {

inline constexpr qint64 sizeLimit = 64 << 20;
inline constexpr int rowLimit = 100'000;
/// Longer rows are refused unread.
inline constexpr qsizetype rowSizeLimit = 8192;
/// So many refused rows are kept with their reasons; the others are counted.
inline constexpr std::size_t maxRefusedKept = 1000;

struct RefusedRow {
    int line; ///< counted from 1
    QString reason;
};

struct Reading {
    std::vector<DeviceRecordPtr> devices;
    std::vector<RefusedRow> refused;
    int refusedCount = 0; ///< those that were not kept among them
    QString error;        ///< why the file as a whole was refused; empty where it was read
};

/// A stop ends the reading early; what comes back then is of no use.
Reading parse(const QByteArray &text, const std::stop_token &stop = {});

/// Reads and parses a file, and logs its rows.
Reading readFile(const QString &path, const std::stop_token &stop = {});

/// Writes an example of such a file, whole or not at all; returns what went wrong, or an empty text.
QString writeTemplate(const QString &path);

} // namespace CsvDevices
