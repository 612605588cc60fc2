#include "devices/discovery/csvdevices.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"

#include <QElapsedTimer>
#include <QTest>

#include <nlohmann/json.hpp>

namespace {

const QByteArray header = "HTTP Port,HTTPS Port,IP,MAC,Model\n";
const QByteArray row = "80,443,10.0.0.1,00:11:22:33:44:55,N-1";

/// The devices as "http https ip mac model", with a bar between two.
QString shown(const CsvDevices::Reading &reading) {
    QStringList devices;
    for (const DeviceRecordPtr &device : reading.devices) {
        const JSON record = JSON::parse(device->json());
        devices += QStringList{QString::number(record["d_http"].get<int>()),
                               QString::number(record["d_https"].get<int>()), stringMember(record, "d_ip"),
                               stringMember(record, "d_mac"), stringMember(record, "d_model")}
                       .join(' ');
    }
    return devices.join('|');
}

} // namespace

class TestCsvDevices : public QObject {
    Q_OBJECT

private slots:
    void goodFiles_data() {
        QTest::addColumn<QByteArray>("text");
        QTest::addColumn<QString>("devices");
        const auto file = [](const char *name, const QByteArray &text, const char *devices) {
            QTest::newRow(name) << text << QString::fromUtf8(devices);
        };
        const char *one = "80 443 10.0.0.1 00:11:22:33:44:55 N-1";
        file("empty", "", "");
        file("header alone", header, "");
        file("header without line end", header.trimmed(), "");
        file("one device", header + row, one);
        file("CRLF and blank lines", header + "\r\n" + row + "\r\n\r\n  \r\n", one);
        file("byte order mark, other order",
             "\xEF\xBB\xBFmac,MODEL,HTTP port,HTTPS Port,IP\n00:11:22:33:44:55,N-1,80,443,10.0.0.1", one);
        file("columns beside the five",
             "Brand,ip,HTTP_PORT,https port,Model name,mac\nX,10.0.0.1,80,443,N-1,00:11:22:33:44:55", one);
        file("unknown header", "a,b,c,d,e\n" + row, one);
        file("quoted", header + "\"80\", \"443\" ,\"10.0.0.1\",\"00:11:22:33:44:55\",\"N \"\"1\"\", big\"",
             "80 443 10.0.0.1 00:11:22:33:44:55 N \"1\", big");
        file("UTF-8", header + "80,443,10.0.0.1,0011.2233.4455,Kamera \xC3\xA4",
             "80 443 10.0.0.1 0011.2233.4455 Kamera \xC3\xA4");
        file("leading zeros", header + "80,443,010.000.0.09,001122334455,", "80 443 10.0.0.9 001122334455 ");
    }
    void goodFiles() {
        QFETCH(QByteArray, text);
        const CsvDevices::Reading reading = CsvDevices::parse(text);
        QVERIFY(reading.error.isEmpty() && reading.refused.empty());
        QTEST(shown(reading), "devices");
    }

    void badRows_data() {
        QTest::addColumn<QByteArray>("bad");
        QTest::addColumn<QString>("reason");
        const std::pair<const char *, const char *> rows[] = {
            {"80,443,10.0.0.2", "The row has 3 column(s) in place of 5."},
            {"80,443,10.0.0.2,001122334466,N,more", "The row has 6 column(s) in place of 5."},
            {"0,443,10.0.0.2,001122334466,N", "\"0\" is no port from 1 to 65535."},
            {"80,65536,10.0.0.2,001122334466,N", "\"65536\" is no port from 1 to 65535."},
            {",443,10.0.0.2,001122334466,N", "\"\" is no port from 1 to 65535."},
            {"80,443,10.0.0.256,001122334466,N", "\"10.0.0.256\" is no IPv4 address."},
            {"80,443,camera,001122334466,N", "\"camera\" is no IPv4 address."},
            {"80,443,10.0.0.2,00:11:22:33:44,N", "\"00:11:22:33:44\" is no MAC address."},
            {"80,443,10.0.0.2,00:11:22:33:44:66:77,N", "\"00:11:22:33:44:66:77\" is no MAC address."},
            {"80,443,10.0.0.2,001122334455,N", "The MAC address \"001122334455\" stands in line 2 already."},
            {"80,443,10.0.0.2,001122334466,\"N", "A quotation mark is not closed."},
            {"80,443,10.0.0.2,001122334466,\xE4", "The row is not UTF-8 text."}};
        for (const auto &[bad, reason] : rows)
            QTest::newRow(bad) << QByteArray(bad) << QString(reason);
    }
    void badRows() {
        QFETCH(QByteArray, bad);
        const CsvDevices::Reading reading =
            CsvDevices::parse(header + row + '\n' + bad + "\n80,443,10.0.0.3,00:11:22:33:44:BB,B\n");
        QCOMPARE(reading.refused.size(), 1u);
        QCOMPARE(reading.refused[0].line, 3);
        QTEST(reading.refused[0].reason, "reason");
        QCOMPARE(reading.devices.size(), 2u);
    }

    void wholeFilesAreRefused() {
        QCOMPARE(CsvDevices::parse(header + '\0').error, QStringLiteral("it is no text file"));
        QCOMPARE(CsvDevices::parse(QByteArray(CsvDevices::sizeLimit + 1, 'a')).error,
                 QStringLiteral("it is larger than 64 MiB"));
        QVERIFY(!CsvDevices::readFile(m_root.filePath("missing.csv")).error.isEmpty());
        // A device in the place of the header is told, not lost.
        QCOMPARE(CsvDevices::parse(row).refused.size(), 1u);
    }

    void recordsAreAsTheServiceTakesThem() {
        const CsvDevices::Reading reading = CsvDevices::parse(header + row.chopped(3) + "\"\"\"\\\"");
        const JSON record = JSON::parse(reading.devices.at(0)->json());
        QCOMPARE(record.size(), 17u);
        QCOMPARE(record["d_model"].get<std::string>().c_str(), "\"\\");
        QCOMPARE(record["siteid"].get<std::string>().c_str(), "[\"DO000000000000\"]");
        QVERIFY(record["id"] == "" && record["d_cport"] == 0 && record["d_svrtype"] == "");
    }

    void templateCanBeReadAndIsLogged() {
        const LogCapture log;
        const QString path = m_root.filePath("example.csv");
        QCOMPARE(CsvDevices::writeTemplate(path), QString());
        QCOMPARE(shown(CsvDevices::readFile(path)), "80 443 192.0.2.10 00-00-5E-00-53-01 Example Camera");
        QTRY_COMPARE(log.count("column data (1, 4): 443"), 1);
        QCOMPARE(log.count("row data at row 1: Example Camera,192.0.2.10,"), 1);
        QVERIFY(!CsvDevices::writeTemplate(m_root.filePath("missing/example.csv")).isEmpty());
    }

    void hostileFilesCostLittle() {
        // Rows of nothing but separators, short ones by the thousand, and one that is the whole file.
        const CsvDevices::Reading rows =
            CsvDevices::parse(header + QByteArray(QByteArray(79, ',') + '\n').repeated(CsvDevices::rowLimit));
        QCOMPARE(rows.refusedCount, CsvDevices::rowLimit);
        QCOMPARE(rows.refused.size(), CsvDevices::maxRefusedKept);
        QCOMPARE(CsvDevices::parse(header + QByteArray("x\n").repeated(CsvDevices::rowLimit + 1)).error,
                 QStringLiteral("it has more than 100,000 rows"));
        const CsvDevices::Reading one = CsvDevices::parse(header + QByteArray(8 << 20, ','));
        QCOMPARE(one.refused.at(0).reason, QStringLiteral("The row is longer than 8192 characters."));
        QVERIFY(CsvDevices::parse(QByteArray(8 << 20, ',') + '\n' + row).refused.empty());
        std::stop_source stop;
        stop.request_stop();
        QVERIFY(CsvDevices::parse(header + row, stop.get_token()).devices.empty());

        const LogCapture log;
        QFile file(m_root.filePath("rows.csv"));
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(header + QByteArray("a,b\n").repeated(50000));
        file.close();
        CsvDevices::readFile(file.fileName());
        QTRY_COMPARE(log.count("The csv file has more rows, which are not logged"), 1);
        QCOMPARE(log.count("row data at row"), 1000);
        QCOMPARE(log.count("invalid column number in csv file"), 1000);
    }

    void manyRowsAreQuick() {
        QByteArray text = header;
        for (int i = 0; i < 50000; ++i)
            text += "80,443,10.1.1.1,0000" + QByteArray::number(0x10000000 + i, 16) + ",N-1\n";
        QElapsedTimer timer;
        timer.start();
        QCOMPARE(CsvDevices::parse(text).devices.size(), 50000u);
        QVERIFY2(timer.elapsed() < 10000, qPrintable(QString::number(timer.elapsed())));
    }

private:
    IsolatedRoot m_root;
};

NVLDM_GUILESS_TEST(TestCsvDevices)
#include "tst_csvdevices.moc"
