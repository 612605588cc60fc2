#include "devices/operations/assignip/ipassignment.h"
#include "support/devicemaker.h"
#include "support/testmain.h"

#include <QTest>

using AddressPattern::Limits;

class TestAddressPattern : public QObject {
    Q_OBJECT

private slots:
    void judgesAndCounts_data() {
        QTest::addColumn<QString>("text");
        QTest::addColumn<bool>("address");
        QTest::addColumn<bool>("pattern");
        QTest::addColumn<qint64>("count");
        QTest::newRow("address") << "192.168.1.10" << true << true << qint64(1);
        QTest::newRow("zeros count one each") << "0.0.0.0" << true << true << qint64(1);
        QTest::newRow("range") << "192.168.1.10-19" << false << true << qint64(10);
        QTest::newRow("any and range") << "192.168.*.1-2" << false << true << qint64(512);
        QTest::newRow("range that runs back") << "10.0.0.20-10" << false << true << qint64(11);
        QTest::newRow("everything") << "*.*.*.*" << false << true << qint64(4294967296);
        QTest::newRow("no byte") << "300.1.1.1" << false << true << qint64(1);
        QTest::newRow("two dashes") << "1-2-3.*.*.*" << false << false << qint64(0);
        QTest::newRow("open end") << "10.0.0.10-" << false << false << qint64(0);
        QTest::newRow("empty part") << "10..0.1" << false << false << qint64(1);
        QTest::newRow("leading zero") << "10.0.0.01" << false << true << qint64(1);
        QTest::newRow("line break") << "10.0.0.1\n" << false << false << qint64(1);
        QTest::newRow("no number") << "10.0.0.a-b" << false << false << qint64(0);
        QTest::newRow("too large a number") << "10.0.0.1-99999999999" << false << false << qint64(0);
        QTest::newRow("nothing") << "" << false << false << qint64(1);
    }
    void judgesAndCounts() {
        QFETCH(QString, text);
        QTEST(AddressPattern::isAddress(text), "address");
        QTEST(AddressPattern::isPattern(text), "pattern");
        QTEST(AddressPattern::count(text), "count");
    }

    void handsOutTheLowest_data() {
        QTest::addColumn<QString>("list");
        QTest::addColumn<int>("wanted");
        QTest::addColumn<QString>("expected");
        // The mask is /24, the gateway 10.0.0.1, and 10.0.0.3 is taken.
        QTest::newRow("without ends, gateway and taken") << "10.0.0.*" << 3 << "10.0.0.2 10.0.0.4 10.0.0.5";
        QTest::newRow("over the end of a net")
            << "10.0.0-1.253-255" << 4 << "10.0.0.253 10.0.0.254 10.0.1.253 10.0.1.254";
        QTest::newRow("lists in order, once each")
            << "10.0.0.9, 10.0.0.7;10.0.0.6-7" << 9 << "10.0.0.6 10.0.0.7 10.0.0.9";
        QTest::newRow("backwards") << "10.0.0.12-10" << 9 << "10.0.0.10 10.0.0.11 10.0.0.12";
        QTest::newRow("beyond a byte") << "10.0.0.254-300" << 9 << "10.0.0.254";
        QTest::newRow("no device's") << "300.1.1.1 0.0.0.5 127.0.0.1 224-255.0.0.1" << 9 << "";
        QTest::newRow("the lowest of all") << "*.*.*.*" << 2 << "1.0.0.1 1.0.0.2";
    }
    void handsOutTheLowest() {
        QFETCH(QString, list);
        QFETCH(int, wanted);
        const Limits limits{AddressPattern::numberOf("255.255.255.0"),
                            AddressPattern::numberOf("10.0.0.1"),
                            {AddressPattern::numberOf("10.0.0.3")}};
        QStringList found;
        for (const quint32 address :
             AddressPattern::lowest(AddressPattern::split(list), std::size_t(wanted), limits))
            found += AddressPattern::textOf(address);
        QTEST(found.join(' '), "expected");
    }

    void givesUpWherePatternsOfferNothing() {
        // Every one of 16 million addresses is that of a network.
        const Limits limits{AddressPattern::numberOf("255.255.255.0"), 0, {}};
        QCOMPARE(AddressPattern::lowest({"*.*.*.0"}, 1, limits).size(), std::size_t(0));
    }

    void assignsAndFindsWhatIsWrong() {
        std::vector<JSON> values;
        for (int i = 0; i < 5; ++i)
            values.push_back(DeviceMaker::record(i, {{"d_ip", "10.0.0." + std::to_string(10 + i)}}));
        values.push_back(DeviceMaker::record(5));
        const DeviceSnapshotPtr managed = DeviceMaker::snapshot(values);
        OperationTargets::List targets;
        for (const int place : {1, 2, 5})
            targets.push_back({managed->at(place), DeviceStatusCode::Authorized, {}});
        IpAssignment assignment(targets, *managed);
        IpAssignment::Network network{{"10.0.0.10-15"},
                                      AddressPattern::numberOf("255.255.255.0"),
                                      AddressPattern::numberOf("10.0.0.1")};
        const std::vector<int> all{0, 1, 2};
        const auto addresses = [&] {
            QStringList texts;
            for (const int item : all)
                texts += QString::number(assignment.address(item) & 255);
            return texts.join(' ');
        };
        // What the targets themselves have is free to be handed out; what the others have is not.
        QVERIFY(assignment.handOut(network, all));
        QCOMPARE(addresses(), QStringLiteral("11 12 15"));
        QVERIFY(assignment.conflicts(network, all).empty());
        // An address typed by hand stays, and is nobody else's.
        assignment.setTyped(2, AddressPattern::numberOf("10.0.0.11"));
        QVERIFY(assignment.handOut(network, all));
        QCOMPARE(addresses(), QStringLiteral("12 15 11"));
        QCOMPARE(assignment.waitingCount(all), 2);
        // A device that is left out keeps its address.
        QVERIFY(!assignment.handOut(network, {0, 2}) || (assignment.address(0) & 255) == 15);
        // Typed ones may clash with anything.
        assignment.setTyped(0, AddressPattern::numberOf("10.0.0.13"));
        assignment.setTyped(1, AddressPattern::numberOf("10.0.0.255"));
        assignment.setTyped(2, AddressPattern::numberOf("10.0.0.255"));
        QVERIFY(assignment.handOut(network, all));
        std::vector<std::vector<int>> found;
        for (const TargetWarning &warning : assignment.conflicts(network, all))
            found.push_back(warning.targets);
        QCOMPARE(found, (std::vector<std::vector<int>>{{1, 2}, {0}, {1, 2}}));
        network.gateway = AddressPattern::numberOf("10.0.1.1");
        QCOMPARE(assignment.doubts(network, all).at(0).targets, all);
        // There may be too few.
        assignment.setTyped(0, 0);
        network.patterns = QStringList{"10.0.0.10"};
        QVERIFY(!assignment.handOut(network, all));
        QCOMPARE(assignment.address(0), quint32(0));
    }
};

NVLDM_TEST(TestAddressPattern)
#include "tst_addresspattern.moc"
