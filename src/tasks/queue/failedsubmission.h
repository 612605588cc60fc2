#pragma once

#include <QString>

/// An operation whose work did not reach the service, or of which nobody knows whether it did, as the user is
/// told of it.
struct FailedSubmission {
    QString ctid; ///< of its record
    QString serviceType;
    int devices = 0;           ///< 0 where their number is not told
    QString reason;            ///< a whole sentence
    bool isFollowed = false;   ///< whoever inserted the record sees to it
    QString tid;               ///< of its task on the service; empty where none was made
    bool mayHaveBegun = false; ///< the service did not answer: only its task can tell
    QString title;             ///< in place of the one of the type

    /// What the user is told, in whole sentences.
    QString text() const;
};
