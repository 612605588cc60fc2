#pragma once

#include <QString>

/// An operation whose work did not reach the service, as the user is told of it.
struct FailedHandOver {
    QString ctid; ///< of its record
    QString serviceType;
    int devices = 0;
    QString reason;          ///< a whole sentence
    bool isFollowed = false; ///< whoever inserted the record sees to it
};
