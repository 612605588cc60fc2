#pragma once

#include <QSet>
#include <QStringList>

class ServiceSession;

/// Which devices the service still has. It refuses the whole of what is asked for many when one of them was
/// removed meanwhile, and nobody wants a thousand devices left alone for that one.
struct ExistingDevices {
    QStringList ids;
    QStringList vanished;
    QSet<QString> macs; ///< of those that are left, plain

    /// True when it may go better without the vanished ones.
    bool canRetry() const { return !vanished.isEmpty() && !ids.isEmpty(); }

    /// Looks for the devices in the service's list, and takes all for left where that cannot be read. For a
    /// runner's thread.
    static ExistingDevices among(const QStringList &deviceIds, ServiceSession &session);
};
