#pragma once

#include <QTemporaryFile>

#include <chrono>
#include <string>

/// Where a file from the service goes: a temporary file beside the target, for its user alone, that takes the
/// target's name only when it is whole. A file that is there is never overwritten, and nothing unfinished
/// stays.
class DownloadTarget {
public:
    /// path: UTF-8.
    explicit DownloadTarget(const char *path);

    /// Removes what fetches into the folder have left behind that ended with the program, unless it was
    /// written to within that time.
    static void removeLeftovers(const QString &folder, std::chrono::milliseconds age);

    /// False when the target exists or nothing can be written there.
    bool open();
    bool write(const char *bytes, std::size_t length);
    /// Gives the file its name. False when it could not be written, or another one has taken the name.
    bool finish();

    /// True when one of the three has failed.
    bool hasFailed() const { return m_failed; }
    /// The target's name without its folder.
    std::string name() const;

private:
    bool check(bool succeeded);

    QString m_path;
    QTemporaryFile m_file;
    bool m_failed = false;
};
