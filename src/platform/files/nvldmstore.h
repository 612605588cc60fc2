#pragma once

#include <string>

/// Key-value tables in store files, one SQL database a file.
///
/// Every operation takes the file's path and table names as zero-terminated UTF-8 text and returns 0, or 1 on
/// failure, which it has logged. May be called from any thread: access to one file is serialised here.
///
/// A file for which createDBTable was called is the program's own. When any operation finds it damaged, it is
/// set aside under another name, a new one takes over what can still be read of it, and the operation goes on
/// there. That, and an own file that cannot be written or read, is told to StoreTrouble.
namespace nvldmstore {

/// Creates the file (for its user alone) and the table with the given column definition where they do not
/// exist.
int createDBTable(const char *file, const char *table, const char *columns);

/// Selects the rows that match the condition text (all for an empty one) and returns them as JSON text of an
/// array of objects keyed by column name. Never creates the file,
/// and changes none but a damaged one of the program's own.
int queryData(const char *file, const char *table, const char *condition, std::string &result);

/// Inserts a row, or replaces the one with the same primary key. The values are single-quoted texts separated
/// by commas, a quote inside a text doubled.
int replaceData(const char *file, const char *table, const char *values);

/// Fills the table with the rows of a list, given as JSON text of an array of objects keyed by column name:
/// all of them, or none. Rows that an interrupted fill has left are gone then.
int insertListData(const char *file, const char *table, const char *rows);

/// Replaces the target table's contents by the source table's in one step and drops the source.
int replaceTable(const char *file, const char *source, const char *target);

} // namespace nvldmstore
