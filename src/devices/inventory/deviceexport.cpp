#include "devices/inventory/deviceexport.h"

#include "base/spreadsheetcell.h"

#include <QSaveFile>

#include <nlohmann/json.hpp>

namespace DeviceExport {

namespace {

constexpr const char *header =
    "Brand,Host name,IP,HTTP port,HTTPS port,Network type,Model name,MAC,Firmware version\n";
constexpr const char *brand = "Norvell";

struct Field {
    DeviceColumn column;
    const char *member;
};

constexpr Field beforeNetworkType[] = {{DeviceColumn::HostName, "d_hostname"},
                                       {DeviceColumn::Ip, "d_ip"},
                                       {DeviceColumn::HttpPort, "d_http"},
                                       {DeviceColumn::HttpsPort, "d_https"}};
constexpr Field afterNetworkType[] = {
    {DeviceColumn::Model, "d_model"}, {DeviceColumn::Mac, "d_mac"}, {DeviceColumn::Firmware, "d_fw"}};

/// As it is, but that a line break would make two lines of a device, and that no cell is a formula.
QByteArray cell(QString text) {
    text.replace(QLatin1Char('\n'), QLatin1Char(' ')).remove(QLatin1Char('\r'));
    return QByteArray::fromStdString(SpreadsheetCell::harmless(text.toStdString()));
}

/// What the table shows, which is the record's own text in all but odd records.
QByteArray value(const DeviceRecord &device, const Field &field) {
    QString text = device.text(field.column);
    if (text == QLatin1String("--"))
        text = stringMember(JSON::parse(device.json(), nullptr, false), field.member);
    return cell(text);
}

void append(QByteArray &lines, const DeviceRecord &device) {
    lines += brand;
    for (const Field &field : beforeNetworkType)
        lines += ',' + value(device, field);
    lines += ',' + cell(device.networkType);
    for (const Field &field : afterNetworkType)
        lines += ',' + value(device, field);
    lines += '\n';
}

} // namespace

QByteArray text(const DeviceSnapshot &devices, const std::vector<int> &places) {
    QByteArray lines = header;
    for (const int place : places)
        append(lines, *devices.at(place));
    return lines;
}

QString write(const QString &path, const DeviceSnapshot &devices, const std::vector<int> &places) {
    QSaveFile file(path);
    const QByteArray lines = text(devices, places);
    if (!file.open(QIODevice::WriteOnly) || file.write(lines) != lines.size() || !file.commit())
        return file.errorString();
    return {};
}

} // namespace DeviceExport
