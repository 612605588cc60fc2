#pragma once

#include "json.h"

class ServiceSession;

/// Sends changed device records to the service. For a runner's thread.
namespace DeviceCommit {

/// Commits an array of records, in one step for the service however many they are. Returns an ApiResult.
unsigned send(ServiceSession &session, const JSON &records);

} // namespace DeviceCommit
