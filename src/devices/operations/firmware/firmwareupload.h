#pragma once

#include "devices/operations/files/filecheck.h"

#include "platform/json.h"

/// Firmware on its way into the queue of uploads.
namespace FirmwareUpload {

/// An id for one choice of an image: "FW" and twelve hex digits. All waves of a rollout carry the same one,
/// so that whoever reads the service's tasks can tell that they are the same firmware.
QString newId();

/// Inserts an upload. actionTime: Unix ms as text, empty for now. False, with the reason in the log, where it
/// was refused.
bool insert(const FileCheck &image, const JSON &deviceIds, const QString &fwid, const QString &actionTime,
            QString *ctid = nullptr);

} // namespace FirmwareUpload
