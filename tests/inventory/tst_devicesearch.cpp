#include "devices/inventory/deviceexport.h"
#include "devices/inventory/devicesearch.h"
#include "support/testmain.h"

#include <QTemporaryDir>
#include <QTest>

#include <nlohmann/json.hpp>

namespace {

DeviceRecordPtr gate() {
    return DeviceRecords::parse({{"id", "DV1"},
                                 {"d_mac", "00:1A:07:10:04:0B"},
                                 {"d_ip", "10.4.0.11"},
                                 {"d_model", "NC-9381"},
                                 {"d_hostname", "gate-east 10.4.0.5-cam"},
                                 {"d_fw", "2.4.1"},
                                 {"d_http", 80},
                                 {"d_https", "443"},
                                 {"d_nettype", "dhcp"},
                                 {"siteid", {"DO000000000000", "SR1"}}});
}

} // namespace

/// What the search box finds, and what an exported list says.
class TestDeviceSearch : public QObject {
    Q_OBJECT

private slots:
    void finds_data() {
        QTest::addColumn<QString>("text");
        QTest::addColumn<bool>("found");
        const std::pair<const char *, bool> rows[] = {
            {"", true},
            {"GATE", true},
            {"nc-93 gate", true},
            {"nc-42 gate", false},
            {"2.4.1", true},
            {"10.4.0.1", true},
            {"10.4.0.0/24", true},
            {"10.4.1.0/24", false},
            {"0.0.0.0/0", true},
            {"10.4.0.11/33", false},
            {"10.4.0.10-12", true},
            {"10.4.0.12-20", false},
            {"10.4.0.9-10.4.2.1", true},
            {"10.4.2.1-10.4.0.9", false},
            {"10.4.0.5-cam", true},
            {"10.4.0.6-cam", false},
            {"10.4.0.9-", false},
            {"10.4.0.5-", true},
            {"10.4.0.5-cam/24", false},
            {"001a0710", true},
            {"1a-07-10", true},
            {"00.1a.07", true},
            {"1a-08", false},
            {"head", true},
            {"warehouse", false},
            {"%1 (.*", false},
        };
        for (const auto &[text, found] : rows)
            QTest::newRow(text) << QString(text) << found;
    }
    void finds() {
        QFETCH(QString, text);
        QTEST(DeviceSearch(text, {{"SR1", "Headquarters"}, {"SR2", "Warehouse"}}).matches(*gate()), "found");
    }

    void deviceWithoutAddressIsInNoNetwork() {
        const DeviceRecordPtr odd = DeviceRecords::parse({{"id", "DV2"}, {"d_ip", 7}});
        QVERIFY(!DeviceSearch("0.0.0.0/0", {}).matches(*odd));
        QVERIFY(!DeviceSearch("ff", {}).matches(*odd));
    }

    void exportedLines() {
        const DeviceSnapshot devices(
            {gate(),
             DeviceRecords::parse(
                 {{"id", "DV2"}, {"d_ip", "odd"}, {"d_hostname", "a,b\r\nc"}, {"d_nettype", "=a  b"}})});
        QCOMPARE(
            DeviceExport::text(devices, {1, 0}),
            QByteArray(
                "Brand,Host name,IP,HTTP port,HTTPS port,Network type,Model name,MAC,Firmware version\n"
                "Norvell,a,b c,odd,,,'=a  b,,,\n"
                "Norvell,gate-east 10.4.0.5-cam,10.4.0.11,80,443,dhcp,NC-9381,00:1A:07:10:04:0B,2.4.1\n"));
        QVERIFY(!DeviceExport::text(devices, {}).contains("Norvell"));
    }

    void failedExportLeavesTheOldFile() {
        const QTemporaryDir folder;
        const QString path = folder.filePath("list.csv");
        const DeviceSnapshot devices({gate()});
        QCOMPARE(DeviceExport::write(path, devices, {0}), QString());
        QFile file(path);
        QVERIFY(file.open(QIODevice::ReadOnly));
        QCOMPARE(file.readAll().count('\n'), 2);
        QVERIFY(!DeviceExport::write(folder.filePath("missing/list.csv"), devices, {0}).isEmpty());
        QCOMPARE(QDir(folder.path()).entryList(QDir::Files), QStringList{"list.csv"});
    }
};

NVLDM_GUILESS_TEST(TestDeviceSearch)
#include "tst_devicesearch.moc"
