#include "platform/toast/toast.h"
#include "support/fakelists.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"
#include "tasks/notify/notifier.h"
#include "tasks/panels/alarmpanel.h"
#include "tasks/panels/taskpanel.h"
#include "tasks/queue/exetaskmgr.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "tasks/service/retryregistry.h"
#include "tasks/service/taskinfopool.h"
#include "widgets/dialogs/confirmdialog.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QLabel>
#include <QLineEdit>
#include <QListView>
#include <QProgressBar>
#include <QPushButton>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTest>
#include <QToolButton>
#include <QTreeView>

using nlohmann::json;

namespace {

json device(int n, const char *state) {
    const std::string number = std::to_string(n);
    return {{"id", "DV" + number},     {"d_ip", "10.0.0." + number},
            {"d_mac", "MAC" + number}, {"d_model", "NC-1"},
            {"state", state},          {"progress", 100}};
}

json task(const std::string &tid, const char *state, json devices, bool active = false) {
    return {{"tid", tid},
            {"type", "deviceFWUpgrade"},
            {"user", "admin"},
            {"status", state},
            {"state", state},
            {"progress", 50},
            {"active", active},
            {"created_at", 1700000000000},
            {"devices", std::move(devices)}};
}

json alarm(int n, const char *about, int description = 2) {
    return {{"alid", "a" + std::to_string(n)},
            {"despid", description},
            {"actinfo", about},
            {"initm", std::to_string(1000 + n)},
            {"deviceid", std::string("DV") + about},
            {"d_ip", "10.0.0.1"}};
}

json page(const std::vector<json> &items) {
    return {{"items", items}, {"total_items", items.size()}};
}

/// A desktop that notes what it is shown, and can click on it.
class NotedToasts : public ToastPresenter {
public:
    bool initialize(const QString &, const QString &) override { return true; }
    void showToast(const Toast &toast, std::unique_ptr<ToastHandler> handler) override {
        texts += toast.text;
        last = std::move(handler);
    }
    QStringList texts;
    std::unique_ptr<ToastHandler> last;
};

} // namespace

/// The two panels as a user meets them, on lists of a service that is not there otherwise.
class TestPanels : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_log = std::make_unique<LogCapture>();
        m_service = std::make_unique<FakeLists>();
        auto toasts = std::make_unique<NotedToasts>();
        m_toasts = toasts.get();
        Notifier::instance().setPresenter(std::move(toasts));
    }
    void cleanup() {
        m_tasks.reset();
        m_alarms.reset();
        QVERIFY(NetTask::waitForAll(10000));
        m_service.reset();
        m_pool.clear();
        m_log.reset();
    }

    void refreshesKeepSelectionOpenRowsAndPlace() {
        std::vector<json> list;
        for (int i = 0; i < 60; ++i)
            list.push_back(
                task("t" + std::to_string(i), "pTaskDone", {device(1, "pTaskDone"), device(2, "pTaskDone")}));
        showTasks(list);
        auto *tree = m_tasks->findChild<QTreeView *>("taskTree");
        const QPersistentModelIndex opened = tree->model()->index(10, 0);
        tree->expand(opened);
        QTest::mouseClick(tree->viewport(), Qt::LeftButton, {},
                          tree->visualRect(tree->model()->index(1, 0)).center());
        tree->scrollTo(opened, QAbstractItemView::PositionAtTop);
        const QPersistentModelIndex selected = tree->currentIndex();
        const int place = tree->visualRect(opened).top();

        list.insert(list.begin(), task("new", "pTaskProcessing", {device(3, "pTaskProcessing")}, true));
        list.erase(list.begin() + 3);
        m_service->setTasks(list);
        loadTasks();
        QCOMPARE(tree->model()->rowCount(), 60);
        QVERIFY(tree->isExpanded(opened));
        QCOMPARE(tree->visualRect(opened).top(), place);
        QVERIFY(tree->selectionModel()->isSelected(selected));
        QCOMPARE(selected.row(), 2);
    }

    void failedDevicesAreRetriedByWhoeverKnowsHow() {
        showTasks({task("mine", "pTaskFailed", {device(1, "pTaskDone"), device(2, "pTaskBrokenFile_01")}),
                   task("theirs", "pTaskFailed", {device(3, "pTaskFailed")}),
                   task("whole", "pTaskFailed", {device(4, "pTaskDone"), device(5, "pTaskInitState")})});
        QStringList repeated;
        RetryRegistry::instance().remember("whole", {[&](const QStringList &ids) { repeated = ids; }});
        RetryRegistry::instance().remember("mine", {[&](const QStringList &ids) { repeated = ids; }});
        auto *retry = m_tasks->findChild<QToolButton *>("retryTaskButton");
        select(1);
        QVERIFY(!retry->isEnabled());
        QVERIFY(m_tasks->findChild<QLabel *>("taskHintLabel")->text().contains("started elsewhere"));
        select(0);
        QTest::mouseClick(retry, Qt::LeftButton);
        QCOMPARE(repeated, QStringList{"DV2"});
        select(2);
        QTest::mouseClick(retry, Qt::LeftButton);
        QVERIFY2(repeated == QStringList{"DV5"}, "the task ended before it came to it");
    }

    void rowsSayToScreenReadersWhatTheyShow() {
        const json updating = task("t", "pTaskProcessing", {device(1, "pTaskProcessing")}, true);
        showTasks({updating, task("f", "pTaskFailed", {device(2, "pTaskBrokenFile_01")})});
        const auto said = [](const QModelIndex &row) { return row.data(Qt::AccessibleTextRole).toString(); };
        const QAbstractItemModel *model = m_tasks->findChild<QTreeView *>("taskTree")->model();
        const QModelIndex running = model->index(0, 0);
        QVERIFY2(said(running).startsWith("Upload Firmware, 1 device(s) · Processing, 50 %, admin, "),
                 qUtf8Printable(said(running)));
        QVERIFY2(said(model->index(1, 0)).contains("1 of 1 failed: "),
                 qUtf8Printable(said(model->index(1, 0))));
        QCOMPARE(said(model->index(1, 0, running)), QString("NC-1 · 10.0.0.1 · MAC1, Processing, 100 %"));
        m_alarms = std::make_unique<AlarmPanel>();
        m_service->setAlarms(page({alarm(1, "one")}));
        loadAlarms();
        const QModelIndex first = m_alarms->findChild<QListView *>("alarmList")->model()->index(0, 0);
        QVERIFY2(said(first).startsWith("Unread, Lost connection to one, 10.0.0.1, "),
                 qUtf8Printable(said(first)));
    }

    void runningTaskIsCancelledAfterAQuestion() {
        showTasks({task("run", "pTaskProcessing", {device(1, "pTaskProcessing")}, true)});
        QVERIFY(!button("cancelTaskButton")->isEnabled());
        select(0);
        QVERIFY(!button("removeTaskButton")->isEnabled());
        QTest::mouseClick(button("cancelTaskButton"), Qt::LeftButton);
        answerQuestion("cancelButton");
        QTest::mouseClick(button("cancelTaskButton"), Qt::LeftButton);
        answerQuestion("acceptButton");
        QTRY_VERIFY(!m_service->sentTo("/v1/task/updateState").empty());
        const auto sent = m_service->sentTo("/v1/task/updateState");
        QCOMPARE(sent.size(), 1u);
        QVERIFY(sent[0]["task_id"] == "run");
        QVERIFY(sent[0]["task_state"] == "pTaskAborted");
        QTRY_VERIFY(button("cancelTaskButton")->isEnabled());
    }

    void finishedTasksAreRemovedEvenWhenOneIsGone() {
        showTasks({task("a", "pTaskDone", json::array()), task("run", "pTaskProcessing", json::array(), true),
                   task("b", "pTaskFailed", json::array())});
        m_service->setTasks(
            {task("run", "pTaskProcessing", json::array(), true), task("b", "pTaskFailed", json::array())});
        m_service->refuse("/v1/task/rm", 4);
        QTest::mouseClick(button("removeFinishedButton"), Qt::LeftButton);
        answerQuestion("acceptButton");
        QTRY_VERIFY(m_tasks->findChild<QTreeView *>("taskTree")->model()->rowCount() == 2);
        QTRY_VERIFY(button("removeFinishedButton")->isEnabled());
        const auto sent = m_service->sentTo("/v1/task/rm");
        QCOMPARE(sent.size(), 2u);
        QVERIFY(sent[0]["tids"] == (json{"a", "b"}));
        QVERIFY(sent[1]["tids"] == json::array({"b"}));
    }

    void copiedTaskNamesItsFailedDevicesFirst() {
        showTasks(
            {task("t", "pTaskFailed", {device(1, "pTaskDone"), device(2, "pTaskFailedToConnectToDevice")})});
        select(0);
        QTest::keySequence(m_tasks->findChild<QTreeView *>("taskTree"), QKeySequence::Copy);
        const QStringList lines = QGuiApplication::clipboard()->text().split('\n');
        QCOMPARE(lines.size(), 5);
        QCOMPARE(lines[2], QString("1 of 2 failed: 1 Failed to connect to device"));
        QCOMPARE(lines[3], QString("NC-1\t10.0.0.2\tMAC2\tFailed to connect to device\t100 %"));
    }

    void searchAndFilterSayWhenNothingMatches() {
        showTasks({task("t", "pTaskDone", {device(7, "pTaskDone")})});
        auto *tree = m_tasks->findChild<QTreeView *>("taskTree");
        QTest::keyClicks(m_tasks->findChild<QLineEdit *>("taskSearchEdit"), "10.0.0.8");
        QTRY_COMPARE(tree->model()->rowCount(), 0);
        QVERIFY(m_tasks->findChild<QLabel *>("panelEmptyLabel")->text().contains("matches"));
        m_tasks->findChild<QLineEdit *>("taskSearchEdit")->clear();
        QTRY_COMPARE(tree->model()->rowCount(), 1);
        QTest::mouseClick(button("taskFilterFailedButton"), Qt::LeftButton);
        QCOMPARE(tree->model()->rowCount(), 0);
    }

    void failedPollSaysHowOldTheListIs() {
        showTasks({task("t", "pTaskDone", json::array())});
        auto *hint = m_tasks->findChild<QLabel *>("taskHintLabel");
        QCOMPARE(hint->text(), QString());
        m_service->refuse("/v1/task/list", 3);
        m_pool.loadTaskStatuses();
        QTRY_VERIFY(hint->text().startsWith("The tasks could not be read since "));
        QCOMPARE(m_tasks->findChild<QTreeView *>("taskTree")->model()->rowCount(), 1);
    }

    void uploadEndsOnTheDesktop() {
        showTasks({task("t", "pTaskProcessing", json::array(), true)});
        QCOMPARE(m_toasts->texts, QStringList());
        m_service->setTasks({task("t", "pTaskFailed", json::array())});
        loadTasks();
        QCOMPARE(m_toasts->texts, QStringList{"Task - Upload Firmware finished"});
        QSignalSpy clicked(&Notifier::instance(), &Notifier::notificationClicked);
        m_toasts->last->toastActivated(1);
        m_toasts->last->toastDismissed();
        QCOMPARE(clicked.count(), 0);
        m_toasts->last->toastActivated(0);
        m_toasts->last->toastActivated();
        QCOMPARE(clicked.count(), 2);
        QCOMPARE(clicked[0][0].toInt(), 1);
        Notifier::instance().setEnabled(true, false);
        Notifier::instance().ShowMessage("no", Notifier::Task);
        Notifier::instance().ShowMessage("no", 2);
        QCOMPARE(m_toasts->texts.size(), 1);
        QCOMPARE(m_log->count("Unsupported notification type when Notifier::ShowMessage"), 1);
        Notifier::instance().setEnabled(true, true);
    }

    void operationThatDidNotBeginIsToldAndStartedAgain() {
        showTasks({});
        auto *strip = m_tasks->findChild<QFrame *>("failedTaskStrip");
        QVERIFY(!strip->isVisible());
        m_service->refuse("/v1/task/init", 3);
        ExeTaskMgr &manager = ExeTaskMgr::instance();
        QVERIFY(manager.insertNewAutoAssignIpTask({"DV1", "DV2"}));
        QVERIFY(manager.insertNewExportDebugInfoTask({"DV1"}, "/reports"));
        auto *text = m_tasks->findChild<QLabel *>("failedTaskLabel");
        auto *count = m_tasks->findChild<QLabel *>("failedTaskCountLabel");
        QTRY_VERIFY(strip->isVisible() && count->isVisible());
        QCOMPARE(count->text(), QString("1 of 2"));
        QCOMPARE(
            text->text(),
            QString("Assign IP Address (Auto) on 2 device(s) did not begin. Reason: the server refused it."));
        m_service->refuse("/v1/task/init", 0);
        QTest::mouseClick(button("startAgainButton"), Qt::LeftButton);
        QVERIFY(text->text().startsWith("Export Debug Info"));
        QTest::mouseClick(button("dismissFailedTaskButton"), Qt::LeftButton);
        QVERIFY(!strip->isVisible());
        QTRY_COMPARE_WITH_TIMEOUT(m_service->sentTo("/v1/assip/auto").size(), 1u, 10000);
        QVERIFY(m_service->sentTo("/v1/export/debif").empty());

        m_service->reply("/v1/assip/auto", ScriptedPeer::Reply{});
        QVERIFY(manager.insertNewAutoAssignIpTask({"DV1"}));
        QTRY_VERIFY_WITH_TIMEOUT(text->isVisible() && text->text().contains("may have begun"), 10000);
        QVERIFY(!button("startAgainButton")->isVisible());
        QTest::mouseClick(button("dismissFailedTaskButton"), Qt::LeftButton);
        QVERIFY(!strip->isVisible());
    }

    void uploadIsShownAndCancelled() {
        showTasks({});
        auto *strip = m_tasks->findChild<QFrame *>("transferStrip");
        QVERIFY(!strip->isVisible());
        QVERIFY(m_root.write("image.bin", QByteArray(100000, 'x')));
        m_service->hold("/v1/fwupl");
        QVERIFY(UploadTaskMgr::instance().insertNewFWUploadTask("auto", m_root.filePath("image.bin"),
                                                                "image.bin", {"DV1"}, "FW1", ""));
        auto *progress = m_tasks->findChild<QLabel *>("transferProgressLabel");
        QTRY_VERIFY_WITH_TIMEOUT(strip->isVisible() && progress->text().contains("waiting"), 10000);
        QCOMPARE(m_tasks->findChild<QLabel *>("transferNameLabel")->text(), QString("image.bin"));
        auto *bar = m_tasks->findChild<QProgressBar *>("transferBar");
        QCOMPARE(bar->value(), bar->maximum());
        QTest::mouseClick(button("cancelTransferButton"), Qt::LeftButton);
        QVERIFY(!button("cancelTransferButton")->isEnabled());
        QTRY_VERIFY_WITH_TIMEOUT(!strip->isVisible(), 1000);
        QTRY_COMPARE(m_service->sentTo("/v1/task/updateState").size(), 1u);
        QTRY_VERIFY(!UploadTaskMgr::instance().isBusy());
        QCoreApplication::processEvents();
        QVERIFY2(!m_tasks->findChild<QFrame *>("failedTaskStrip")->isVisible(), "it is no failure");
    }

    void alarmsAreReadOnceThePanelIsSeen() {
        m_alarms = std::make_unique<AlarmPanel>();
        QSignalSpy unread(m_alarms.get(), &AlarmPanel::alarmUnreadCountUpdated);
        json listed = page({alarm(2, "two"), alarm(1, "one")});
        listed["total_items"] = 5; // three more than the list reaches
        m_service->setAlarms(listed);
        loadAlarms();
        QCOMPARE(unread.last()[0].toInt(), 5);
        m_alarms->show();
        QCOMPARE(unread.last()[0].toInt(), 0);
        m_alarms->hide();
        m_service->setAlarms(page({alarm(3, "three"), alarm(2, "two")}));
        loadAlarms();
        QCOMPARE(unread.last()[0].toInt(), 1);
        QCOMPARE(m_toasts->texts, QStringList{"Lost connection to three"});

        // Another run of the client knows what was read in this one; the session does not matter.
        m_alarms = std::make_unique<AlarmPanel>();
        QSignalSpy again(m_alarms.get(), &AlarmPanel::alarmUnreadCountUpdated);
        loadAlarms();
        QCOMPARE(again.last()[0].toInt(), 1);
    }

    void activatedAlarmNamesItsDevice() {
        m_alarms = std::make_unique<AlarmPanel>();
        m_alarms->resize(340, 600);
        m_alarms->show();
        m_service->setAlarms(page({alarm(2, "two"), alarm(1, "one")}));
        loadAlarms();
        auto *list = m_alarms->findChild<QListView *>("alarmList");
        QSignalSpy chosen(m_alarms.get(), &AlarmPanel::deviceChosen);
        const auto rowCentre = [list](int row) {
            return list->visualRect(list->model()->index(row, 0)).center();
        };
        for (const Qt::KeyboardModifier with : {Qt::NoModifier, Qt::ControlModifier, Qt::ShiftModifier})
            QTest::mouseClick(list->viewport(), Qt::LeftButton, with, rowCentre(0));
        QTest::mouseClick(list->viewport(), Qt::LeftButton, {}, rowCentre(1));
        QCOMPARE(chosen.count(), 0);
        QTest::mouseDClick(list->viewport(), Qt::LeftButton, {}, rowCentre(1));
        QTest::keyClick(list, Qt::Key_Return);
        QCOMPARE(chosen.count(), 2);
        QCOMPARE(chosen[0][0].toString(), QString("DVone"));
        QCOMPARE(chosen[1][0].toString(), QString("DVone"));
        QTest::keyClick(list, Qt::Key_Delete);
        QTRY_VERIFY(!m_service->sentTo("/v1/alarm/rm").empty());
        const auto sent = m_service->sentTo("/v1/alarm/rm");
        QVERIFY(sent[0]["alids"] == json::array({"a1"}));
    }

private:
    void showTasks(const std::vector<json> &list) {
        m_tasks = std::make_unique<TaskPanel>();
        m_tasks->resize(340, 600);
        m_tasks->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_tasks.get()));
        m_service->setTasks(list);
        loadTasks();
    }
    void loadTasks() { load(&CTaskInfoPool::loadTaskStatuses, &CTaskInfoPool::taskListUpdated); }
    void loadAlarms() { load(&CTaskInfoPool::loadAlarmInfo, &CTaskInfoPool::alarmListUpdated); }
    void load(void (CTaskInfoPool::*start)(), void (CTaskInfoPool::*updated)()) {
        NetTask::waitForAll(5000);
        QSignalSpy spy(&m_pool, updated);
        (m_pool.*start)();
        QTRY_VERIFY(spy.count() > 0);
    }
    void select(int row) {
        auto *tree = m_tasks->findChild<QTreeView *>("taskTree");
        QTest::mouseClick(tree->viewport(), Qt::LeftButton, {},
                          tree->visualRect(tree->model()->index(row, 0)).center());
    }
    QToolButton *button(const char *name) { return m_tasks->findChild<QToolButton *>(name); }
    void answerQuestion(const char *with) {
        QPointer<ConfirmDialog> question = m_tasks->findChild<ConfirmDialog *>();
        QVERIFY(question);
        QTest::mouseClick(question->findChild<QPushButton *>(with), Qt::LeftButton);
        QTRY_VERIFY(!question);
    }

    IsolatedRoot m_root;
    CTaskInfoPool &m_pool = CTaskInfoPool::instance();
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<FakeLists> m_service;
    std::unique_ptr<TaskPanel> m_tasks;
    std::unique_ptr<AlarmPanel> m_alarms;
    NotedToasts *m_toasts = nullptr;
};

NVLDM_TEST(TestPanels)
#include "tst_panels.moc"
