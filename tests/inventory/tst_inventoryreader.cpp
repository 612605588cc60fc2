#include "api/session/servicesession.h"
#include "devices/inventory/inventoryreader.h"
#include "store/localstore.h"
#include "support/devicemaker.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/scriptedpeer.h"
#include "support/testmain.h"

#include <QTest>

/// Readings of lists whose records are as before but for a few.
class TestInventoryReader : public QObject {
    Q_OBJECT

private slots:
    void initTestCase() {
        CLocalStore &store = CLocalStore::instance();
        store.setAccess("token-0123456789ABCDEF");
        store.setLoginInfo("127.0.0.1", m_peer.port(), "admin", store.access());
        m_peer.follow([this](const ScriptedPeer::Request &request) {
            return ScriptedPeer::sealed(request.path == "/v1/dev/list"       ? m_devices
                                        : request.path == "/v1/dstatus/list" ? m_states
                                                                             : JSON::array());
        });
    }

    void init() {
        m_devices = JSON::array();
        m_states = JSON::array();
        for (int number = 0; number < 5; ++number) {
            m_devices.push_back(DeviceMaker::camera(number));
            m_states.push_back(state(number, "Connected"));
        }
    }

    void takesOverWhatIsAsBefore_data() {
        QTest::addColumn<QString>("change");
        QTest::addColumn<QString>("taken"); // the devices whose records are the very same as before
        QTest::newRow("nothing") << ""
                                 << "01234";
        QTest::newRow("a value") << "value"
                                 << "0134";
        QTest::newRow("one gone") << "gone"
                                  << "0134";
        QTest::newRow("one more in front") << "more"
                                           << "01234";
        QTest::newRow("another order") << "order"
                                       << "01234";
        QTest::newRow("one without an identity") << "unreadable"
                                                 << "01234";
    }
    void takesOverWhatIsAsBefore() {
        QFETCH(QString, change);
        QFETCH(QString, taken);
        const LogCapture log;
        const DeviceSnapshotPtr before = read(std::make_shared<DeviceSnapshot>());
        QCOMPARE(before->size(), 5);
        if (change == u"value")
            m_devices[2]["d_hostname"] = "renamed";
        else if (change == u"gone")
            m_devices.erase(2);
        else if (change == u"more")
            m_devices.insert(m_devices.begin(), DeviceMaker::camera(7));
        else if (change == u"order")
            std::swap(m_devices[0], m_devices[4]);
        else if (change == u"unreadable")
            m_devices.insert(m_devices.begin() + 1, JSON{{"d_model", "lost"}});
        const DeviceSnapshotPtr after = read(before);
        QCOMPARE(after == before, change.isEmpty() || change == u"unreadable");
        QString same;
        for (int i = 0; i < before->size(); ++i) {
            const int now = after->indexOf(before->at(i)->id);
            if (now >= 0 && after->at(now) == before->at(i))
                same += QString::number(i);
        }
        QCOMPARE(same, taken);
        for (int i = 0; i < after->size() && change != u"unreadable"; ++i)
            QVERIFY(JSON::parse(after->at(i)->json()) == m_devices[static_cast<std::size_t>(i)]);
        if (change == u"value")
            QCOMPARE(after->at(2)->text(DeviceColumn::HostName), QStringLiteral("renamed"));
    }

    void pollsTellWhatHasChanged() {
        const LogCapture log;
        const DeviceSnapshotPtr snapshot = read(std::make_shared<DeviceSnapshot>());
        StatusCache cache;
        DeviceInventory inventory;
        inventory.replace(snapshot, {});
        const auto poll = [&] {
            ServiceSession session(CLocalStore::instance().loginInfo());
            const auto update = InventoryReader::readStatus(session, snapshot, inventory.statuses(), &cache);
            if (!update)
                return QStringLiteral("failed");
            QString told;
            for (const auto &[index, code] : update->changes)
                told += QString::number(index);
            for (const std::string &id : update->difference.unknown)
                told += u'+' + QString::fromStdString(id);
            for (const std::string &id : update->difference.stateless)
                told += u'-' + QString::fromStdString(id);
            inventory.apply(*update);
            return told;
        };
        poll();
        QCOMPARE(poll(), QString());
        m_states[3] = state(3, "Unreachable");
        QCOMPARE(poll(), QStringLiteral("3"));
        QCOMPARE(poll(), QString());
        // Places in the list are no identities.
        std::swap(m_states[3], m_states[0]);
        QCOMPARE(poll(), QString());
        m_states.erase(1);
        QCOMPARE(poll(), QStringLiteral("1-DV1"));
        m_states.push_back(state(9, "Connected"));
        QCOMPARE(poll(), QStringLiteral("+DV9-DV1"));
        QCOMPARE(poll(), QStringLiteral("+DV9-DV1"));
        m_states = {{{"id", ""}}};
        QCOMPARE(poll(), QStringLiteral("failed"));
    }

private:
    static JSON state(int number, const char *connection) {
        return {{"id", "DV" + std::to_string(number)},
                {"connect_status", connection},
                {"auth_status", "Authorized"},
                {"action_status", "Standby"}};
    }

    DeviceSnapshotPtr read(const DeviceSnapshotPtr &previous) {
        ServiceSession session(CLocalStore::instance().loginInfo());
        return InventoryReader::readAll(session, previous, {}).devices;
    }

    IsolatedRoot m_root;
    ScriptedPeer m_peer;
    JSON m_devices;
    JSON m_states;
};

NVLDM_GUILESS_TEST(TestInventoryReader)
#include "tst_inventoryreader.moc"
