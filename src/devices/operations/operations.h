#pragma once

#include "devices/operations/operation.h"

#include <span>

/// The rows of all operations. Each is defined in the file of its operation.
namespace Operations {

extern const Operation addDevice, authorize, setPassword, assignIp;
extern const Operation upload, uploadFirmware, uploadPackage, uploadConfiguration;
extern const Operation uploadCertificate, uploadHttps, uploadIeee, certificateList;
extern const Operation quickSetup, setConfiguration, createTemplate, importTemplate, backupConfiguration;
extern const Operation restart, restore, restorePoint, factoryDefault, replace;
extern const Operation exportMenu, exportDeviceList, exportDebugInfo, refresh, deleteDevices;

/// In the order in which they are offered.
std::span<const Operation *const> all();

/// The operation that makes tasks of the type, or null.
const Operation *findByTask(const QString &taskType);

} // namespace Operations
