#pragma once

#include "devices/inventory/deviceinventory.h"
#include "devices/operations/certificates/certificatevalidity.h"

#include <memory>
#include <vector>

/// A certificate that a device works with, as its record says.
struct CertificateInUse {
    enum class Use : quint8 { Https, Ieee8021x };

    DeviceRecordPtr device;
    Use use = Use::Https;
    QString subject;
    qint64 expires = 0;     ///< Unix ms, 0 where it is not known
    std::string searchText; ///< of the subject, without case
};

/// The columns in which they are shown.
enum class CertificateColumn : quint8 { State, Expires, Use, Subject, Model, HostName, Ip, Mac };
inline constexpr int certificateColumnCount = 8;

/// The certificates in use of all devices; a large fleet has a hundred thousand. Any thread.
namespace CertificateList {

using List = std::vector<CertificateInUse>;
using ListPtr = std::shared_ptr<const List>;

/// Those of the devices, in the order of the devices.
List of(const DeviceSnapshot &devices);

/// The places in the list of those that a search finds by their device or subject, in the order of a column.
/// What is unknown comes last either way, and equal ones keep their order.
std::vector<int> arranged(const List &list, const QString &search, CertificateColumn column,
                          Qt::SortOrder order);

/// The column of the device that a column shows; those of the certificate itself have none.
bool isOfDevice(CertificateColumn column);
DeviceColumn deviceColumnOf(CertificateColumn column);

} // namespace CertificateList
