#include "support/testmain.h"
#include "tasks/queue/queuedrecords.h"

#include <QTest>

#include <nlohmann/json.hpp>

#include <atomic>
#include <set>
#include <thread>

namespace {

LoginInfo session(quint64 generation) {
    LoginInfo login;
    login.generation = generation;
    return login;
}

} // namespace

/// The list that windows insert into while a worker walks it.
class TestQueuedRecords : public QObject {
    Q_OBJECT

private slots:
    void walkedWhileOthersInsertWipeAndLeave() {
        constexpr int inserters = 3;
        constexpr int each = 1000;
        QueuedRecords records;
        std::atomic<int> inserting = inserters;
        std::multiset<std::string> taken;
        std::thread walker([&] {
            bool last = false;
            do {
                last = inserting == 0;
                std::size_t place = 0;
                JSON record;
                while (records.takeNext(place, record)) {
                    taken.insert(record.at("ctid").get<std::string>());
                    records.setState(record.at("ctid").get<std::string>(), "applying",
                                     QueuedRecords::Secret::Keep);
                }
            } while (!last);
        });
        std::vector<std::thread> threads;
        for (int i = 0; i < inserters; ++i) {
            threads.emplace_back([&, i] {
                for (int n = 0; n < each; ++n) {
                    const std::string ctid =
                        records.append({{"pass", "secret"}, {"n", n}}, "type", "id_", session(quint64(i)));
                    if (n % 100 == 0)
                        records.wipeSecret(ctid);
                    if (n % 1000 == 0)
                        records.abandonOtherSessions(quint64(i));
                }
                --inserting;
            });
        }
        for (std::thread &thread : threads)
            thread.join();
        walker.join();
        QCOMPARE(taken.size(), std::size_t(inserters * each));
        QCOMPARE(std::set<std::string>(taken.begin(), taken.end()).size(), taken.size());
        QVERIFY(!records.hasPending());
    }

    void secretsOfOtherSessionsAreWiped() {
        QueuedRecords records;
        const std::string left = records.append({{"pass", "a"}}, "type", "id_", session(1));
        const std::string atWork = records.append({{"pass", "b"}}, "type", "id_", session(1));
        const std::string present = records.append({{"pass", "c"}}, "type", "id_", session(2));
        QVERIFY(records.setState(atWork, "uploading", QueuedRecords::Secret::Keep));
        QVERIFY(!records.setState(atWork, "uploading", QueuedRecords::Secret::Keep));
        const std::vector<JSON> waiting = records.abandonOtherSessions(2);
        QCOMPARE(waiting.size(), 1u);
        QCOMPARE(waiting[0].at("ctid").get<std::string>(), left);
        QVERIFY(!records.find(left).contains("pass"));
        QVERIFY(!records.find(atWork).contains("pass"));
        QVERIFY(records.find(present).at("pass") == "c");
        QVERIFY(records.setState(present, "upload_done", QueuedRecords::Secret::Wipe));
        QVERIFY(!records.find(present).contains("pass"));
    }
};

NVLDM_APPLESS_TEST(TestQueuedRecords)
#include "tst_queuedrecords.moc"
