#include "devices/inventory/devicerecord.h"

#include "base/ipv4.h"
#include "base/macaddress.h"
#include "devices/inventory/recordpool.h"
#include "devices/sites/sitemembership.h"

#include <QCoreApplication>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <optional>

namespace DeviceRecords {

namespace {

constexpr const char *context = "DeviceRecords";
const QString unknownText = QStringLiteral("--");

const JSON *member(const JSON &record, const char *name) {
    const auto found = record.find(name);
    return found != record.end() && !found->is_null() ? &*found : nullptr;
}

std::optional<qint64> wholeNumber(const JSON &record, const char *name) {
    const JSON *value = member(record, name);
    if (!value)
        return std::nullopt;
    if (value->is_number_integer())
        return value->get<qint64>();
    bool ok = false;
    const qint64 number =
        value->is_string() ? QString::fromStdString(value->get<std::string>()).toLongLong(&ok) : 0;
    return ok ? std::optional(number) : std::nullopt;
}

std::optional<bool> flag(const JSON &record, const char *name) {
    const JSON *value = member(record, name);
    if (value && value->is_boolean())
        return value->get<bool>();
    const std::optional<qint64> number = wholeNumber(record, name);
    return number && (*number == 0 || *number == 1) ? std::optional(*number == 1) : std::nullopt;
}

QString orUnknown(const QString &text) {
    return text.isEmpty() ? unknownText : text;
}

/// The first letters without case, as one number; what they leave open the texts decide.
quint64 letterKey(const QString &text) {
    if (text == unknownText)
        return DeviceRecord::unknownKey;
    quint64 key = 0;
    for (int i = 0; i < 4; ++i)
        key = key << 16 | (i < text.size() ? text[i].toCaseFolded().unicode() : 0u);
    return key;
}

/// "2.4.10" as one number, sixteen bits a part.
quint64 versionKey(const QString &text) {
    quint64 key = 0;
    qsizetype at = 0;
    for (int part = 0; part < 4; ++part) {
        quint64 number = 0;
        const qsizetype begin = at;
        for (; at < text.size() && text[at].isDigit() && number < 0xFFFF; ++at)
            number = number * 10 + static_cast<quint64>(text[at].digitValue());
        if (part == 0 && at == begin)
            return letterKey(text);
        key = key << 16 | std::min<quint64>(number, 0xFFFF);
        if (at < text.size())
            ++at;
    }
    return key;
}

/// All digits of a text as one decimal number: orders "yyyy/MM/dd hh:mm:ss" by time.
quint64 digitsKey(const QString &text) {
    quint64 key = 0;
    int digits = 0;
    for (const QChar c : text) {
        if (c.isDigit() && ++digits <= 18)
            key = key * 10 + static_cast<quint64>(c.digitValue());
    }
    return digits ? key : DeviceRecord::unknownKey;
}

quint64 macKey(const QString &text) {
    return MacAddress::parse(text.toLatin1().toStdString()).value_or(DeviceRecord::unknownKey);
}

/// One value of a record while it is read: text and sort key of a column.
class Columns {
public:
    Columns(DeviceRecord &record, RecordPool &pool) : m_record(record), m_pool(pool) {}

    void set(DeviceColumn column, const QString &text, quint64 key) {
        m_record.texts[static_cast<std::size_t>(column)] = text;
        m_record.sortKeys[static_cast<std::size_t>(column)] = key;
    }
    void setText(DeviceColumn column, const QString &value) {
        const QString text = m_pool.shared(orUnknown(value));
        set(column, text, letterKey(text));
    }
    void setNumber(DeviceColumn column, std::optional<qint64> number) {
        const bool known = number && *number >= 0;
        set(column, known ? m_pool.shared(QString::number(*number)) : unknownText,
            known ? static_cast<quint64>(*number) : DeviceRecord::unknownKey);
    }
    void setFlag(DeviceColumn column, std::optional<bool> on) {
        setText(column, !on   ? QString()
                        : *on ? QCoreApplication::translate("DeviceRecords", "Enabled")
                              : QCoreApplication::translate("DeviceRecords", "Disabled"));
    }

private:
    DeviceRecord &m_record;
    RecordPool &m_pool;
};

DeviceClass classOf(const QString &serverType) {
    if (serverType == QLatin1String("Camera"))
        return DeviceClass::Camera;
    return serverType == QLatin1String("NVR") ? DeviceClass::Nvr : DeviceClass::Others;
}

QString cardStatusText(const QString &status) {
    // A write-protected card can be read, so it counts as ready.
    if (status == QLatin1String("ready") || status == QLatin1String("readonly"))
        return QCoreApplication::translate("DeviceRecords", "Ready");
    if (status == QLatin1String("Error"))
        return QCoreApplication::translate("DeviceRecords", "Error");
    if (status == QLatin1String("detached"))
        return QCoreApplication::translate("DeviceRecords", "Detached");
    if (status == QLatin1String("Empty"))
        return QCoreApplication::translate("DeviceRecords", "Empty");
    return status;
}

QString audioText(const QString &audio) {
    if (audio == QLatin1String("mute"))
        return QCoreApplication::translate("DeviceRecords", "Mute");
    if (audio == QLatin1String("unmute"))
        return QCoreApplication::translate("DeviceRecords", "Unmute");
    return audio;
}

QStringList siteIdsOf(const JSON &record) {
    QStringList ids;
    for (const JSON &id : SiteMembership::siteIdsOf(record))
        ids.append(QString::fromStdString(id.get_ref<const std::string &>()));
    return ids;
}

PasswordPolicy policyOf(const JSON &value) {
    const auto found = value.find("d_policy");
    if (found == value.end() || !found->is_object())
        return {};
    const auto number = [&](const char *name, int most) {
        const auto member = found->find(name);
        return member != found->end() && member->is_number_integer()
                   ? static_cast<int>(std::clamp<std::int64_t>(member->get<std::int64_t>(), 0, most))
                   : 0;
    };
    return {number("plen", PasswordPolicy::longest), number("type", 63)};
}

void readColumns(const JSON &value, DeviceRecord &record, RecordPool &pool) {
    Columns columns(record, pool);
    columns.setText(DeviceColumn::Model, stringMember(value, "d_model"));
    const QString host = orUnknown(stringMember(value, "d_hostname"));
    columns.set(DeviceColumn::HostName, host, letterKey(host));
    const QString ip = stringMember(value, "d_ip");
    const quint64 ipKey = ipSortKey(ip);
    columns.set(DeviceColumn::Ip, ipKey == DeviceRecord::unknownKey ? unknownText : ip, ipKey);
    const QString mac = stringMember(value, "d_mac");
    columns.set(DeviceColumn::Mac, orUnknown(mac), macKey(mac));
    const QString firmware = pool.shared(orUnknown(stringMember(value, "d_fw")));
    columns.set(DeviceColumn::Firmware, firmware, versionKey(firmware));
    columns.setNumber(DeviceColumn::HttpPort, wholeNumber(value, "d_http"));
    columns.setNumber(DeviceColumn::HttpsPort, wholeNumber(value, "d_https"));
    columns.setFlag(DeviceColumn::Https, flag(value, "https_enable"));
    columns.setFlag(DeviceColumn::Ieee8021x, flag(value, "ieee8021x_enable"));
    columns.setText(DeviceColumn::SdCardStatus, cardStatusText(stringMember(value, "d_sdstatus")));
    columns.setNumber(DeviceColumn::SdCardUsage, wholeNumber(value, "d_sdusage"));
    const QString time = orUnknown(stringMember(value, "d_dtime"));
    columns.set(DeviceColumn::DateTime, time, digitsKey(time));
    columns.setNumber(DeviceColumn::PowerFrequency, wholeNumber(value, "d_powerfreq"));
    columns.setText(DeviceColumn::Audio, audioText(stringMember(value, "d_audio")));
}

std::shared_ptr<DeviceRecord> read(const JSON &value, RecordPool &pool) {
    auto record = std::make_shared<DeviceRecord>();
    record->id = identityOf(value);
    if (record->id.isEmpty())
        return nullptr;
    record->deviceClass = classOf(stringMember(value, "d_svrtype"));
    record->siteIds = pool.shared(siteIdsOf(value));
    record->networkType = pool.shared(stringMember(value, "d_nettype"));
    // Unlike the column: a write-protected card is of no use to who wants to store something.
    record->hasCard = textMember(value, "d_sdstatus") == "ready";
    record->policy = policyOf(value);
    record->certificates = DeviceCertificates::of(value);
    readColumns(value, *record, pool);
    for (const DeviceColumn column :
         {DeviceColumn::HostName, DeviceColumn::Ip, DeviceColumn::Model, DeviceColumn::Firmware}) {
        if (record->text(column) != unknownText)
            record->searchText += record->text(column).toCaseFolded().toStdString() + '\n';
    }
    record->searchText.shrink_to_fit();
    record->keptJson = pool.keep(record->text(DeviceColumn::Model), dumpJson(value));
    return record;
}

} // namespace

quint64 ipSortKey(QStringView text) {
    const std::optional<std::uint32_t> address = Ipv4::parse(text.toLatin1().toStdString());
    return address ? *address : DeviceRecord::unknownKey;
}

QString identityOf(const JSON &value) {
    if (const QString id = stringMember(value, "id"); !id.isEmpty())
        return id;
    return QString::fromStdString(MacAddress::plain(textMember(value, "d_mac")));
}

DeviceRecordPtr parse(const JSON &value) {
    RecordPool pool;
    return read(value, pool);
}

DeviceRecordPtr parse(std::string_view text, RecordPool &pool) {
    std::shared_ptr<DeviceRecord> record = read(parseJson(text), pool);
    if (record)
        record->textHash = hashOf(text);
    return record;
}

std::size_t hashOf(std::string_view text) {
    return std::hash<std::string_view>()(text);
}

QString columnTitle(DeviceColumn column) {
    static constexpr std::array<const char *, deviceColumnCount> titles{
        QT_TRANSLATE_NOOP("DeviceRecords", "Status"),
        QT_TRANSLATE_NOOP("DeviceRecords", "Model"),
        QT_TRANSLATE_NOOP("DeviceRecords", "Host Name"),
        QT_TRANSLATE_NOOP("DeviceRecords", "IP"),
        QT_TRANSLATE_NOOP("DeviceRecords", "MAC"),
        QT_TRANSLATE_NOOP("DeviceRecords", "Firmware"),
        QT_TRANSLATE_NOOP("DeviceRecords", "HTTP Port"),
        QT_TRANSLATE_NOOP("DeviceRecords", "HTTPS Port"),
        QT_TRANSLATE_NOOP("DeviceRecords", "HTTPS"),
        QT_TRANSLATE_NOOP("DeviceRecords", "IEEE 802.1X"),
        QT_TRANSLATE_NOOP("DeviceRecords", "SD Card Status"),
        QT_TRANSLATE_NOOP("DeviceRecords", "SD Card Usage(%)"),
        QT_TRANSLATE_NOOP("DeviceRecords", "Date/Time"),
        QT_TRANSLATE_NOOP("DeviceRecords", "Power Frequency(Hz)"),
        QT_TRANSLATE_NOOP("DeviceRecords", "Audio")};
    return QCoreApplication::translate(context, titles[static_cast<std::size_t>(column)]);
}

int compare(const DeviceRecord &left, const DeviceRecord &right, DeviceColumn column, bool ascending) {
    const auto order = [ascending](bool smaller) { return smaller == ascending ? -1 : 1; };
    const quint64 leftKey = left.sortKey(column);
    const quint64 rightKey = right.sortKey(column);
    if (leftKey != rightKey) {
        if (leftKey == DeviceRecord::unknownKey || rightKey == DeviceRecord::unknownKey)
            return rightKey == DeviceRecord::unknownKey ? -1 : 1;
        return order(leftKey < rightKey);
    }
    const int texts = left.text(column).compare(right.text(column), Qt::CaseInsensitive);
    return texts == 0 ? 0 : order(texts < 0);
}

} // namespace DeviceRecords
