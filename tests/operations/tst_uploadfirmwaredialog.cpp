#include "devices/operations/firmware/uploadfirmwaredialog.h"
#include "support/testmain.h"

#include "devices/operations/files/filefield.h"
#include "devices/operations/firmware/modelgroupmodel.h"
#include "devices/operations/firmware/schedulefield.h"
#include "devices/operations/rollout/rolloutbanner.h"
#include "devices/operations/rollout/rolloutmgr.h"
#include "devices/operations/targetsummary.h"
#include "store/storewriter.h"
#include "support/devicemaker.h"
#include "support/fakelists.h"
#include "support/isolatedroot.h"
#include "tasks/panels/failedtaskbanner.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "tasks/service/taskinfopool.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLabel>
#include <QPointer>
#include <QPushButton>
#include <QRadioButton>
#include <QSpinBox>
#include <QTest>
#include <QToolButton>

using nlohmann::json;

namespace {

const QString unknownFit = "cannot be told, the device will judge";

/// Ten devices: DV0 to DV5 of one model, DV6 to DV9 of another; DV0 cannot be reached.
OperationTargets::List targets() {
    std::vector<JSON> values;
    std::vector<DeviceStatusCode> codes(10, DeviceStatusCode::Authorized);
    codes[0] = DeviceStatusCode::Unreachable;
    for (int i = 0; i < 10; ++i)
        values.push_back(DeviceMaker::record(
            i, {{"d_model", i < 6 ? "NC-4210" : "NC-9381"}, {"d_fw", i == 5 ? "2.3.8" : "2.4.1"}}));
    DeviceInventory inventory;
    const DeviceSnapshotPtr snapshot = DeviceMaker::snapshot(values);
    inventory.replace(snapshot, codes);
    std::vector<DeviceRecordPtr> devices;
    for (int i = 0; i < snapshot->size(); ++i)
        devices.push_back(snapshot->at(i));
    return OperationTargets::of(devices, inventory, {});
}

} // namespace

/// The dialog as a user meets it, on a service that answers what the test says.
class TestUploadFirmwareDialog : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_service = std::make_unique<FakeLists>();
        open();
    }
    void cleanup() {
        delete m_dialog;
        m_service.reset();
        CTaskInfoPool::instance().clear();
        StoreWriter::flush();
        CLocalStore::instance().setFwUploadOnlyApplyFail(false);
        CLocalStore::instance().setFWUploadScheduleOn(false);
    }

    void imageIsJudged_data();
    void imageIsJudged();
    void anotherImageTicksTheGroupsAgain();
    void groupsAndDevicesAreTickedTogether();
    void uploadsAtItsTime();
    void onlyDevicesWhoseLastUploadFailed();
    void limitOfTheServiceIsShown();
    void wavesAreFollowedInTheStrip();
    void failedWaveIsOfferedOnce();

private:
    void open() {
        delete m_dialog;
        m_dialog = new UploadFirmwareDialog(targets());
        m_dialog->open();
        QTRY_VERIFY(part<QCheckBox>("onlyFailedCheckBox")->isEnabled());
    }
    template <typename Part>
    Part *part(const char *name) const {
        return m_dialog->findChild<Part *>(QLatin1String(name));
    }
    FileField *field() const { return m_dialog->findChild<FileField *>(); }
    TargetSummary *box() const { return m_dialog->findChild<TargetSummary *>(); }
    QPushButton *accept() const { return part<QPushButton>("uploadButton"); }
    void choose(const QString &path) {
        field()->setPath(path);
        QTRY_VERIFY(!field()->isChecking());
    }
    void chooseImage(const QByteArray &content) {
        m_root.write("image.bin", content);
        choose(m_root.filePath("image.bin"));
    }
    QString cell(int row, int column) const {
        return m_dialog->findChild<ModelGroupModel *>()->index(row, column).data().toString();
    }

    IsolatedRoot m_root;
    std::unique_ptr<FakeLists> m_service;
    QPointer<UploadFirmwareDialog> m_dialog;
};

void TestUploadFirmwareDialog::imageIsJudged_data() {
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<QStringList>("fits"); // of both groups
    QTest::addColumn<int>("ticked");
    QTest::addColumn<bool>("accepted");
    const QString other = "another model group";
    const auto row = [](const QByteArray &content, const QStringList &fits, int ticked, bool accepted) {
        QTest::newRow(content.left(40)) << content << fits << ticked << accepted;
    };
    row("NVLFW1 NC-42 2.5.0\nrest", {"fits", other}, 6, true);
    row("NVLFW1 NR,NC 2.5.0\n", {"fits", "fits"}, 10, true);
    row("NVLFW1 NR-1 2.5.0\n", {other, other}, 0, false);
    row("anything", {unknownFit, unknownFit}, 10, true);
    row("NVLFW1 NC-4210\n", {"", ""}, 10, false);
    row("NVLFW1 NC,,NR 2.5.0\n", {"", ""}, 10, false);
    row("NVLFW1 NC latest\n", {"", ""}, 10, false);
    row("NVLFW1 " + QByteArray(5000, 'N') + " 2.5.0\n", {"", ""}, 10, false);
}

void TestUploadFirmwareDialog::imageIsJudged() {
    QFETCH(const QByteArray, content);
    QFETCH(const int, ticked);
    QVERIFY(!accept()->isEnabled());
    chooseImage(content);
    QTEST(QStringList({cell(0, 3), cell(1, 3)}), "fits");
    QCOMPARE(box()->tickedCount(), ticked);
    QCOMPARE(accept()->text(), QStringLiteral("Upload to %1").arg(ticked));
    QTEST(accept()->isEnabled(), "accepted");
    QCOMPARE(part<QLabel>("fileStateLabel")->text().contains("damaged"), cell(0, 3).isEmpty());
}

void TestUploadFirmwareDialog::anotherImageTicksTheGroupsAgain() {
    box()->setTicked({7}, false);
    chooseImage("NVLFW1 NC-42 2.5.0\n");
    QCOMPARE(box()->tickedCount(), 6);
    chooseImage("NVLFW1 NC-93 2.5.0\n");
    // What the user has left out stays out.
    QCOMPARE(box()->tickedIds(), QStringList({"DV6", "DV8", "DV9"}));
    // Ticked against the advice, so it is told.
    emit m_dialog->findChild<ModelGroupModel *>()->groupToggled(0, true);
    QStringList told;
    for (const QLabel *line : m_dialog->findChildren<QLabel *>("targetWarningLabel")) {
        if (line->isVisible())
            told += line->text();
    }
    QVERIFY2(told.join(' ').contains("6 device(s) will fail: the image is for another model group."),
             qUtf8Printable(told.join(' ')));
}

void TestUploadFirmwareDialog::groupsAndDevicesAreTickedTogether() {
    auto *groups = m_dialog->findChild<ModelGroupModel *>();
    QCOMPARE((QStringList{cell(0, 0), cell(0, 1), cell(0, 2)}),
             QStringList({"NC-4210", "6", "2.4.1, 2.3.8"}));
    box()->setTicked({1, 2}, false);
    QCOMPARE(cell(0, 1), "4 of 6");
    groups->setData(groups->index(0, 0), Qt::Unchecked, Qt::CheckStateRole);
    QCOMPARE(box()->tickedIds(), QStringList({"DV6", "DV7", "DV8", "DV9"}));
    QVERIFY(!groups->isChecked(0) && groups->isChecked(1));
    groups->setData(groups->index(0, 0), Qt::Checked, Qt::CheckStateRole);
    QCOMPARE(accept()->text(), "Upload to 10");
}

void TestUploadFirmwareDialog::uploadsAtItsTime() {
    chooseImage("NVLFW1 NC-93 2.5.0\n");
    part<QRadioButton>("atRadioButton")->click();
    QCOMPARE(accept()->text(), "Schedule for 4");
    auto *schedule = m_dialog->findChild<ScheduleField *>();
    schedule->setTime(QDateTime::currentDateTime().addSecs(-60));
    QVERIFY(part<QLabel>("scheduleWarningLabel")->isVisible() && !accept()->isEnabled());
    const QDateTime later = QDateTime::currentDateTime().addDays(1);
    schedule->setTime(later);
    QCOMPARE(part<QLabel>("zoneLabel")->text(), ScheduleField::zoneText(later));
    QTest::mouseClick(accept(), Qt::LeftButton);
    QTRY_VERIFY(!m_dialog);
    QTRY_COMPARE(m_service->rawSentTo("/v1/fwupl").size(), 1u);
    const json devices = m_service->sentTo("/v1/task/init").at(0).at("devices");
    QCOMPARE(devices.size(), 4u);
    const qint64 minute = later.toMSecsSinceEpoch() / 60000 * 60000;
    QCOMPARE(devices[0]["actm"].get<std::string>(), std::to_string(minute));
    QVERIFY(devices[0]["fwid"].get<std::string>().starts_with("FW"));
    StoreWriter::flush();
    open();
    QVERIFY(part<QRadioButton>("atRadioButton")->isChecked());
    qputenv("TZ", "Asia/Kolkata");
    tzset();
    QCOMPARE(ScheduleField::zoneText(QDateTime::currentDateTime()), "Asia/Kolkata (UTC+5:30)");
    qunsetenv("TZ");
    tzset();
}

void TestUploadFirmwareDialog::onlyDevicesWhoseLastUploadFailed() {
    const auto task = [](const char *tid, const char *type, const char *status, const json &states) {
        json devices = json::array();
        for (const auto &[id, state] : states.items())
            devices.push_back({{"id", id}, {"state", state}});
        return json{{"tid", tid}, {"type", type}, {"status", status}, {"devices", devices}};
    };
    const char *const firmware = "deviceFWUpgrade";
    const char *const failed = "pTaskFailed";
    m_service->setTasks(
        {task("T4", "deviceRestart", failed, {{"DV9", failed}}),
         task("T3", firmware, failed, {{"DV1", "pTaskDone"}, {"DV6", "pTaskBrokenFile_01"}}),
         task("T2", firmware, "pTaskProcessing", {{"DV2", "pTaskDeviceIsUpdating"}}),
         task("T1", firmware, failed,
              {{"DV1", failed}, {"DV2", failed}, {"DV3", failed}, {"DV4", "pTaskQueueState"}})});
    CTaskInfoPool::instance().loadTaskStatuses();
    QTRY_VERIFY(CTaskInfoPool::instance().isTaskListLoaded());
    open();
    chooseImage("NVLFW1 NC-42 2.5.0\n");
    box()->setTicked({3}, false);
    auto *only = part<QCheckBox>("onlyFailedCheckBox");
    only->click();
    // DV6 has another model, DV3 was left out before.
    QCOMPARE(box()->targets().size(), 3u);
    QCOMPARE(box()->tickedIds(), QStringList{"DV4"});
    only->click();
    QCOMPARE(box()->tickedCount(), 5);
    only->click();
    QTest::mouseClick(accept(), Qt::LeftButton);
    QTRY_VERIFY(!m_dialog);
    StoreWriter::flush();
    QVERIFY(CLocalStore::instance().isFwUploadOnlyApplyFail());
}

void TestUploadFirmwareDialog::limitOfTheServiceIsShown() {
    auto *note = part<QLabel>("footNoteLabel");
    QVERIFY(note->text().isEmpty());
    m_service->setAnswer("/v1/config/get",
                         {{"svr_fw_upload_limit_enabled", 1}, {"svr_fw_upload_limit", "20"}});
    open();
    note = part<QLabel>("footNoteLabel");
    QTRY_COMPARE(note->text(), "20 at a time");
}

void TestUploadFirmwareDialog::wavesAreFollowedInTheStrip() {
    RolloutBanner strip;
    QVERIFY(!strip.isVisible());
    chooseImage("NVLFW1 NC 2.5.0\n");
    part<QCheckBox>("inWavesCheckBox")->click();
    part<QComboBox>("firstUnitComboBox")->setCurrentIndex(1);
    part<QSpinBox>("firstSpinBox")->setValue(21);
    QCOMPARE(accept()->text(), "Upload to 3, then 7");
    QTest::mouseClick(accept(), Qt::LeftButton);
    QTRY_VERIFY(!m_dialog);
    // Every model is among the first ones, and DV0, which will fail, is the last of all.
    const QStringList order = RolloutMgr::instance().rollouts().at(0)->plan().deviceIds;
    QCOMPARE(order.mid(0, 3), QStringList({"DV1", "DV6", "DV2"}));
    QCOMPARE(order.last(), "DV0");
    const auto *standing = strip.findChild<QLabel *>("rolloutStandingLabel");
    QVERIFY(strip.isVisible());
    QTRY_COMPARE(standing->text(), "First wave: 3 of 3 done, 3 failed.");
    strip.findChild<QToolButton *>("stopRolloutButton")->click();
    QCOMPARE(standing->text(),
             "First wave: 3 of 3 done, 3 failed. Stopped. Waiting for the second wave: 7 device(s).");
    strip.findChild<QToolButton *>("continueRolloutButton")->click();
    QCOMPARE(RolloutMgr::instance().rollouts().at(0)->state(), Rollout::State::FirstWave);
    strip.findChild<QToolButton *>("stopRolloutButton")->click();
    strip.findChild<QToolButton *>("dismissRolloutButton")->click();
    QVERIFY(!strip.isVisible() && RolloutMgr::instance().rollouts().empty());
}

void TestUploadFirmwareDialog::failedWaveIsOfferedOnce() {
    FailedTaskBanner failures;
    const auto countOfUploads = [this] { return m_service->sentTo("/v1/task/init").size(); };
    chooseImage("NVLFW1 NC 2.5.0\n");
    part<QCheckBox>("inWavesCheckBox")->click();
    m_service->setTaskMade(json::object());
    QTest::mouseClick(accept(), Qt::LeftButton);
    Rollout &rollout = *RolloutMgr::instance().rollouts().at(0);
    QTRY_COMPARE(rollout.state(), Rollout::State::Stopped);
    QCOMPARE(rollout.progress().reason, Rollout::Reason::NotBegun);
    QVERIFY2(failures.isHidden(), "the rollout offers it");
    const std::size_t sent = countOfUploads();
    rollout.goOn();
    QTRY_COMPARE(rollout.state(), Rollout::State::Stopped);
    QCOMPARE(countOfUploads(), sent + 1);
    RolloutMgr::instance().dismiss(&rollout);
}

NVLDM_TEST(TestUploadFirmwareDialog)
#include "tst_uploadfirmwaredialog.moc"
