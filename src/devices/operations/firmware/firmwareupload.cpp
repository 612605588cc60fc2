#include "devices/operations/firmware/firmwareupload.h"

#include "tasks/queue/uploadtaskmgr.h"

#include <QRandomGenerator>

#include <nlohmann/json.hpp>

namespace FirmwareUpload {

namespace {

/// The service works through the devices by itself, as many at a time as its settings allow.
const QString mode = QStringLiteral("auto");

} // namespace

QString newId() {
    const quint64 number = QRandomGenerator::global()->generate64() & 0xFFFFFFFFFFFF;
    return QStringLiteral("FW%1").arg(number, 12, 16, QLatin1Char('0')).toUpper();
}

bool insert(const FileCheck &image, const JSON &deviceIds, const QString &fwid, const QString &actionTime,
            QString *ctid) {
    return UploadTaskMgr::instance().insertNewFWUploadTask(mode, image.path, image.name, deviceIds, fwid,
                                                           actionTime, ctid);
}

} // namespace FirmwareUpload
