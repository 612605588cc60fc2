#include "devices/inventory/devicerecord.h"
#include "devices/inventory/sortableiptablewidgetitem.h"
#include "support/testmain.h"

#include <QTest>

#include <nlohmann/json.hpp>

namespace {

constexpr quint64 none = DeviceRecord::unknownKey;

/// JSON written with single quotes.
JSON json(QByteArray text) {
    return JSON::parse(text.replace('\'', '"').toStdString());
}

DeviceRecordPtr parsed(const JSON &members) {
    JSON value = {{"id", "DV000000000001"}};
    value.update(members);
    return DeviceRecords::parse(value);
}

} // namespace

class TestDeviceRecord : public QObject {
    Q_OBJECT

private slots:
    void columnText_data() {
        QTest::addColumn<QByteArray>("record");
        QTest::addColumn<int>("column");
        QTest::addColumn<QString>("expected");
        using Column = DeviceColumn;
        const std::tuple<const char *, Column, const char *> rows[] = {
            {"{'d_model':'NC-4210'}", Column::Model, "NC-4210"},
            {"{'d_model':''}", Column::Model, "--"},
            {"{'d_model':4210}", Column::Model, "--"},
            {"{'d_hostname':'%n%s%1<b>'}", Column::HostName, "%n%s%1<b>"},
            {"{'d_hostname':['a']}", Column::HostName, "--"},
            {"{'d_hostname':null}", Column::HostName, "--"},
            {"{'d_ip':'10.20.0.9'}", Column::Ip, "10.20.0.9"},
            {"{'d_ip':'not-an-address'}", Column::Ip, "--"},
            {"{'d_ip':168430090}", Column::Ip, "--"},
            {"{'d_mac':'00:1A:07:00:00:01'}", Column::Mac, "00:1A:07:00:00:01"},
            {"{'d_fw':'2.4.1'}", Column::Firmware, "2.4.1"},
            {"{'d_http':80}", Column::HttpPort, "80"},
            {"{'d_http':'80'}", Column::HttpPort, "80"},
            {"{'d_http':'http'}", Column::HttpPort, "--"},
            {"{'d_https':-1}", Column::HttpsPort, "--"},
            {"{'d_https':18446744073709551615}", Column::HttpsPort, "--"},
            {"{'https_enable':true}", Column::Https, "Enabled"},
            {"{'https_enable':1}", Column::Https, "Enabled"},
            {"{'https_enable':'on'}", Column::Https, "--"},
            {"{'ieee8021x_enable':false}", Column::Ieee8021x, "Disabled"},
            {"{'ieee8021x_enable':2}", Column::Ieee8021x, "--"},
            {"{'d_sdstatus':'readonly'}", Column::SdCardStatus, "Ready"},
            {"{'d_sdstatus':'detached'}", Column::SdCardStatus, "Detached"},
            {"{'d_sdstatus':'worn out'}", Column::SdCardStatus, "worn out"},
            {"{'d_sdusage':0}", Column::SdCardUsage, "0"},
            {"{'d_sdusage':'full'}", Column::SdCardUsage, "--"},
            {"{'d_dtime':'2026/01/15 09:00:00'}", Column::DateTime, "2026/01/15 09:00:00"},
            {"{'d_powerfreq':50.5}", Column::PowerFrequency, "--"},
            {"{'d_audio':'mute'}", Column::Audio, "Mute"},
            {"{'d_audio':'unmute'}", Column::Audio, "Unmute"},
            {"{'d_audio':true}", Column::Audio, "--"}};
        for (const auto &[record, column, expected] : rows)
            QTest::newRow(record) << QByteArray(record) << static_cast<int>(column)
                                  << QString::fromLatin1(expected);
    }
    void columnText() {
        QFETCH(QByteArray, record);
        QFETCH(int, column);
        QFETCH(QString, expected);
        const DeviceRecordPtr device = parsed(json(record));
        QCOMPARE(device->text(static_cast<DeviceColumn>(column)), expected);
        QCOMPARE(device->sortKey(static_cast<DeviceColumn>(column)) == none, expected == QLatin1String("--"));
        // One bad value spoils no other.
        for (int other = 1; other < deviceColumnCount; ++other) {
            if (other != column)
                QCOMPARE(device->text(static_cast<DeviceColumn>(other)), QStringLiteral("--"));
        }
    }

    void deviceClass() {
        QCOMPARE(parsed(json("{'d_svrtype':'Camera'}"))->deviceClass, DeviceClass::Camera);
        QCOMPARE(parsed(json("{'d_svrtype':'NVR'}"))->deviceClass, DeviceClass::Nvr);
        for (const char *other :
             {"{'d_svrtype':'Encoder'}", "{'d_svrtype':'camera'}", "{'d_svrtype':7}", "{}"})
            QCOMPARE(parsed(json(other))->deviceClass, DeviceClass::Others);
    }

    void sites_data() {
        QTest::addColumn<QByteArray>("siteid");
        QTest::addColumn<QString>("expected");
        const auto text = [](const JSON &siteid) { return QByteArray::fromStdString(siteid.dump()); };
        QTest::newRow("array") << text(json("['SR1','SR2']")) << "SR1 SR2";
        QTest::newRow("text with an array") << text(JSON("[\"SR1\",\"SR2\"]")) << "SR1 SR2";
        QTest::newRow("not all are texts") << text(json("['SR1',7,null,['x'],'SR2']")) << "SR1 SR2";
        QTest::newRow("text that is no array") << text(JSON("SR1")) << "";
        QTest::newRow("text that breaks off") << text(JSON("[\"SR1\"")) << "";
        QTest::newRow("object") << text(json("{'SR1':1}")) << "";
        QTest::newRow("null") << text(JSON()) << "";
        QTest::newRow("very deep text")
            << text(JSON(std::string(200000, '[') + std::string(200000, ']'))) << "";
    }
    void sites() {
        QFETCH(QByteArray, siteid);
        QTEST(parsed({{"siteid", JSON::parse(siteid.toStdString())}})->siteIds.join(u' '), "expected");
    }

    void identity_data() {
        QTest::addColumn<QByteArray>("record");
        QTest::addColumn<QString>("expected"); // empty: no record
        QTest::newRow("id") << QByteArray("{'id':'DV1','d_mac':'00:1a:07:00:00:01'}") << "DV1";
        QTest::newRow("no id yet") << QByteArray("{'id':'','d_mac':'00:1a:07:00:00:01'}") << "001A07000001";
        QTest::newRow("id of no text")
            << QByteArray("{'id':5,'d_mac':'00-1A-07-00-00-01'}") << "001A07000001";
        for (const char *bad :
             {"{'d_ip':'10.0.0.1'}", "{'id':5,'d_mac':7}", "{}", "[{'id':'DV1'}]", "'DV1'", "null"})
            QTest::newRow(bad) << QByteArray(bad) << "";
    }
    void identity() {
        QFETCH(QByteArray, record);
        QFETCH(QString, expected);
        const DeviceRecordPtr device = DeviceRecords::parse(json(record));
        QCOMPARE(DeviceRecords::identityOf(json(record)), expected);
        QCOMPARE(device ? device->id : QString(), expected);
    }

    void keepsTheWholeRecord() {
        JSON value = json("{'id':'DV1','d_http':'80','x_new':{'deep':[1,null,2.5]},'d_note':'S\xc3\xbc"
                          "d'}");
        value["d_model"] = std::string(10000, 'N');
        const DeviceRecordPtr device = DeviceRecords::parse(value);
        QCOMPARE(device->text(DeviceColumn::Model), QString(10000, u'N'));
        QVERIFY(JSON::parse(device->json()) == value);
    }

    void keepsTextsAsDifferences_data() {
        QTest::addColumn<QByteArray>("base");
        QTest::addColumn<QByteArray>("text");
        const QByteArray base = R"({"a":1,"b":"x","c":[1,2,3],"d":null})";
        for (const QByteArray &text :
             {base, QByteArray(R"({"a":2,"b":"x","c":[1,2,3],"d":0})"),
              QByteArray(R"({"a":1,"b":"x,y","c":[1]})"), QByteArray("{"), QByteArray(), QByteArray(",,,"),
              QByteArray(base + base), QByteArray(70000, ','), QByteArray(70000, 'x') + ",\x01\x80\xff"})
            QTest::addRow("%s", text.left(40).constData()) << base << text;
        QTest::newRow("no base") << QByteArray() << base;
    }
    void keepsTextsAsDifferences() {
        QFETCH(QByteArray, base);
        QFETCH(QByteArray, text);
        QCOMPARE(
            DeltaText(std::make_shared<const std::string>(base.toStdString()), text.toStdString()).text(),
            text.toStdString());
        QCOMPARE(DeltaText(nullptr, text.toStdString()).text(), text.toStdString());
    }

    void ipItemsCompareByNumbers() {
        const auto less = [](const char *left, const char *right) {
            return SortableIpTableWidgetItem(QString::fromLatin1(left)) <
                   SortableIpTableWidgetItem(QString::fromLatin1(right));
        };
        QVERIFY(less("10.0.0.9", "10.0.0.10"));
        QVERIFY(less("9.255.255.255", "10.0.0.0"));
        QVERIFY(!less("10.0.0.0", "9.255.255.255"));
        QVERIFY(!less("10.0.0.1", "10.0.0.1"));
        QVERIFY(less("255.255.255.255", "--"));
        QVERIFY(!less("--", "0.0.0.0"));
        QVERIFY(!less("abc", "--"));
    }
};

NVLDM_TEST(TestDeviceRecord)
#include "tst_devicerecord.moc"
