#include "devices/operations/certificates/certificatelist.h"

#include "devices/inventory/devicesearch.h"

#include <algorithm>
#include <iterator>

namespace CertificateList {

namespace {

constexpr DeviceColumn deviceColumns[] = {DeviceColumn::Model, DeviceColumn::HostName, DeviceColumn::Ip,
                                          DeviceColumn::Mac};

/// A certificate while it is sorted: the key decides, the text of the same column where keys are equal.
struct Sortable {
    quint64 key;
    int place;
    const QString *text;
};

/// The first letters, as one number.
quint64 letterKey(const std::string &text) {
    if (text.empty())
        return DeviceRecord::unknownKey;
    quint64 key = 0;
    for (std::size_t i = 0; i < 7; ++i)
        key = key << 8 | (i < text.size() ? static_cast<unsigned char>(text[i]) : 0u);
    return key;
}

quint64 keyOf(const CertificateInUse &certificate, CertificateColumn column) {
    if (isOfDevice(column))
        return certificate.device->sortKey(deviceColumnOf(column));
    if (column == CertificateColumn::Subject)
        return letterKey(certificate.searchText);
    if (column == CertificateColumn::Use)
        return static_cast<quint64>(certificate.use);
    return certificate.expires == 0 ? DeviceRecord::unknownKey : static_cast<quint64>(certificate.expires);
}

const QString &textOf(const CertificateInUse &certificate, CertificateColumn column) {
    static const QString none;
    if (isOfDevice(column))
        return certificate.device->text(deviceColumnOf(column));
    return column == CertificateColumn::Subject ? certificate.subject : none;
}

bool comesFirst(const Sortable &a, const Sortable &b, bool ascending) {
    if (a.key != b.key) {
        if (a.key == DeviceRecord::unknownKey || b.key == DeviceRecord::unknownKey)
            return b.key == DeviceRecord::unknownKey;
        return (a.key < b.key) == ascending;
    }
    const int order = a.text->compare(*b.text, Qt::CaseInsensitive);
    return order != 0 ? (order < 0) == ascending : a.place < b.place;
}

void add(List &list, const DeviceRecordPtr &device, CertificateInUse::Use use, const QString &subject,
         qint64 expires) {
    list.push_back({device, use, subject, expires, subject.toCaseFolded().toStdString()});
}

} // namespace

bool isOfDevice(CertificateColumn column) {
    return column >= CertificateColumn::Model;
}

DeviceColumn deviceColumnOf(CertificateColumn column) {
    return deviceColumns[static_cast<int>(column) - static_cast<int>(CertificateColumn::Model)];
}

List of(const DeviceSnapshot &devices) {
    List list;
    for (int place = 0; place < devices.size(); ++place) {
        const DeviceRecordPtr &device = devices.at(place);
        const DeviceCertificates &known = device->certificates;
        if (known.hasHttps)
            add(list, device, CertificateInUse::Use::Https, known.httpsSubject, known.httpsExpires);
        if (known.hasIeee)
            add(list, device, CertificateInUse::Use::Ieee8021x, {}, known.ieeeExpires);
    }
    return list;
}

std::vector<int> arranged(const List &list, const QString &search, CertificateColumn column,
                          Qt::SortOrder order) {
    const DeviceSearch words(search, {});
    const std::string subject = search.trimmed().toCaseFolded().toStdString();
    std::vector<Sortable> rows;
    for (std::size_t place = 0; place < list.size(); ++place) {
        const CertificateInUse &each = list[place];
        if (words.matches(*each.device) || each.searchText.find(subject) != std::string::npos)
            rows.push_back({keyOf(each, column), static_cast<int>(place), &textOf(each, column)});
    }
    const bool ascending = order == Qt::AscendingOrder;
    std::sort(rows.begin(), rows.end(),
              [ascending](const Sortable &a, const Sortable &b) { return comesFirst(a, b, ascending); });
    std::vector<int> places;
    std::transform(rows.begin(), rows.end(), std::back_inserter(places),
                   [](const Sortable &row) { return row.place; });
    return places;
}

} // namespace CertificateList
