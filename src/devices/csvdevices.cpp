#include "csvdevices.h"

#include <QCoreApplication>
#include <QDebug>
#include <QFileInfo>
#include <QHash>
#include <QRegularExpression>
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
    QByteArray bytes;
};

std::vector<Row> rowsOf(const QByteArray &text) {
    std::vector<Row> rows;
    qsizetype from = text.startsWith("\xEF\xBB\xBF") ? 3 : 0;
    for (int line = 1; from < text.size(); ++line) {
        const qsizetype end = text.indexOf('\n', from);
        const qsizetype to = end < 0 ? text.size() : end;
        QByteArray bytes = text.mid(from, to - from);
        if (bytes.endsWith('\r'))
            bytes.chop(1);
        if (!bytes.trimmed().isEmpty())
            rows.push_back({line, bytes});
        from = to + 1;
    }
    return rows;
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
    const quint64 key = DeviceRecords::ipSortKey(text);
    if (key == DeviceRecord::unknownKey)
        return {};
    return QStringLiteral("%1.%2.%3.%4")
        .arg(key >> 24)
        .arg(key >> 16 & 255)
        .arg(key >> 8 & 255)
        .arg(key & 255);
}

bool isMac(const QString &text) {
    static const QRegularExpression form(
        QStringLiteral("^(?:[0-9a-f]{2}([:-]?)[0-9a-f]{2}(?:\\1[0-9a-f]{2}){4}|"
                       "[0-9a-f]{4}\\.[0-9a-f]{4}\\.[0-9a-f]{4})$"),
        QRegularExpression::CaseInsensitiveOption);
    return form.match(text).hasMatch();
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
        if (!reason.isEmpty())
            m_reading.refused.push_back({row.line, std::move(reason)});
    }
    Reading &reading() { return m_reading; }

private:
    QString refusal(const Row &row) {
        const QString text = QString::fromUtf8(row.bytes);
        if (text.contains(QChar::ReplacementCharacter))
            return Text::tr("The row is not UTF-8 text.");
        const std::optional<QStringList> fields = fieldsOf(text);
        if (!fields)
            return Text::tr("A quotation mark is not closed.");
        if (fields->size() != m_layout.columns) {
            qDebug("invalid column number in csv file");
            return Text::tr("The row has %n column(s) in place of %1.", nullptr,
                            static_cast<int>(fields->size()))
                .arg(m_layout.columns);
        }
        return refusal(*fields, row.line);
    }

    QString refusal(const QStringList &fields, int line) {
        const auto value = [&](Field field) { return fields[m_layout.places[field]]; };
        for (const Field field : {HttpPort, HttpsPort}) {
            if (!portOf(value(field)))
                return Text::tr("\"%1\" is no port from 1 to 65535.").arg(quoted(value(field)));
        }
        const QString ip = addressOf(value(Ip));
        if (ip.isEmpty())
            return Text::tr("\"%1\" is no IPv4 address.").arg(quoted(value(Ip)));
        if (!isMac(value(Mac)))
            return Text::tr("\"%1\" is no MAC address.").arg(quoted(value(Mac)));
        static const JSON blank = JSON::parse(recordTemplate);
        JSON record = blank;
        record["d_http"] = *portOf(value(HttpPort));
        record["d_https"] = *portOf(value(HttpsPort));
        record["d_ip"] = ip.toStdString();
        record["d_mac"] = value(Mac).toStdString();
        record["d_model"] = value(Model).simplified().toStdString();
        const DeviceRecordPtr device = DeviceRecords::parse(record);
        const int first = m_lines.value(device->id, line);
        m_lines.insert(device->id, first);
        if (first != line)
            return Text::tr("The MAC address \"%1\" stands in line %2 already.")
                .arg(value(Mac), QString::number(first));
        m_reading.devices.push_back(device);
        return {};
    }

    Layout m_layout;
    Reading m_reading;
    QHash<QString, int> m_lines; ///< of the devices, by their identities
};

void logRows(const QByteArray &text) {
    for (const Row &row : rowsOf(text)) {
        if (row.line == 1 || QCoreApplication::closingDown())
            continue;
        qDebug("row data at row %d: %s", row.line - 1, row.bytes.constData());
        const QStringList fields = fieldsOf(QString::fromUtf8(row.bytes)).value_or(QStringList());
        qDebug("column data size: %d", static_cast<int>(fields.size()));
        for (int i = 0; i < fields.size(); ++i)
            qDebug("column data (%d, %d): %s", row.line - 1, i, qUtf8Printable(fields[i]));
    }
}

Reading failure(const QString &error) {
    return {{}, {}, error};
}

Reading tooLarge() {
    return failure(Text::tr("it is larger than %1 MiB").arg(sizeLimit >> 20));
}

} // namespace

Reading parse(const QByteArray &text) {
    if (text.size() > sizeLimit)
        return tooLarge();
    if (text.contains('\0'))
        return failure(Text::tr("it is no text file"));
    const std::vector<Row> rows = rowsOf(text);
    if (rows.empty())
        return {};
    const Layout layout = layoutOf(fieldsOf(QString::fromUtf8(rows.front().bytes)).value_or(QStringList()));
    Reader reader(layout);
    for (std::size_t i = 1; i < rows.size(); ++i)
        reader.take(rows[i]);
    Reading &reading = reader.reading();
    if (layout.isNamed)
        return reading;
    // A list that begins with a device at once would lose that one without a word.
    Reader first(layout);
    first.take(rows.front());
    if (!first.reading().devices.empty())
        reading.refused.insert(reading.refused.begin(),
                               {rows.front().line, Text::tr("The first line is read as the header.")});
    return reading;
}

Reading readFile(const QString &path) {
    QFile file(path);
    // Anything but a file, a pipe for one, may never come to an end.
    if (!QFileInfo(path).isFile())
        return failure(Text::tr("it is no file"));
    if (!file.open(QIODevice::ReadOnly))
        return failure(file.errorString());
    const QByteArray text = file.read(sizeLimit + 1);
    if (file.error() != QFileDevice::NoError)
        return failure(file.errorString());
    Reading reading = parse(text);
    if (reading.error.isEmpty())
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
