#include "devices/discovery/csvdevices.h"

#include "base/ipv4.h"
#include "base/macaddress.h"
#include "base/spreadsheetcell.h"

#include <QCoreApplication>
#include <QDebug>
#include <QFileInfo>
#include <QHash>
#include <QLocale>
#include <QSaveFile>
#include <QThreadPool>

#include <nlohmann/json.hpp>

#include <array>
#include <optional>

namespace CsvDevices {

namespace {

constexpr const char *recordTemplate =
    R"({"d_apstate":0,"d_camid":"","d_camname":"","d_cport":0,"d_ezver":"","d_ftp":0,"d_http":0,"d_https":0,)"
    R"("d_ip":"","d_iscsvc":0,"d_lang":"","d_mac":"","d_model":"","d_netcip":"","d_svrtype":"","id":"",)"
    R"("siteid":"[\"DO000000000000\"]"})";
constexpr int maxLoggedRows = 1000;
constexpr int maxLoggedFields = 32;
constexpr const char *exampleFile = "Model,IP,MAC,HTTP Port,HTTPS Port\r\n"
                                    "Example Camera,192.0.2.10,00-00-5E-00-53-01,80,443\r\n";

struct Text {
    Q_DECLARE_TR_FUNCTIONS(CsvDevices)
};

/// The columns that make a device, in the order that holds without a header of theirs.
enum Field { HttpPort, HttpsPort, Ip, Mac, Model, fieldCount };

struct Layout {
    std::array<qsizetype, fieldCount> places{HttpPort, HttpsPort, Ip, Mac, Model};
    qsizetype columns = fieldCount;
    bool isNamed = false; ///< by a header with all five names
};

struct Row {
    int line;
    QByteArrayView bytes;
};

/// Goes through the rows of a text that are not blank, without a copy of it.
class Rows {
public:
    explicit Rows(const QByteArray &text) : m_text(text), m_from(text.startsWith("\xEF\xBB\xBF") ? 3 : 0) {}

    std::optional<Row> next() {
        while (m_from < m_text.size()) {
            const qsizetype end = m_text.indexOf('\n', m_from);
            const qsizetype to = end < 0 ? m_text.size() : end;
            QByteArrayView bytes = m_text.sliced(m_from, to - m_from);
            m_from = to + 1;
            ++m_line;
            if (bytes.endsWith('\r'))
                bytes.chop(1);
            if (!bytes.trimmed().isEmpty())
                return Row{m_line, bytes};
        }
        return std::nullopt;
    }

private:
    QByteArrayView m_text;
    qsizetype m_from;
    int m_line = 0;
};

bool isTooLong(const Row &row) {
    return row.bytes.size() > rowSizeLimit;
}

/// The fields of a row; nothing where a quotation mark stays open.
std::optional<QStringList> fieldsOf(const QString &row) {
    QStringList fields;
    QString field;
    bool quoted = false;
    for (qsizetype i = 0; i < row.size(); ++i) {
        const QChar c = row[i];
        if (quoted && c == u'"' && i + 1 < row.size() && row[i + 1] == u'"') {
            field += row[++i];
        } else if (c == u'"' && (quoted || field.trimmed().isEmpty())) {
            quoted = !quoted;
        } else if (c == u',' && !quoted) {
            fields += field.trimmed();
            field.clear();
        } else {
            field += c;
        }
    }
    if (quoted)
        return std::nullopt;
    fields += field.trimmed();
    return fields;
}

/// "HTTP Port", "http_port" and "http" are the same column, as are "Model" and "Model name".
QString plainName(QString name) {
    name = name.toLower();
    name.removeIf([](QChar c) { return !c.isLetter(); });
    for (const char *ending : {"port", "address", "name"}) {
        if (name.endsWith(QLatin1String(ending)))
            name.chop(static_cast<qsizetype>(qstrlen(ending)));
    }
    return name;
}

Layout layoutOf(const QStringList &header) {
    static constexpr std::array<const char *, fieldCount> names{"http", "https", "ip", "mac", "model"};
    QStringList plain;
    for (const QString &name : header)
        plain += plainName(name);
    Layout layout;
    for (std::size_t field = 0; field < fieldCount; ++field) {
        layout.places[field] = plain.indexOf(QLatin1String(names[field]));
        if (layout.places[field] < 0)
            return {};
    }
    layout.columns = header.size();
    layout.isNamed = true;
    return layout;
}

std::optional<int> portOf(const QString &text) {
    bool isNumber = false;
    const int port = text.toInt(&isNumber);
    return isNumber && port >= 1 && port <= 65535 ? std::optional(port) : std::nullopt;
}

/// The address without leading zeros, which some would read as octal.
QString addressOf(const QString &text) {
    const std::optional<std::uint32_t> address = Ipv4::parse(text.toLatin1().toStdString());
    return address ? QString::fromStdString(Ipv4::toText(*address)) : QString();
}

/// A value as a reason quotes it.
QString quoted(const QString &text) {
    constexpr qsizetype longest = 40;
    return text.size() > longest ? text.left(longest) + QChar(0x2026) : text;
}

/// Takes rows and keeps what came of them.
class Reader {
public:
    explicit Reader(const Layout &layout) : m_layout(layout) {}

    void take(const Row &row) {
        QString reason = refusal(row);
        if (reason.isEmpty())
            return;
        ++m_reading.refusedCount;
        if (m_reading.refused.size() < maxRefusedKept)
            m_reading.refused.push_back({row.line, std::move(reason)});
    }
    Reading &reading() { return m_reading; }

private:
    QString refusal(const Row &row) {
        if (isTooLong(row))
            return Text::tr("The row is longer than %1 characters.").arg(rowSizeLimit);
        const QString text = QString::fromUtf8(row.bytes);
        if (text.contains(QChar::ReplacementCharacter))
            return Text::tr("The row is not UTF-8 text.");
        const std::optional<QStringList> fields = fieldsOf(text);
        if (!fields)
            return Text::tr("A quotation mark is not closed.");
        if (fields->size() != m_layout.columns) {
            if (m_reading.refused.size() < maxRefusedKept)
                qDebug("invalid column number in csv file");
            return Text::tr("The row has %n column(s) in place of %1.", nullptr,
                            static_cast<int>(fields->size()))
                .arg(m_layout.columns);
        }
        return refusal(*fields, row.line);
    }

    QString refusal(const QStringList &fields, int line) {
        const auto value = [&](Field field) -> const QString & { return fields[m_layout.places[field]]; };
        for (const Field field : {HttpPort, HttpsPort}) {
            if (!portOf(value(field)))
                return Text::tr("\"%1\" is no port from 1 to 65535.").arg(quoted(value(field)));
        }
        const QString ip = addressOf(value(Ip));
        if (ip.isEmpty())
            return Text::tr("\"%1\" is no IPv4 address.").arg(quoted(value(Ip)));
        if (!MacAddress::parse(value(Mac).toLatin1().toStdString()))
            return Text::tr("\"%1\" is no MAC address.").arg(quoted(value(Mac)));
        static const JSON blank = JSON::parse(recordTemplate);
        JSON record = blank;
        record["d_http"] = *portOf(value(HttpPort));
        record["d_https"] = *portOf(value(HttpsPort));
        record["d_ip"] = ip.toStdString();
        record["d_mac"] = value(Mac).toStdString();
        record["d_model"] = SpreadsheetCell::original(value(Model).simplified().toStdString());
        const DeviceRecordPtr device = DeviceRecords::parse(record);
        const int first = m_lines.value(device->id, line);
        m_lines.insert(device->id, first);
        if (first != line)
            return Text::tr("The MAC address \"%1\" stands in line %2 already.")
                .arg(quoted(value(Mac)), QString::number(first));
        m_reading.devices.push_back(device);
        return {};
    }

    Layout m_layout;
    Reading m_reading;
    QHash<QString, int> m_lines; ///< of the devices, by their identities
};

/// The first rows of a file: each of them is several lines of the log.
void logRows(const QByteArray &text) {
    Rows rows(text);
    rows.next();
    int left = maxLoggedRows;
    while (const std::optional<Row> row = rows.next()) {
        if (QCoreApplication::closingDown())
            return;
        if (left-- == 0)
            return qDebug("The csv file has more rows, which are not logged");
        if (isTooLong(*row))
            continue;
        qDebug("row data at row %d: %s", row->line - 1, row->bytes.toByteArray().constData());
        const QStringList fields = fieldsOf(QString::fromUtf8(row->bytes)).value_or(QStringList());
        qDebug("column data size: %d", static_cast<int>(fields.size()));
        for (int i = 0; i < fields.size() && i < maxLoggedFields; ++i)
            qDebug("column data (%d, %d): %s", row->line - 1, i, qUtf8Printable(fields[i]));
    }
}

Reading failure(const QString &error) {
    return {{}, {}, 0, error};
}

Reading tooLarge() {
    return failure(Text::tr("it is larger than %1 MiB").arg(sizeLimit >> 20));
}

} // namespace

Reading parse(const QByteArray &text, const std::stop_token &stop) {
    if (text.size() > sizeLimit)
        return tooLarge();
    if (text.contains('\0'))
        return failure(Text::tr("it is no text file"));
    Rows rows(text);
    const std::optional<Row> header = rows.next();
    if (!header)
        return {};
    const Layout layout = isTooLong(*header)
                              ? Layout()
                              : layoutOf(fieldsOf(QString::fromUtf8(header->bytes)).value_or(QStringList()));
    Reader reader(layout);
    int count = 0;
    while (const std::optional<Row> row = rows.next()) {
        if (++count > rowLimit)
            return failure(Text::tr("it has more than %1 rows").arg(QLocale().toString(rowLimit)));
        if (stop.stop_requested())
            return {};
        reader.take(*row);
    }
    Reading &reading = reader.reading();
    if (reading.refusedCount > 0)
        qDebug("rows of the csv file that were refused: %d", reading.refusedCount);
    if (layout.isNamed)
        return reading;
    // A list that begins with a device at once would lose that one without a word.
    Reader first(layout);
    first.take(*header);
    if (!first.reading().devices.empty()) {
        ++reading.refusedCount;
        reading.refused.insert(reading.refused.begin(),
                               {header->line, Text::tr("The first line is read as the header.")});
    }
    return reading;
}

Reading readFile(const QString &path, const std::stop_token &stop) {
    QFile file(path);
    // Anything but a file, a pipe for one, may never come to an end.
    if (!QFileInfo(path).isFile())
        return failure(Text::tr("it is no file"));
    if (!file.open(QIODevice::ReadOnly))
        return failure(file.errorString());
    const QByteArray text = file.read(sizeLimit + 1);
    if (file.error() != QFileDevice::NoError)
        return failure(file.errorString());
    Reading reading = parse(text, stop);
    if (reading.error.isEmpty() && !stop.stop_requested())
        QThreadPool::globalInstance()->start([text] { logRows(text); });
    return reading;
}

QString writeTemplate(const QString &path) {
    QSaveFile file(path);
    const QByteArray text(exampleFile);
    if (!file.open(QIODevice::WriteOnly) || file.write(text) != text.size() || !file.commit())
        return file.errorString();
    return {};
}

} // namespace CsvDevices
