#include "firmwareupload.h"

#include "json.h"
#include "uploadtaskmgr.h"

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

bool insert(const UploadFile &image, const QStringList &deviceIds, const QString &fwid,
            const QString &actionTime, QString *ctid) {
    JSON ids = JSON::array();
    for (const QString &id : deviceIds)
        ids.push_back(id.toStdString());
    return UploadTaskMgr::instance().insertNewFWUploadTask(mode, image.path, image.name, ids, fwid,
                                                           actionTime, ctid);
}

} // namespace FirmwareUpload
