#pragma once

#include "deviceoperations.h"

#include <QObject>

#include <functional>

/// Starts operations on devices, tells when one could not begin, and remembers how to do them again. Each
/// runs on a runner of its own. User-interface thread.
class DeviceActions : public QObject {
    Q_OBJECT

public:
    using QObject::QObject;

    void restart(const QStringList &deviceIds);

signals:
    /// The operation could not begin; the message says which and why.
    void failed(const QString &message);

private:
    using Operation = DeviceOperations::Outcome (*)(ServiceSession &, const QStringList &);

    /// name: of the operation, for messages.
    void start(const QString &name, Operation operation, const QStringList &deviceIds);
};
