#include "api/client/apiclient.h"
#include "devices/discovery/adddevicedialog.h"
#include "devices/discovery/adddevicemanualdialog.h"
#include "devices/discovery/discoveredmodel.h"
#include "devices/discovery/invaliddevicedialog.h"
#include "store/storewriter.h"
#include "support/devicemaker.h"
#include "support/logcapture.h"
#include "support/signedinservice.h"
#include "support/testmain.h"
#include "widgets/controls/iplineedit.h"
#include "widgets/lists/checktable.h"

#include <QCheckBox>
#include <QClipboard>
#include <QLabel>
#include <QPointer>
#include <QPushButton>
#include <QSignalSpy>
#include <QTabWidget>
#include <QTableWidget>
#include <QTest>

#include <nlohmann/json.hpp>

namespace {

/// A search takes five seconds.
constexpr int patienceMs = 12000;

} // namespace

class TestAddDeviceDialog : public QObject {
    Q_OBJECT

private slots:
    void cleanup() {
        delete m_dialog;
        CLocalStore::instance().clearLoginInfo();
        QVERIFY(NetTask::waitForAll(patienceMs));
        m_service.process().kill();
    }

    void addressesAreTypedAndPasted() {
        IPLineEdit edit;
        QSignalSpy validity(&edit, &IPLineEdit::validityChanged);
        QTest::keyClicks(&edit, "10.a0.2569");
        QCOMPARE(edit.text(), QStringLiteral("10.0.25"));
        QVERIFY(edit.address().isEmpty());
        QVERIFY(!edit.isValid());
        edit.clear();
        QGuiApplication::clipboard()->setText(" 10. 0.25.01\t");
        edit.paste();
        QCOMPARE(edit.address(), QStringLiteral("10.0.25.1"));
        QCOMPARE(validity.size(), 1);
        edit.setText("10.0.25.");
        QCOMPARE(validity.size(), 2);
        QVERIFY(!validity[1][0].toBool());
    }

    void rangesAreJudged_data() {
        QTest::addColumn<QString>("from");
        QTest::addColumn<QString>("to");
        QTest::addColumn<QString>("size");
        QTest::addColumn<QString>("warning"); // a part of it; empty where the range is taken
        const auto range = [](const char *from, const char *to, const char *size, const char *warning) {
            QTest::addRow("%s-%s", from, to) << from << to << size << warning;
        };
        range("10.0.0.1", "10.0.0.1", "1 address", "");
        range("10.0.0.1", "10.0.0.254", "254 addresses", "");
        range("10.0.0.0", "10.0.255.255", "65,536 addresses", "");
        range("10.0.0.0", "10.1.0.0", "65,537 addresses", "65,536 are the most");
        range("0.0.0.0", "255.255.255.255", "4,294,967,296 addresses", "65,536 are the most");
        range("10.0.0.2", "10.0.0.1", "", "ends before it begins");
        range("10.0.0.2", "", "", "The field can't be empty.");
        range("10.0.0.2", "10.0.0", "", "four numbers");
    }
    void rangesAreJudged() {
        QFETCH(QString, from);
        QFETCH(QString, to);
        QFETCH(QString, warning);
        AddDeviceManualDialog dialog;
        dialog.show();
        QSignalSpy requests(&dialog, &AddDeviceManualDialog::discoveryRequested);
        dialog.findChild<QTabWidget *>("manualTabs")->setCurrentIndex(1);
        QTest::keyClicks(dialog.findChild<QLineEdit *>("fromEdit"), from);
        QTest::keyClicks(dialog.findChild<QLineEdit *>("toEdit"), to);
        QTEST(dialog.findChild<QLabel *>("rangeLabel")->text(), "size");
        QTest::mouseClick(dialog.findChild<QPushButton *>("addButton"), Qt::LeftButton);
        const QString told = dialog.findChild<QLabel *>("msgWarningLabel")->text();
        QVERIFY2(warning.isEmpty() ? told.isEmpty() : told.contains(warning), qPrintable(told));
        QCOMPARE(requests.size(), warning.isEmpty() ? 1 : 0);
        QCOMPARE(dialog.isVisible(), !warning.isEmpty());
    }

    void listKnowsDevicesByTheirMac() {
        const auto devices = [](const std::vector<std::pair<int, const char *>> &list) {
            std::vector<DeviceRecordPtr> records;
            for (const auto &[last, mac] : list)
                records.push_back(DeviceRecords::parse(
                    {{"d_mac", mac}, {"d_ip", "10.0.0." + std::to_string(last)}, {"d_model", "<b>N</b>"}}));
            return records;
        };
        DiscoveredModel model;
        model.setManaged(*DeviceMaker::snapshot({DeviceMaker::record(1, {{"d_mac", "AA:BB:CC:DD:EE:01"}})}));
        const auto found =
            model.add(devices({{100, "aabbccddee01"}, {100, "aa-bb-cc-dd-ee-02"}, {20, "AABBCCDDEE03"}}),
                      DeviceSource::Network);
        QVERIFY(found.taken == 2 && found.known == 1 && found.withoutMac == 0);
        JSON unnamed = {{"id", "DV9"}, {"d_mac", "none"}};
        std::vector<DeviceRecordPtr> more = devices({{9, "AA BB CC DD EE 02"}, {9, "aabb.ccdd.ee04"}});
        more.push_back(DeviceRecords::parse(unnamed));
        unnamed.erase("d_mac");
        more.push_back(DeviceRecords::parse(unnamed));
        const auto others = model.add(more, DeviceSource::File);
        QVERIFY(others.taken == 1 && others.known == 1 && others.withoutMac == 2);
        const auto addresses = [&model] {
            QStringList texts;
            for (int row = 0; row < model.rowCount(); ++row)
                texts += model.index(row, DiscoveredModel::IpColumn).data().toString();
            return texts;
        };
        QCOMPARE(addresses(), (QStringList{"10.0.0.9", "10.0.0.20", "10.0.0.100"}));
        const QPersistentModelIndex kept = model.index(0, 0);
        QVERIFY(model.setData(kept, Qt::Checked, Qt::CheckStateRole));
        model.sort(DiscoveredModel::IpColumn, Qt::DescendingOrder);
        QCOMPARE(kept.row(), 2);
        model.setSearch("10.0.0.100");
        QCOMPARE(model.shownState(), Qt::Unchecked);
        model.setShownChecked(true);
        QCOMPARE(model.shownState(), Qt::Checked);
        model.setSearch({});
        QCOMPARE(model.shownState(), Qt::PartiallyChecked);
        QCOMPARE(model.checkedDevices().size(), 2u);
        // Somebody adds a device that is listed: the marks stay with the others.
        const DeviceSnapshotPtr managed = DeviceMaker::snapshot(
            {DeviceMaker::record(1, {{"d_mac", "aabbccddee01"}}),
             DeviceMaker::record(
                 2, {{"d_mac", model.checkedDevices()[0]->text(DeviceColumn::Mac).toStdString()}})});
        const DeviceRecordPtr other = model.checkedDevices()[1];
        QCOMPARE(model.setManaged(*managed), 1);
        QVERIFY(model.checkedDevices() == std::vector<DeviceRecordPtr>{other});
        QCOMPARE(model.rowCount(), 2);
        QCOMPARE(model.setManaged(*managed), 0);
        QCOMPARE(model.checkedCount(), 1);
    }

    void foundDevicesAreAdded() {
        workOn({});
        const LogCapture log;
        QSignalSpy added(m_dialog, &AddDeviceDialog::devicesAdded);
        button("refreshButton")->click();
        QVERIFY(text("waitLabel").startsWith("Searching... 0 of 5"));
        QTRY_VERIFY_WITH_TIMEOUT(text("waitLabel").startsWith("Searching... 3 of 5"), patienceMs);
        QTRY_COMPARE_WITH_TIMEOUT(table()->model()->rowCount(), 40, patienceMs);
        // Opened and refreshed: two searches with a reading each, and no device twice.
        QTRY_COMPARE_WITH_TIMEOUT(log.count("Found jNewDevices(45): ["), 2, patienceMs);
        QTRY_VERIFY(text("waitLabel").isEmpty());
        QCOMPARE(table()->model()->rowCount(), 40);
        QCOMPARE(text("countLabel"), QStringLiteral("0 of 40 devices selected"));
        QVERIFY(!button("addButton")->isEnabled());

        auto *search = m_dialog->findChild<QLineEdit *>("searchEdit");
        QTest::keyClicks(search, "10.99.0.10-12");
        QCOMPARE(table()->model()->rowCount(), 3);
        m_dialog->findChild<QCheckBox *>("selectAllCheckBox")->click();
        QTest::mouseClick(table()->viewport(), Qt::LeftButton, {}, QPoint(16, 36 + 18));
        QCOMPARE(text("countLabel"), QStringLiteral("2 of 40 devices selected"));
        QTest::keyClick(table(), Qt::Key_Space);
        QCOMPARE(text("countLabel"), QStringLiteral("3 of 40 devices selected"));
        search->setText("nothing");
        QCOMPARE(text("emptyTitleLabel"), QStringLiteral("No device matches"));

        m_service.tell("fault code=3@/v1/dev/commit,times=1");
        button("addButton")->click();
        QCOMPARE(text("waitLabel"), QStringLiteral("Adding..."));
        QVERIFY(!button("addButton")->isEnabled() && !button("refreshButton")->isEnabled());
        QTRY_COMPARE_WITH_TIMEOUT(text("msgWarningLabel"),
                                  QStringLiteral("The devices could not be added: the server refused it."),
                                  patienceMs);
        QCOMPARE(text("countLabel"), QStringLiteral("3 of 40 devices selected"));
        QVERIFY(added.isEmpty());

        button("addButton")->click();
        QTRY_COMPARE_WITH_TIMEOUT(added.size(), 1, patienceMs);
        QTRY_VERIFY(!m_dialog);
        QCOMPARE(managed().size(), 23u);
    }

    void managedDevicesStayInTheirSites() {
        m_service.start({"--devices", "20"});
        const JSON known = managed();
        // As by a client that has not read the list: to it, all devices of the file are new.
        m_dialog = new AddDeviceDialog(nullptr);
        m_dialog->open();
        QByteArray lines = "Model,IP,MAC,HTTP Port,HTTPS Port\nN-1,10.0.0.1,02:00:00:00:00:01,80,443\n";
        for (int i = 0; i < 3; ++i)
            lines += "N-2,10.0.0.2," + QByteArray::fromStdString(known[i]["d_mac"]) + ",80,443\n";
        QVERIFY(m_service.root().write("cams.csv", lines));
        m_dialog->setAskOpenPath(
            [this](const auto &chosen) { chosen(m_service.root().filePath("cams.csv")); });
        button("importCsvButton")->click();
        QTRY_COMPARE(table()->model()->rowCount(), 4);
        m_dialog->findChild<QCheckBox *>("selectAllCheckBox")->click();
        QVERIFY(!button("addButton")->isEnabled());
        QTRY_COMPARE_WITH_TIMEOUT(text("waitLabel"),
                                  QStringLiteral("Waiting for the list of managed devices..."), patienceMs);
        // The list comes, without what another client adds right after that.
        m_dialog->setManaged(DeviceMaker::snapshot({known[0]}));
        QTRY_COMPARE(text("waitLabel"), QString());
        QVERIFY2(text("countLabel").startsWith("3 of "), qPrintable(text("countLabel")));
        QVERIFY(button("addButton")->isEnabled());
        QSignalSpy added(m_dialog, &AddDeviceDialog::devicesAdded);
        button("addButton")->click();
        QTRY_COMPARE_WITH_TIMEOUT(added.size(), 1, patienceMs);
        const JSON now = managed();
        QVERIFY(now.size() > 20u);
        for (int i = 0; i < 20; ++i)
            QVERIFY2(now[i]["siteid"] == known[i]["siteid"], now[i].dump().c_str());
    }

    void addressIsSearchedOnceNetworkIsDone() {
        workOn({"--fault", "code=3@/v1/dev/scan,times=1"});
        QTRY_VERIFY_WITH_TIMEOUT(text("msgWarningLabel").contains("the server refused it"), patienceMs);
        QCOMPARE(text("emptyTitleLabel"), QStringLiteral("The search failed"));
        QTRY_VERIFY(text("waitLabel").isEmpty());
        const LogCapture log;
        m_dialog->onDeviceManualDiscovery(DeviceDiscovery::Method::Address, "10.99.0.200", {});
        button("addManuallyButton")->click();
        auto *manual = m_dialog->findChild<AddDeviceManualDialog *>();
        QTest::keyClicks(manual->findChild<QLineEdit *>("addressEdit"), "10.99.0.11");
        QTest::mouseClick(manual->findChild<QPushButton *>("addButton"), Qt::LeftButton);
        QCOMPARE(log.count("manual add from ip: 10.99.0.11, port: 0"), 1);
        QTRY_COMPARE_WITH_TIMEOUT(text("msgWarningLabel"),
                                  QStringLiteral("No device was found at 10.99.0.200."), patienceMs);
        QVERIFY2(!text("waitLabel").isEmpty(), "the second search waited for the first one");
        QTRY_COMPARE_WITH_TIMEOUT(table()->model()->rowCount(), 1, patienceMs);
        QCOMPARE(table()->model()->index(0, DiscoveredModel::IpColumn).data().toString(),
                 QStringLiteral("10.99.0.11"));
    }

    void fileIsImportedAndClosingLosesNothing_data() {
        QTest::addColumn<QStringList>("arguments");
        QTest::addColumn<int>("taken");
        QTest::newRow("taken") << QStringList() << 2;
        QTest::newRow("accepted, not taken") << QStringList{"--fault", "code=0@/v1/dev/commit"} << 0;
    }
    void fileIsImportedAndClosingLosesNothing() {
        QFETCH(QStringList, arguments);
        QFETCH(int, taken);
        workOn(arguments);
        QVERIFY(m_service.root().write("cams.csv", "Model,IP,MAC,HTTP Port,HTTPS Port\n"
                                                   "N-1,10.0.0.1,02:00:00:00:00:01,80,443\n"
                                                   "N-2,10.0.0.2,bad,80,443\n"
                                                   "N-3,10.0.0.3,02:00:00:00:00:03,80,443\n"));
        m_dialog->setAskOpenPath(
            [this](const auto &chosen) { chosen(m_service.root().filePath("cams.csv")); });
        button("importCsvButton")->click();
        QTRY_COMPARE(table()->model()->rowCount(), 2);
        auto *invalid = m_dialog->findChild<InvalidDeviceDialog *>();
        QVERIFY(invalid && invalid->isVisible());
        QVERIFY(invalid->findChild<QLabel *>("messageLabel")->text().contains("cams.csv"));
        auto *list = invalid->findChild<QTableWidget *>("invalidTable");
        QCOMPARE(list->item(0, 0)->text(), QStringLiteral("Line 3"));
        QCOMPARE(list->item(0, 1)->text(), QStringLiteral("\"bad\" is no MAC address."));
        invalid->accept();
        StoreWriter::flush();
        QCOMPARE(CLocalStore::instance().defaultFilePath(), m_service.root().path());

        QSignalSpy added(m_dialog, &AddDeviceDialog::devicesAdded);
        m_dialog->findChild<QCheckBox *>("selectAllCheckBox")->click();
        button("addButton")->click();
        m_dialog->reject();
        QVERIFY(!m_dialog->isVisible());
        QTRY_COMPARE_WITH_TIMEOUT(added.size(), 1, patienceMs);
        QTRY_VERIFY(!m_dialog);
        QCOMPARE(int(managed().size()), 20 + taken);
        const auto *missing = qobject_cast<InvalidDeviceDialog *>(QApplication::activeModalWidget());
        QCOMPARE(missing != nullptr, taken == 0);
        if (missing)
            QCOMPARE(missing->findChild<QTableWidget *>("invalidTable")->item(1, 0)->text(),
                     QStringLiteral("10.0.0.3, 02:00:00:00:00:03"));
        delete missing;
    }

private:
    void workOn(const QStringList &arguments) {
        m_service.start(QStringList{"--devices", "20"} + arguments);
        const JSON devices = managed();
        m_dialog = new AddDeviceDialog(DeviceMaker::snapshot({devices.begin(), devices.end()}));
        m_dialog->open();
        QVERIFY(QTest::qWaitForWindowExposed(m_dialog));
    }
    static JSON managed() {
        JSON devices;
        SignedInService::call([&](CApiClient &client) { return client.listDevices(0, 500, devices); });
        return devices;
    }
    QPushButton *button(const char *name) const { return m_dialog->findChild<QPushButton *>(name); }
    QString text(const char *name) const { return m_dialog->findChild<QLabel *>(name)->text(); }
    CheckTable *table() const { return m_dialog->findChild<CheckTable *>("discoveredTable"); }

    SignedInService m_service;
    QPointer<AddDeviceDialog> m_dialog;
};

NVLDM_TEST(TestAddDeviceDialog)
#include "tst_adddevicedialog.moc"
