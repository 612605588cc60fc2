#include "store/storewriter.h"
#include "support/fakelists.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"
#include "tasks/queue/postwork.h"
#include "tasks/service/taskinfopool.h"

#include <QDir>
#include <QSignalSpy>
#include <QTest>

using nlohmann::json;
using namespace std::chrono_literals;

namespace {

constexpr const char *exportPath = "/v1/export/file";

json task(const char *tid, const char *status, std::initializer_list<const char *> deviceStates,
          const char *type = "deviceExportDeviceInfo") {
    json devices = json::array();
    for (const char *state : deviceStates)
        devices.push_back({{"id", "DV" + std::to_string(devices.size())}, {"state", state}});
    return {{"tid", tid},      {"type", type},    {"status", status},
            {"state", status}, {"progress", 100}, {"devices", devices}};
}

ScriptedPeer::Reply zip(const std::string &content) {
    return {ScriptedPeer::http(200, content, {"Content-Type: application/octet-stream"})};
}

} // namespace

/// Exports that this client has asked for become report files, whatever happens meanwhile.
class TestPostWork : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_service = std::make_unique<FakeLists>();
        m_service->reply(exportPath, zip("a report"));
        m_folder = m_root.filePath(QString::fromLatin1(QTest::currentTestFunction()));
        QVERIFY(QDir(m_folder).removeRecursively());
        QVERIFY(QDir().mkpath(m_folder));
    }
    void cleanup() {
        QVERIFY(NetTask::waitForAll(10000));
        m_service.reset();
        CTaskInfoPool::instance().clear();
    }

    void goesOnAfterARestart(); // first: what is kept is read once
    void tasks_data();
    void tasks();
    void brokenReportLeavesNothingAndIsToldOnce();
    void logOffCutsTheFetch();
    void vanishedTaskIsGivenUp();
    void pausesGrow();

private:
    void expect(const char *tid) {
        CPostWork::instance().expectExport(CLocalStore::instance().loginInfo(), tid, m_folder);
    }
    /// Lets a poll of the tasks run, and what it starts.
    void poll(const std::vector<json> &tasks) {
        m_service->setTasks(tasks);
        CTaskInfoPool::instance().loadTaskStatuses();
        for (int i = 0; i < 2; ++i) {
            QVERIFY(NetTask::waitForAll(10000));
            QTest::qWait(1);
        }
    }
    QStringList files() const { return QDir(m_folder).entryList(QDir::Files | QDir::Hidden); }
    static json kept() {
        StoreWriter::flush();
        return json::parse(CLocalStore::instance().pendingExports().toStdString());
    }

    IsolatedRoot m_root;
    LogCapture m_log;
    std::unique_ptr<FakeLists> m_service;
    QString m_folder;
};

void TestPostWork::goesOnAfterARestart() {
    const std::string server = "127.0.0.1:" + std::to_string(m_service->port());
    const auto entry = [&](const char *tid, const QString &target) -> json {
        return {{"tid", tid},
                {"server", server},
                {"account", "admin"},
                {"folder", m_folder.toStdString()},
                {"asked", QDateTime(QDate(2024, 5, 6), QTime(7, 8, 9)).toMSecsSinceEpoch()},
                {"target", target.toStdString()}};
    };
    const QString name = "debug-info_2024-05-06_07-08-09_2-devices.zip";
    QVERIFY(m_root.write("goesOnAfterARestart/" + name, "somebody else's"));
    QVERIFY(m_root.write("goesOnAfterARestart/whole.zip", "fetched before the crash"));
    QVERIFY(m_root.write("goesOnAfterARestart/.download-aB3dE6", "what the crash has cut off"));
    json other = entry("t4", {});
    other["account"] = "somebody@else";
    json broken = {{"tid", 3}};
    const json list = {entry("t1", {}),
                       entry("t2", m_folder + "/whole.zip"),
                       entry("t3", m_folder + "/never begun.zip"),
                       other,
                       broken,
                       "broken"};
    QVERIFY(CLocalStore::instance().setPendingExports(QString::fromStdString(list.dump())));
    QSignalSpy exported(&CPostWork::instance(), &CPostWork::exported);
    const char *done = "pTaskDone";
    poll({task("t1", done, {done, done}), task("t2", done, {done}), task("t3", done, {done, done}),
          task("t4", done, {done})});
    QCOMPARE(exported.count(), 3);
    QCOMPARE(files(), (QStringList{"debug-info_2024-05-06_07-08-09_2-devices (2).zip",
                                   "debug-info_2024-05-06_07-08-09_2-devices (3).zip", name, "whole.zip"}));
    QCOMPARE(m_root.read("goesOnAfterARestart/" + name), QByteArray("somebody else's"));
    QCOMPARE(m_root.read("goesOnAfterARestart/debug-info_2024-05-06_07-08-09_2-devices (2).zip"),
             QByteArray("a report"));
    QCOMPARE(m_service->sentTo(exportPath).size(), 2u);
    QCOMPARE(kept().size(), 1u);
    QVERIFY(kept()[0]["account"] == "somebody@else");
}

void TestPostWork::tasks_data() {
    QTest::addColumn<QByteArray>("task");
    QTest::addColumn<QString>("ending"); ///< of the report's name; empty for none
    QTest::addColumn<bool>("over");
    const char *done = "pTaskDone";
    const char *failed = "pTaskFailed";
    const char *busy = "pTaskProcessing";
    const auto row = [](const char *name, const json &value, const char *ending, bool over) {
        QTest::newRow(name) << QByteArray::fromStdString(value.dump()) << QString(ending) << over;
    };
    row("done", task("t", done, {done, done}), "_2-devices.zip", true);
    row("failed for one", task("t", failed, {failed, done}), "_1-device.zip", true);
    row("failed for all", task("t", failed, {failed}), "", true);
    row("aborted", task("t", "pTaskAborted", {done, busy}), "", true);
    row("another type", task("t", done, {done}, "deviceRestart"), "", true);
    row("at work", task("t", busy, {done, busy}), "", false);
}

void TestPostWork::tasks() {
    QFETCH(QByteArray, task);
    QFETCH(QString, ending);
    QFETCH(bool, over);
    const std::size_t before = kept().size();
    expect("t");
    // Looked at without waiting for the writes: a power cut would not either.
    QCOMPARE(json::parse(CLocalStore::instance().pendingExports().toStdString()).size(), before + 1);
    QSignalSpy exported(&CPostWork::instance(), &CPostWork::exported);
    QSignalSpy failed(&CPostWork::instance(), &CPostWork::exportFailed);
    for (int i = 0; i < 2; ++i)
        poll({json::parse(task.toStdString()), ::task("of another client", "pTaskDone", {"pTaskDone"})});
    QCOMPARE(exported.count(), ending.isEmpty() ? 0 : 1);
    QCOMPARE(files().size(), exported.count());
    const bool isCancelled = QByteArray(QTest::currentDataTag()) == "aborted";
    QCOMPARE(failed.count(), over && ending.isEmpty() && !isCancelled ? 1 : 0);
    QVERIFY(files().isEmpty() || files()[0].endsWith(ending));
    QCOMPARE(kept().size(), before + (over ? 0 : 1));
}

void TestPostWork::brokenReportLeavesNothingAndIsToldOnce() {
    std::string cut = ScriptedPeer::http(200, std::string(100000, 'x'));
    cut.resize(cut.size() / 2);
    m_service->reply(exportPath, {cut});
    QSignalSpy failed(&CPostWork::instance(), &CPostWork::exportFailed);
    expect("cut");
    for (int i = 0; i < 3; ++i)
        poll({task("cut", "pTaskDone", {"pTaskDone"})});
    QCOMPARE(failed.count(), 1);
    QVERIFY(failed[0][0].toString().contains(QDir::toNativeSeparators(m_folder)));
    QCOMPARE(files(), QStringList());
    QVERIFY2(m_service->sentTo(exportPath).size() == 1, "not again before its pause is over");
    QVERIFY(kept().back()["target"] == "");
}

void TestPostWork::logOffCutsTheFetch() {
    QSignalSpy failed(&CPostWork::instance(), &CPostWork::exportFailed);
    expect("held");
    const std::vector<json> tasks = {task("held", "pTaskDone", {"pTaskDone"})};
    m_service->hold(exportPath);
    m_service->setTasks(tasks);
    CTaskInfoPool::instance().loadTaskStatuses();
    QTRY_COMPARE(m_service->sentTo(exportPath).size(), 1u);
    CLocalStore::instance().clearLoginInfo();
    CTaskInfoPool::instance().clear();
    QVERIFY2(NetTask::waitForAll(2000), "nothing waits for the service any more");
    m_service->hold({});
    m_service->logIn();
    poll(tasks);
    QCOMPARE(files().size(), 1);
    QCOMPARE(failed.count(), 0);
}

void TestPostWork::vanishedTaskIsGivenUp() {
    const std::size_t before = kept().size();
    QSignalSpy failed(&CPostWork::instance(), &CPostWork::exportFailed);
    expect("gone");
    const json other = task("other", "pTaskDone", {});
    for (int i = 0; i < 2; ++i)
        poll({other});
    m_service->refuse("/v1/task/list", 3);
    poll({other});
    QVERIFY2(failed.isEmpty(), "a list that was not read lacks nothing");
    m_service->refuse("/v1/task/list", 0);
    poll({other});
    QCOMPARE(failed.count(), 1);
    QCOMPARE(kept().size(), before);
}

void TestPostWork::pausesGrow() {
    PendingExports exports;
    const LoginInfo login = CLocalStore::instance().loginInfo();
    const PendingExport pending{"slow", PendingExports::serverOf(login), "admin", m_folder, 0, {}};
    exports.add(pending);
    PendingExports::Clock::time_point now{};
    PendingExports::Clock::duration pause{};
    for (int failure = 0; failure < 20; ++failure) {
        QCOMPARE(exports.postpone(pending, now), failure == 0);
        const auto begin = now;
        while (exports.due(login, now).empty())
            now += 10s;
        QVERIFY(now - begin > pause || now - begin == 3840s);
        pause = now - begin;
    }
    QCOMPARE(pause, PendingExports::Clock::duration(3840s));
}

NVLDM_TEST(TestPostWork)
#include "tst_postwork.moc"
