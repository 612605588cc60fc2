#include "devices/sites/sitelist.h"
#include "support/devicemaker.h"
#include "support/testmain.h"

#include <QTest>

class TestDeviceInventory : public QObject {
    Q_OBJECT

private slots:
    void countsBySite() {
        const DeviceSnapshotPtr devices =
            DeviceMaker::snapshot({DeviceMaker::record(0, {{"siteid", {"SR1", "SR2"}}}),
                                   DeviceMaker::record(1, {{"siteid", {"SR1"}}}), DeviceMaker::record(2)});
        QCOMPARE(devices->siteCount("SR1"), 2);
        QCOMPARE(devices->siteCount("SR2"), 1);
        QCOMPARE(devices->siteCount("SR3"), 0);
        QCOMPARE(devices->siteCount(Sites::overviewId), 3);
    }

    void lastOfDuplicatesCounts() {
        const DeviceSnapshotPtr devices = DeviceMaker::snapshot(
            {DeviceMaker::record(1, {{"d_model", "old"}, {"siteid", {"SR1"}}}), DeviceMaker::record(2),
             DeviceMaker::record(1, {{"d_model", "new"}, {"siteid", {"SR2"}}})});
        QCOMPARE(devices->size(), 2);
        QCOMPARE(devices->indexOf(QStringLiteral("DV1")), 0);
        QCOMPARE(devices->indexOf(QStringLiteral("DV2")), 1);
        QCOMPARE(devices->indexOf(QStringLiteral("DV3")), -1);
        QCOMPARE(devices->at(0)->text(DeviceColumn::Model), QStringLiteral("new"));
        QCOMPARE(devices->siteCount("SR1"), 0);
        QCOMPARE(devices->siteCount("SR2"), 1);
    }

    void takesStatesOfItsOwnReadingOnly() {
        DeviceInventory inventory;
        const DeviceSnapshotPtr older = DeviceMaker::snapshot(DeviceMaker::cameras(0, 3));
        inventory.replace(older, {});
        QVERIFY(inventory.apply({older, {{1, DeviceStatusCode::Authorized}}, {}}));
        QCOMPARE(inventory.status(1), DeviceStatusCode::Authorized);
        QCOMPARE(inventory.status(0), DeviceStatusCode::Unauthorized);

        inventory.replace(DeviceMaker::snapshot(DeviceMaker::cameras(1, 2)), {DeviceStatusCode::SetPassword});
        QVERIFY(!inventory.apply({older, {{2, DeviceStatusCode::Unreachable}}, {}}));
        QVERIFY(!inventory.apply({older, {{0, DeviceStatusCode::Unreachable}}, {}}));
        QCOMPARE(inventory.status(0), DeviceStatusCode::SetPassword);
    }

    void statesAreOneADevice() {
        DeviceInventory inventory;
        inventory.replace(DeviceMaker::snapshot(DeviceMaker::cameras(0, 3)), {DeviceStatusCode::Authorized});
        QCOMPARE(inventory.statuses().size(), std::size_t(3));
        QCOMPARE(inventory.status(0), DeviceStatusCode::Authorized);
        QCOMPARE(inventory.status(2), DeviceStatusCode::Unauthorized);
    }
};

NVLDM_APPLESS_TEST(TestDeviceInventory)
#include "tst_deviceinventory.moc"
