#include "support/testmain.h"
#include "tasks/panels/taskmodel.h"
#include "tasks/panels/tasktexts.h"
#include "tasks/service/taskfilter.h"
#include "tasks/service/taskrecord.h"
#include "widgets/lists/rowdiff.h"

#include <QAbstractItemModelTester>
#include <QPersistentModelIndex>
#include <QRandomGenerator>
#include <QSignalSpy>
#include <QTest>

#include <nlohmann/json.hpp>

namespace {

JSON device(int n, const char *state, int progress = 100) {
    const std::string number = std::to_string(n);
    return {{"id", "DV" + number},
            {"d_ip", "10.0.0." + number},
            {"d_mac", "00:00:00:00:00:0" + number},
            {"d_model", "NC-" + number},
            {"state", state},
            {"progress", progress}};
}

JSON task(const char *tid, const char *state, JSON devices = JSON::array(), int progress = 50) {
    return {{"tid", tid},
            {"type", "deviceRestart"},
            {"user", "admin"},
            {"status", state},
            {"state", state},
            {"progress", progress},
            {"active", true},
            {"created_at", 1700000000000},
            {"updated_at", 1700000000000},
            {"scheduled_at", 0},
            {"devices", std::move(devices)}};
}

std::vector<QString> applied(const std::vector<QString> &before, const std::vector<QString> &after) {
    const RowDiff diff = RowDiff::between(before, after);
    std::vector<QString> rows = before;
    for (const RowDiff::Range &range : diff.removed)
        rows.erase(rows.begin() + range.first, rows.begin() + range.last + 1);
    for (const RowDiff::Range &range : diff.inserted)
        rows.insert(rows.begin() + range.first, after.begin() + range.first, after.begin() + range.last + 1);
    return rows;
}

} // namespace

/// Task records, the model that shows them, and the filter between.
class TestTaskLists : public QObject {
    Q_OBJECT

private slots:
    void diffLeadsFromOneListToTheOther() {
        QRandomGenerator random(7);
        for (int round = 0; round < 200; ++round) {
            std::vector<QString> lists[2];
            for (auto &list : lists) {
                for (int i = 0; i < 12; ++i) {
                    if (random.bounded(3) != 0)
                        list.push_back(QString::number(i));
                }
                std::shuffle(list.begin(),
                             list.end() - std::min<std::ptrdiff_t>(round % 12, std::ssize(list)), random);
            }
            QCOMPARE(applied(lists[0], lists[1]), lists[1]);
        }
    }

    void diffLeavesAsManyRowsAsItCan() {
        const RowDiff diff = RowDiff::between({"a", "b", "c", "d"}, {"d", "x", "a", "b", "c"});
        QCOMPARE(diff.removed.size(), 1u);
        QCOMPARE(diff.removed[0].first, 3);
        QCOMPARE(diff.inserted.size(), 1u);
        QCOMPARE(diff.inserted[0].last, 1);
    }

    void recordThatSaysTheSameIsTheSame() {
        const JSON value = task("t1", "pTaskProcessing", {device(1, "pTaskProcessing", 40)});
        const TaskList before({m_parser.parse(value, {})});
        QCOMPARE(m_parser.parse(value, before), before.records()[0]);
        for (const char *path : {"/state", "/user", "/devices/0/state", "/devices/0/d_ip"}) {
            JSON changed = value;
            changed[JSON::json_pointer(path)] = "other";
            QVERIFY2(m_parser.parse(changed, before) != before.records()[0], path);
        }
        JSON further = value;
        further["devices"][0]["progress"] = 41;
        QCOMPARE(m_parser.parse(further, before)->devices[0].progress, 41);
    }

    void wrongMembersSpoilThemselvesOnly() {
        QVERIFY(!m_parser.parse("text", {}));
        QVERIFY(!m_parser.parse({{"tid", 7}}, {}));
        JSON value =
            task("t1", "pTaskFailed", {device(1, "pTaskBrokenFile_12"), "no object", device(2, "pTaskDone")});
        value["progress"] = "oops";
        value["active"] = "yes";
        value["created_at"] = 1e300;
        value["user"] = nullptr;
        value["devices"][2]["d_ip"] = 12;
        const TaskRecordPtr record = m_parser.parse(value, {});
        QCOMPARE(record->progress, 0);
        QVERIFY(!record->active);
        QCOMPARE(record->createdAt, 0);
        QCOMPARE(record->user, QString());
        QCOMPARE(record->devices.size(), 3u);
        QCOMPARE(record->devices[2].target->ip, QString());
        QCOMPARE(record->devices[2].target->model, QString("NC-2"));
        QCOMPARE(record->failedDevices, 1);
    }

    void failuresAreCountedByCause() {
        const TaskRecordPtr record = m_parser.parse(
            task("t", "pTaskFailed",
                 {device(1, "pTaskDone"), device(2, "pTaskFailedToConnectToDevice"),
                  device(3, "pTaskBrokenFile_07"), device(4, "pTaskFailedToConnectToDeviceEx")}),
            {});
        QCOMPARE(TaskTexts::summary(*record),
                 QString("3 of 4 failed: 2 Failed to connect to device, 1 Broken or invalid file"));
        QCOMPARE(TaskTexts::order(*record), (std::vector<int>{1, 2, 3, 0}));
    }

    void modelKeepsRowsThatStay() {
        TaskModel model;
        const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
        show(model,
             {task("a", "pTaskProcessing", {device(1, "pTaskProcessing"), device(2, "pTaskProcessing")}),
              task("b", "pTaskDone")});
        const QPersistentModelIndex opened = model.index(0, 0);
        const QPersistentModelIndex second = model.index(2, 0, opened);
        QCOMPARE(model.rowCount(opened), 3);
        QSignalSpy changes(&model, &QAbstractItemModel::dataChanged);

        show(model, {task("new", "pTaskInitState"),
                     task("a", "pTaskProcessing", {device(1, "pTaskProcessing"), device(2, "pTaskFailed")}),
                     task("b", "pTaskDone")});
        QCOMPARE(opened.row(), 1);
        QCOMPARE(model.taskOf(opened)->tid, QString("a"));
        // The failed device moved to the top, below the line that sums up; "b" was not touched.
        QCOMPARE(model.deviceOf(model.index(1, 0, opened)).target->id, QString("DV2"));
        QCOMPARE(changes.count(), 2);
        Q_UNUSED(second);

        // Fewer devices than before, then the task itself goes.
        show(model, {task("a", "pTaskDone", {device(2, "pTaskDone")})});
        QCOMPARE(model.rowCount(opened), 2);
        show(model, {});
        QVERIFY(!opened.isValid());
    }

    void filterFindsTasksByTheirDevices() {
        const TaskList list = parsed({task("a", "pTaskProcessing", {device(1, "pTaskProcessing")}),
                                      task("b", "pTaskFailed", {device(2, "pTaskFailed")}),
                                      task("c", "pTaskDone", {device(3, "pTaskDone")})});
        const auto ids = [&](TaskFilter::Kind kind, const QString &search) {
            QString found;
            for (const TaskRecordPtr &each : TaskFilter{kind, search}.apply(list))
                found += each->tid;
            return found;
        };
        QCOMPARE(ids(TaskFilter::Kind::All, "10.0.0.2"), QString("b"));
        QCOMPARE(ids(TaskFilter::Kind::All, "nc-"), QString("abc"));
        QCOMPARE(ids(TaskFilter::Kind::Active, {}), QString("a"));
        QCOMPARE(ids(TaskFilter::Kind::Failed, {}), QString("b"));
        QCOMPARE(ids(TaskFilter::Kind::Failed, "10.0.0.3"), QString());
        QCOMPARE(ids(TaskFilter::Kind::All, "applied"), QString("c"));
    }

private:
    TaskList parsed(const std::vector<JSON> &values) {
        std::vector<TaskRecordPtr> records;
        for (const JSON &value : values)
            records.push_back(m_parser.parse(value, m_shown));
        return TaskList(std::move(records));
    }
    void show(TaskModel &model, const std::vector<JSON> &values) {
        m_shown = parsed(values);
        model.setTasks(m_shown.records());
    }

    TaskParser m_parser;
    TaskList m_shown;
};

NVLDM_TEST(TestTaskLists)
#include "tst_tasklists.moc"
