#include "devices/inventory/devicelog.h"

#include <QCoreApplication>
#include <QDebug>
#include <QThreadPool>

namespace DeviceLog {

namespace {

QThreadPool &pool() {
    static QThreadPool pool;
    pool.setMaxThreadCount(1);
    return pool;
}

const char *className(DeviceClass deviceClass) {
    switch (deviceClass) {
    case DeviceClass::Camera:
        return "camera";
    case DeviceClass::Nvr:
        return "NVR";
    case DeviceClass::Others:
        break;
    }
    return "Others";
}

void logAdded(const DeviceRecord &record) {
    qDebug("add %s '%s' to device table", className(record.deviceClass),
           qUtf8Printable(record.text(DeviceColumn::HostName)));
    qDebug("model: %s, ip: %s, MAC: %s", qUtf8Printable(record.text(DeviceColumn::Model)),
           qUtf8Printable(record.text(DeviceColumn::Ip)), qUtf8Printable(record.text(DeviceColumn::Mac)));
}

} // namespace

void tablesFilled(const DeviceSnapshotPtr &snapshot, const DeviceSnapshotPtr &previous) {
    pool().start([snapshot, previous] {
        for (int i = 0; i < snapshot->size() && !QCoreApplication::closingDown(); ++i) {
            if (previous->indexOf(snapshot->at(i)->id) < 0)
                logAdded(*snapshot->at(i));
        }
    });
}

void selectionChanged(std::vector<DeviceRecordPtr> devices) {
    pool().start([devices = std::move(devices)] {
        QByteArray records = "[";
        QByteArray ids = "[";
        for (const DeviceRecordPtr &device : devices) {
            const char *separator = records.size() > 1 ? "," : "";
            records.append(separator).append(QByteArray::fromStdString(device->json()));
            ids.append(separator).append('"').append(device->id.toUtf8()).append('"');
        }
        qDebug("selected devices dump string: %s]", records.constData());
        qDebug("selected devicesId dump string: %s]", ids.constData());
    });
}

} // namespace DeviceLog
