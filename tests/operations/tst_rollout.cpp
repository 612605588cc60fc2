#include "devices/operations/rollout/rollout.h"
#include "support/testmain.h"

#include "api/client/apiclient.h"
#include "api/session/sessionevents.h"
#include "devices/operations/rollout/rolloutmgr.h"
#include "devices/operations/rollout/rollouttexts.h"
#include "platform/files/nvldmstore.h"
#include "store/storewriter.h"
#include "support/emulatorprocess.h"
#include "support/fakelists.h"
#include "support/isolatedroot.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/taskstate.h"
#include "tasks/service/tasktype.h"

#include <QSignalSpy>
#include <QTest>

using State = Rollout::State;
using Reason = Rollout::Reason;

namespace {

constexpr qint64 minute = 60 * 1000;
const char *const done = "pTaskDone";
const char *const failed = "pTaskBrokenFile_01";
const char *const busy = "pTaskDeviceIsUpdating";

RolloutPlan plan(int maxFailed = 20) {
    RolloutPlan made;
    made.deviceIds = {"D1", "D2", "D3", "D4", "D5", "D6", "D7"};
    made.firstCount = 5;
    made.waitMinutes = 30;
    made.maxFailedPercent = maxFailed;
    made.actionTime = "1700";
    return made;
}

/// A rollout with a clock, a list and a road to the service that the test holds.
struct Bed {
    explicit Bed(const RolloutPlan &given = plan())
        : rollout(std::make_shared<const RolloutPlan>(given),
                  {[this] { return now + clockStep; }, [this] { return now; }, [this] { return tasks; },
                   [this](Rollout &, const QStringList &ids, const QString &time) {
                       uploads.push_back({ids, time});
                   }}) {}

    /// The first wave is on the service.
    void beginFirst() {
        rollout.begin();
        sent("c1", "T1");
    }
    void sent(const QString &ctid, const QString &tid) {
        rollout.onQueued(ctid);
        rollout.onServiceTaskMade(ctid, tid);
    }
    /// The list has this task alone; one state for each device from the first one on.
    void list(const QString &tid, const QString &status, const QStringList &states, int firstDevice = 1) {
        auto task = std::make_shared<TaskRecord>();
        task->tid = tid;
        task->type = TaskType::firmwareUpload;
        task->status = status;
        task->active = TaskState::isFinal(status) == false;
        for (const QString &state : states) {
            auto target = std::make_shared<TaskTarget>();
            target->id = QStringLiteral("D%1").arg(firstDevice++);
            task->devices.push_back({target, state, 0});
            task->failedDevices += TaskState::isFailure(state);
        }
        tasks = std::make_shared<TaskList>(std::vector<TaskRecordPtr>{task});
        rollout.advance();
    }
    QString text() const { return RolloutTexts::standing(rollout); }

    struct Upload {
        QStringList ids;
        QString time;
        bool operator==(const Upload &) const = default;
    };
    qint64 now = 1'000'000;
    qint64 clockStep = 0; ///< what somebody has done to the machine's clock
    TaskListPtr tasks = std::make_shared<TaskList>();
    std::vector<Upload> uploads;
    Rollout rollout;
};

const Bed::Upload rest = {{"D6", "D7"}, ""};

} // namespace

/// A rollout by itself, then the rollouts of a session.
class TestRollout : public QObject {
    Q_OBJECT

private slots:
    void goesFromWaveToWave();
    void firstWaveIsJudged_data();
    void firstWaveIsJudged();
    void repeatedRestIsJudgedWithItsWave();
    void goesOnAfterAStop_data();
    void goesOnAfterAStop();
    void stoppedByTheUser();
    void comesBackFromItsRecord();
    void endsWithTheLogOffAndNotWithTheProgram();
    void imageThatHasChangedIsNotSent();
    void wavesReachTheDevices_data();
    void wavesReachTheDevices();

private:
    IsolatedRoot m_root;
};

void TestRollout::goesFromWaveToWave() {
    Bed bed;
    bed.beginFirst();
    QCOMPARE(bed.uploads, (std::vector<Bed::Upload>{{{"D1", "D2", "D3", "D4", "D5"}, "1700"}}));
    // Somebody else's.
    bed.rollout.onServiceTaskMade("c9", "T9");
    bed.rollout.onHandOverFailed("c9", "no");
    bed.list("T1", "pTaskProcessing", {done, failed, busy, busy, busy});
    QCOMPARE(bed.rollout.state(), State::FirstWave);
    QCOMPARE(bed.text(), "First wave: 2 of 5 done, 1 failed.");
    bed.list("T1", "pTaskFailed", {done, failed, done, done, done});
    bed.now += 2 * minute - 1;
    bed.clockStep = 1000 * minute;
    bed.rollout.advance();
    QCOMPARE(bed.text(), "First wave: 5 of 5 done, 1 failed. Waiting 29 min.");
    bed.now += 28 * minute;
    bed.rollout.advance();
    QCOMPARE(bed.uploads.size(), 1u);
    bed.now += 1;
    bed.rollout.advance();
    QCOMPARE(bed.uploads.back(), rest);
    // The task of the first wave is still the only one in the list.
    bed.rollout.advance();
    QCOMPARE(bed.rollout.state(), State::SecondWave);
    bed.sent("c2", "T2");
    bed.list("T2", "pTaskDone", {done, done}, 6);
    QCOMPARE(bed.rollout.state(), State::Done);
    QCOMPARE(bed.text(), "Finished: 7 of 7 done, 1 failed.");
    QCOMPARE(bed.uploads.size(), 2u);
}

void TestRollout::firstWaveIsJudged_data() {
    QTest::addColumn<int>("maxFailed");
    QTest::addColumn<QString>("status");
    QTest::addColumn<QStringList>("states");
    QTest::addColumn<State>("state");
    QTest::addColumn<Reason>("reason");
    const QStringList good = {done, done, done, done, done};
    const QStringList oneBad = {done, done, failed, done, done};
    QTest::newRow("good") << 0 << done << good << State::Waiting << Reason::None;
    QTest::newRow("just enough") << 20 << "pTaskFailed" << oneBad << State::Waiting << Reason::None;
    QTest::newRow("one too many") << 19 << "pTaskFailed" << oneBad << State::Stopped << Reason::TooManyFailed;
    QTest::newRow("one left out") << 0 << done << good.mid(1) << State::Stopped << Reason::TooManyFailed;
    QTest::newRow("one never done") << 0 << "pTaskFailed" << (good.mid(1) << busy) << State::Stopped
                                    << Reason::TooManyFailed;
    QTest::newRow("cancelled") << 100 << "pTaskAborted" << good << State::Stopped << Reason::Cancelled;
    QTest::newRow("waits for its time")
        << 0 << "pTaskScheduled" << QStringList() << State::FirstWave << Reason::None;
}

void TestRollout::firstWaveIsJudged() {
    QFETCH(const int, maxFailed);
    QFETCH(const QString, status);
    QFETCH(const QStringList, states);
    Bed bed(plan(maxFailed));
    bed.beginFirst();
    bed.list("T1", status, states);
    QTEST(bed.rollout.state(), "state");
    QTEST(bed.rollout.progress().reason, "reason");
    QCOMPARE(bed.uploads.size(), 1u);
}

void TestRollout::repeatedRestIsJudgedWithItsWave() {
    Bed bed;
    bed.beginFirst();
    bed.list("T1", "pTaskAborted", {done, done, done, done, "pTaskAborted"});
    bed.rollout.goOn();
    QCOMPARE(bed.uploads.back().ids, QStringList{"D5"});
    bed.sent("c2", "T2");
    bed.list("T2", "pTaskFailed", {failed}, 5);
    QVERIFY2(bed.rollout.state() == State::Waiting, "one of five is just enough");
}

void TestRollout::goesOnAfterAStop_data() {
    using Happening = std::function<void(Bed &)>;
    QTest::addColumn<Happening>("happening");
    QTest::addColumn<QString>("told");
    QTest::addColumn<QStringList>("sent");
    const QStringList first = plan().firstWave();
    const auto row = [](const char *name, const Happening &happening, const QString &told,
                        const QStringList &sent) { QTest::newRow(name) << happening << told << sent; };
    row(
        "too many failed",
        [](Bed &bed) {
            bed.list("T1", "pTaskFailed", {failed, failed, done, done, done});
        },
        "5 of 5 done, 2 failed. Stopped: more than 20 % of the first wave failed. Waiting for the second",
        rest.ids);
    row("cancelled",
        [](Bed &bed) {
            bed.list("T1", "pTaskAborted", {done, failed, busy, "pTaskAborted"});
        },
        "was cancelled", {"D2", "D4", "D5"});
    row(
        "not begun", [](Bed &bed) { bed.rollout.onHandOverFailed("c1", "Reason: x."); }, "Reason: x.", first);
    row(
        "removed",
        [](Bed &bed) {
            bed.list("T1", "pTaskProcessing", {done});
            // A list may skip a task for once.
            bed.list("T7", "pTaskDone", {});
            bed.list("T7", "pTaskDone", {});
            bed.rollout.advance();
            QCOMPARE(bed.rollout.state(), State::FirstWave);
            bed.list("T7", "pTaskDone", {});
        },
        "no longer in the list. The wave is not sent again.", rest.ids);
}

void TestRollout::goesOnAfterAStop() {
    using Happening = std::function<void(Bed &)>;
    QFETCH(const Happening, happening);
    QFETCH(const QString, told);
    QFETCH(const QStringList, sent);
    Bed bed;
    bed.beginFirst();
    happening(bed);
    QCOMPARE(bed.rollout.state(), State::Stopped);
    QVERIFY2(bed.text().contains(told), qUtf8Printable(bed.text()));
    bed.now += 1000 * minute;
    bed.rollout.advance();
    QCOMPARE(bed.uploads.size(), 1u);
    bed.rollout.goOn();
    QCOMPARE(bed.uploads.size(), 2u);
    QCOMPARE(bed.uploads.back().ids, sent);
    // Each device is counted once, however often it was tried.
    const bool again = bed.rollout.state() == State::FirstWave;
    bed.sent("c2", "T2");
    bed.list("T2", "pTaskDone", QStringList(7, done));
    if (again) {
        bed.rollout.goOn();
        bed.sent("c3", "T3");
        bed.list("T3", "pTaskDone", QStringList(7, done));
    }
    // Of a wave whose task is gone only what it told is known.
    const bool isKnown = !told.startsWith("no longer");
    QVERIFY2(bed.text().startsWith(isKnown ? "Finished: 7 of 7 done" : "Finished: 3 of 7 done"),
             qUtf8Printable(bed.text()));
}

void TestRollout::stoppedByTheUser() {
    Bed bed;
    bed.beginFirst();
    bed.rollout.stop();
    bed.list("T1", "pTaskDone", QStringList(5, done));
    QCOMPARE(bed.text(), "First wave: 5 of 5 done. Stopped. Waiting for the second wave: 2 device(s).");
    bed.rollout.goOn();
    QCOMPARE(bed.rollout.state(), State::Waiting);
    bed.rollout.stop();
    bed.now += 31 * minute;
    bed.rollout.advance();
    QCOMPARE(bed.uploads.size(), 1u);
    bed.rollout.goOn();
    QCOMPARE(bed.uploads.back(), rest);
    QVERIFY(!bed.rollout.canStop());
}

void TestRollout::comesBackFromItsRecord() {
    const auto again = [](const Bed &bed) {
        return RolloutRecords::parse(
            RolloutRecords::toText({{bed.rollout.planPtr(), bed.rollout.progress()}}));
    };
    Bed waiting;
    waiting.beginFirst();
    waiting.list("T1", "pTaskDone", QStringList(5, done));
    const auto kept = again(waiting);
    QCOMPARE(kept.size(), 1u);
    Bed later(*kept[0].plan);
    later.now = waiting.now + 30 * minute;
    later.rollout.resume(kept[0].progress);
    QCOMPARE(later.uploads, std::vector<Bed::Upload>{rest});
    // The program ended when the task was made and nobody had noted it.
    Bed found(*kept[0].plan);
    found.list("T2", "pTaskProcessing", {busy, busy}, 6);
    found.rollout.resume(again(later).at(0).progress);
    QCOMPARE(found.rollout.state(), State::SecondWave);
    found.list("T2", "pTaskDone", {done, done}, 6);
    QCOMPARE(found.rollout.state(), State::Done);
    QVERIFY(found.uploads.empty());
    // Queued, and the queue went with the program.
    Bed lost(*kept[0].plan);
    lost.rollout.resume(again(later).at(0).progress);
    QCOMPARE(lost.rollout.progress().reason, Reason::NotBegun);
    lost.rollout.goOn();
    QCOMPARE(lost.uploads, std::vector<Bed::Upload>{rest});
    QString text = RolloutRecords::toText({kept[0], kept[0]});
    QCOMPARE(RolloutRecords::parse(text.replace(text.indexOf("\"state\":1"), 9, "\"state\":9")).size(), 1u);
    QCOMPARE(RolloutRecords::parse("{\"a").size(), 0u);
}

void TestRollout::endsWithTheLogOffAndNotWithTheProgram() {
    FakeLists service;
    auto &rollouts = RolloutMgr::instance();
    auto &pool = CTaskInfoPool::instance();
    const QByteArray store = (m_root.path() + "/nvldmuio.sdb").toUtf8();
    const auto kept = [&] {
        StoreWriter::flush();
        std::string rows;
        nvldmstore::queryData(store.constData(), "appMainT", "WHERE key LIKE 'kFwRollouts%'", rows);
        return nlohmann::json::parse(rows, nullptr, false);
    };
    RolloutPlan image = plan();
    image.actionTime.clear();
    m_root.write("it's.bin", "image");
    image.image = FileCheck::ofFile(m_root.filePath("it's.bin"));
    image.fwid = "FW00";
    rollouts.start(image);
    QTRY_COMPARE(service.rawSentTo("/v1/fwupl").size(), 1u);
    const nlohmann::json made = service.sentTo("/v1/task/init").at(0).at("devices");
    QCOMPARE(made.size(), 5u);
    QVERIFY((made[0] == nlohmann::json{{"id", "D1"}, {"fwid", "FW00"}, {"mode", "auto"}, {"actm", ""}}));
    const auto tid = [&] { return rollouts.rollouts().at(0)->progress().wave.tid; };
    QTRY_COMPARE(tid(), "T1");
    nlohmann::json row;
    QTRY_VERIFY(!(row = kept()).empty() && row[0]["value"].get<std::string>().size() > 2);
    QSignalSpy dropped(&rollouts, &RolloutMgr::dropped);
    CLocalStore::instance().clearLoginInfo();
    pool.clear();
    QVERIFY(rollouts.rollouts().empty() && !rollouts.isBusy());
    QVERIFY(dropped.value(0).value(0).toString().contains("it's.bin"));
    QCOMPARE(kept()[0]["value"].get<std::string>(), std::string());
    // What the program would have left behind had it been closed.
    std::string value = row[0]["value"];
    for (std::size_t at = 0; (at = value.find('\'', at)) != std::string::npos; at += 2)
        value.insert(at, "'");
    const std::string key = row[0]["key"];
    nvldmstore::replaceData(store.constData(), "appMainT", ("'" + key + "','" + value + "'").c_str());
    const auto comesBack = [&] {
        service.logIn();
        pool.loadTaskStatuses();
        return QTest::qWaitFor([&] { return rollouts.rollouts().size() == 1 && tid() == "T1"; });
    };
    QVERIFY(comesBack());
    // A session that the service has ended is not the user's doing.
    SessionEvents::instance().reportLost(CLocalStore::instance().loginInfo().generation);
    CLocalStore::instance().clearLoginInfo();
    pool.clear();
    QVERIFY(rollouts.rollouts().empty());
    QVERIFY2(dropped.last()[0].toString().contains("next log-in"),
             qUtf8Printable(dropped.last()[0].toString()));
    QVERIFY(!kept()[0]["value"].get<std::string>().empty());
    QVERIFY(comesBack());
    CLocalStore::instance().clearLoginInfo();
    pool.clear();
}

void TestRollout::imageThatHasChangedIsNotSent() {
    FakeLists service;
    RolloutPlan image = plan();
    m_root.write("image.bin", "image");
    image.image = FileCheck::ofFile(m_root.filePath("image.bin"));
    m_root.write("image.bin", "another one");
    RolloutMgr::instance().start(image);
    Rollout &rollout = *RolloutMgr::instance().rollouts().at(0);
    QTRY_COMPARE(rollout.state(), State::Stopped);
    QVERIFY(rollout.progress().reasonText.contains("changed"));
    QVERIFY(service.sentTo("/v1/task/init").empty());
    CTaskInfoPool::instance().clear();
    StoreWriter::flush();
}

void TestRollout::wavesReachTheDevices_data() {
    QTest::addColumn<QByteArray>("image");
    QTest::addColumn<State>("end");
    QTest::addColumn<int>("updated");
    QTest::newRow("fits") << QByteArray("NVLFW1 N 99.9.9\n") << State::Done << 5;
    QTest::newRow("fits nothing") << QByteArray("NVLFW1 X 99.9.9\n") << State::Stopped << 0;
}

/// Both waves through the queue to a service that works like the real one.
void TestRollout::wavesReachTheDevices() {
    QFETCH(const QByteArray, image);
    const QTemporaryDir folder;
    EmulatorProcess emulator(folder.path());
    QVERIFY(emulator.start({"--devices", "8", "--account", "a@b.example:Passw0rd!", "--task-pace", "20"}));
    QVERIFY(emulator.command("admit all").startsWith("ok"));
    CApiClient client("127.0.0.1", emulator.port());
    QCOMPARE(client.loginServer("a@b.example", "Passw0rd!"), unsigned(ApiOk));
    CLocalStore::instance().setLoginInfo("127.0.0.1", emulator.port(), "a@b.example",
                                         CLocalStore::instance().access());
    const auto devices = [&] {
        JSON page;
        client.listDevices(0, 500, page);
        return page;
    };
    RolloutPlan waves;
    m_root.write("wave.bin", image);
    waves.image = FileCheck::ofFile(m_root.filePath("wave.bin"));
    for (const JSON &device : devices())
        waves.deviceIds += stringMember(device, "id");
    waves.deviceIds = waves.deviceIds.mid(0, 5);
    waves.firstCount = 2;
    RolloutMgr::instance().start(waves);
    const Rollout &rollout = *RolloutMgr::instance().rollouts().at(0);
    QTimer poll;
    connect(&poll, &QTimer::timeout, this, [] { CTaskInfoPool::instance().loadTaskStatuses(); });
    poll.start(100);
    QTRY_VERIFY_WITH_TIMEOUT(!rollout.isRunning(), 20000);
    QTEST(rollout.state(), "end");
    const JSON all = devices();
    QTEST(static_cast<int>(std::count_if(
              all.begin(), all.end(), [](const JSON &each) { return each.value("d_fw", "") == "99.9.9"; })),
          "updated");
    CLocalStore::instance().clearLoginInfo();
    CTaskInfoPool::instance().clear();
    StoreWriter::flush();
}

NVLDM_GUILESS_TEST(TestRollout)
#include "tst_rollout.moc"
