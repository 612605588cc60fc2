#include "devices/inventory/deviceorder.h"
#include "devices/sites/sitelist.h"
#include "support/devicemaker.h"
#include "support/testmain.h"

#include <QTest>

namespace {

QString arranged(const DeviceInventory &inventory, const DeviceFilter &filter, const DeviceSort &sort) {
    QString places;
    for (const int place : DeviceOrder::arrange(inventory, filter, sort))
        places += QString::number(place);
    return places;
}

const DeviceFilter allCameras{DeviceClass::Camera, Sites::overviewId};

} // namespace

class TestDeviceOrder : public QObject {
    Q_OBJECT

private slots:
    void sort_data() {
        QTest::addColumn<int>("column");
        QTest::addColumn<QByteArray>("values"); // in the service's order
        QTest::addColumn<QString>("ascending"); // their places
        QTest::addColumn<QString>("descending");
        using Column = DeviceColumn;
        const std::tuple<const char *, Column, const char *, const char *, const char *> rows[] = {
            {"d_ip", Column::Ip, "['10.0.0.10','x','9.255.255.255',null,'10.0.0.9','10.0.0.10']", "240513",
             "054213"},
            {"d_mac", Column::Mac, "['00:1B:00:00:00:00',null,'00-1A-FF-00-00-00','001a.0000.0001']", "3201",
             "0231"},
            {"d_fw", Column::Firmware, "['2.10.0','2.4.1',null,'1.9.12','2.4.1']", "31402", "01432"},
            {"d_http", Column::HttpPort, "[8080,80,null,443,'9']", "41302", "03142"},
            {"d_https", Column::HttpsPort, "[8443,443,-1]", "102", "012"},
            {"d_sdusage", Column::SdCardUsage, "[9,100,null,0,20]", "30412", "14032"},
            {"d_dtime", Column::DateTime, "[null,'2026/01/15 09:00:00','2025/12/31 23:59:59']", "210", "120"},
            {"d_powerfreq", Column::PowerFrequency, "[60,50,null,60]", "1032", "0312"},
            {"https_enable", Column::Https, "[true,false,null,true]", "1032", "0312"},
            {"ieee8021x_enable", Column::Ieee8021x, "[null,true,false]", "210", "120"},
            {"d_audio", Column::Audio, "['unmute',null,'mute']", "201", "021"},
            {"d_sdstatus", Column::SdCardStatus, "['ready',null,'Empty']", "201", "021"},
            {"d_model", Column::Model, "['nc-b','NC-A',null,'NC-C','nc-a']", "14032", "30142"},
            {"d_hostname", Column::HostName, "['hall-03','hall-01','hall-02']", "120", "021"}};
        for (const auto &[member, column, values, ascending, descending] : rows)
            QTest::newRow(member) << static_cast<int>(column) << QByteArray(values)
                                  << QString::fromLatin1(ascending) << QString::fromLatin1(descending);
    }
    void sort() {
        QFETCH(int, column);
        QFETCH(QByteArray, values);
        std::vector<JSON> records;
        for (const JSON &value : JSON::parse(values.replace('\'', '"').toStdString()))
            records.push_back(
                DeviceMaker::record(static_cast<int>(records.size()), {{QTest::currentDataTag(), value}}));
        DeviceInventory inventory;
        inventory.replace(DeviceMaker::snapshot(records), {});
        QTEST(arranged(inventory, allCameras, {column, Qt::AscendingOrder}), "ascending");
        QTEST(arranged(inventory, allCameras, {column, Qt::DescendingOrder}), "descending");
    }

    void sortByStatus() {
        DeviceInventory inventory;
        inventory.replace(DeviceMaker::snapshot(DeviceMaker::cameras(0, 4)),
                          {DeviceStatusCode::Unreachable, DeviceStatusCode::Unauthorized,
                           DeviceStatusCode::Unreachable, DeviceStatusCode::Authorized});
        QCOMPARE(arranged(inventory, allCameras, {0, Qt::AscendingOrder}), QStringLiteral("1302"));
        QCOMPARE(arranged(inventory, allCameras, {0, Qt::DescendingOrder}), QStringLiteral("0231"));
        QCOMPARE(arranged(inventory, allCameras, {}), QStringLiteral("0123"));
    }

    void filter() {
        DeviceInventory inventory;
        inventory.replace(
            DeviceMaker::snapshot({DeviceMaker::record(0, {{"siteid", {"SR1"}}}),
                                   DeviceMaker::record(1, {{"d_svrtype", "NVR"}, {"siteid", {"SR2", "SR1"}}}),
                                   DeviceMaker::record(2, {{"siteid", {"SR11"}}}),
                                   DeviceMaker::record(3, {{"siteid", {"SR1", "SR2"}}}),
                                   DeviceMaker::record(4, {{"d_svrtype", "Encoder"}})}),
            {});
        QCOMPARE(arranged(inventory, allCameras, {}), QStringLiteral("023"));
        QCOMPARE(arranged(inventory, {DeviceClass::Others, Sites::overviewId}, {}), QStringLiteral("4"));
        QCOMPARE(arranged(inventory, {DeviceClass::Camera, "SR1"}, {}), QStringLiteral("03"));
        QCOMPARE(arranged(inventory, {DeviceClass::Nvr, "SR1"}, {}), QStringLiteral("1"));
        QCOMPARE(arranged(inventory, {DeviceClass::Camera, "SR"}, {}), QString());
    }
};

NVLDM_APPLESS_TEST(TestDeviceOrder)
#include "tst_deviceorder.moc"
