#pragma once

#include "platform/json.h"

#include <QStringList>

class ServiceSession;

/// Sends changed device records to the service. For a runner's thread.
namespace DeviceCommit {

/// Reads the present records of devices, for what rewrites them: other clients change devices too. Those that
/// the service does not have any more are missing; the others keep the order of their ids. Returns an
/// ApiResult.
unsigned readPresent(ServiceSession &session, const QStringList &deviceIds, JSON &records);

/// Commits an array of records, in one step for the service however many they are. Returns an ApiResult.
unsigned send(ServiceSession &session, const JSON &records);

} // namespace DeviceCommit
