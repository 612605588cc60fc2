#pragma once

#include "devices/inventory/deltatext.h"
#include "devices/inventory/devicecertificates.h"
#include "devices/inventory/passwordpolicy.h"
#include "platform/json.h"

#include <QString>
#include <QStringList>

#include <array>
#include <memory>
#include <string>
#include <string_view>

class RecordPool;

/// The kind of device, which decides the table it is shown in.
enum class DeviceClass : quint8 { Camera, Nvr, Others };
inline constexpr int deviceClassCount = 3;

/// The columns of the device tables, in their order.
enum class DeviceColumn : quint8 {
    Status,
    Model,
    HostName,
    Ip,
    Mac,
    Firmware,
    HttpPort,
    HttpsPort,
    Https,
    Ieee8021x,
    SdCardStatus,
    SdCardUsage,
    DateTime,
    PowerFrequency,
    Audio
};
inline constexpr int deviceColumnCount = 15;

/// A device as the tables show it, read once from the service's record. Never changed after that, so threads
/// share it freely.
struct DeviceRecord {
    /// Sort key of a value that is missing or not of its column's type.
    static constexpr quint64 unknownKey = ~quint64{0};

    QString id;
    DeviceClass deviceClass = DeviceClass::Others;
    QStringList siteIds;
    QString networkType;   ///< empty where the record has none
    bool hasCard = false;  ///< a memory card is in that takes files
    PasswordPolicy policy; ///< for the passwords of its accounts
    DeviceCertificates certificates;
    /// What the columns show, "--" for what the record lacks. The status column's text stands elsewhere.
    std::array<QString, deviceColumnCount> texts;
    /// What the columns are sorted by before their texts: numbers, addresses, versions, times, or the first
    /// letters of a text.
    std::array<quint64, deviceColumnCount> sortKeys{};
    /// Host name, address, model and firmware without case, in UTF-8: what a search looks through.
    std::string searchText;
    DeltaText keptJson;
    std::size_t textHash = 0; ///< of the text that the record was read from, if it was one

    /// The whole record as JSON text, with the members that this client does not know.
    std::string json() const { return keptJson.text(); }
    const QString &text(DeviceColumn column) const { return texts[static_cast<std::size_t>(column)]; }
    quint64 sortKey(DeviceColumn column) const { return sortKeys[static_cast<std::size_t>(column)]; }
};

using DeviceRecordPtr = std::shared_ptr<const DeviceRecord>;

namespace DeviceRecords {

/// Reads a record. Members that are missing or of a wrong type spoil their own value only; null for a value
/// that is no object or has neither an id nor a MAC address.
DeviceRecordPtr parse(const JSON &value);

/// The same for the text of a record, among many whose common parts are kept once. Throws what parseJson
/// throws.
DeviceRecordPtr parse(std::string_view text, RecordPool &pool);

/// Of the text of a record: as long as it is the same, so is the record.
std::size_t hashOf(std::string_view text);

/// The id of a record, or its MAC address in a plain form where the service has given no id yet.
QString identityOf(const JSON &value);

/// The header text of a column.
QString columnTitle(DeviceColumn column);

/// Less than 0 where the left record comes before the right one in an order by the column. What is unknown
/// comes last either way.
int compare(const DeviceRecord &left, const DeviceRecord &right, DeviceColumn column, bool ascending);

/// A dotted IPv4 address as a number for sorting, unknownKey for any other text.
quint64 ipSortKey(QStringView text);

} // namespace DeviceRecords
