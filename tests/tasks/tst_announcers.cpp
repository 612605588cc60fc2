#include "support/testmain.h"
#include "tasks/notify/alarmannouncer.h"
#include "tasks/notify/taskannouncer.h"

#include <QTest>

namespace {

AlarmRecord lost(const QString &subject, qint64 createdAt, int description = AlarmRecord::ConnectionLost) {
    AlarmRecord alarm;
    alarm.alid = subject + QString::number(createdAt);
    alarm.description = description;
    alarm.subject = subject;
    alarm.hasSubject = true;
    alarm.createdAt = createdAt;
    return alarm;
}

/// "tid type state" texts as a list of tasks.
TaskList tasks(const QStringList &texts) {
    std::vector<TaskRecordPtr> records;
    for (const QString &text : texts) {
        const QStringList words = text.split(' ');
        auto record = std::make_shared<TaskRecord>();
        record->tid = words[0];
        record->type = words[1];
        record->state = words[2];
        records.push_back(std::move(record));
    }
    return TaskList(std::move(records));
}

QStringList texts(const std::vector<TaskAnnouncer::Announcement> &announcements) {
    QStringList list;
    for (const auto &each : announcements)
        list += each.tid + ": " + each.text;
    return list;
}

} // namespace

/// Which alarms and which steps of tasks come up on the desktop.
class TestAnnouncers : public QObject {
    Q_OBJECT

private slots:
    void newLostConnectionsAreTold() {
        AlarmAnnouncer announcer;
        QCOMPARE(announcer.follow({lost("old", 100)}), QStringList());
        QCOMPARE(announcer.follow({lost("b", 300), lost("x", 250, AlarmRecord::ConnectionRestored),
                                   lost("a", 200), lost("old", 100)}),
                 (QStringList{"Lost connection to a", "Lost connection to b"}));
        // Once told, and never for what is as old as the newest one seen.
        QCOMPARE(announcer.follow({lost("late", 300), lost("b", 300)}), QStringList());
        AlarmRecord nameless = lost({}, 400);
        nameless.hasSubject = false;
        QCOMPARE(announcer.follow({nameless}), QStringList());
        announcer.reset();
        QCOMPARE(announcer.follow({lost("c", 500)}), QStringList());
    }

    void stormIsOneMessage() {
        AlarmAnnouncer announcer;
        announcer.follow({});
        AlarmList storm;
        for (int i = 0; i < 3; ++i)
            storm.push_back(lost(QString::number(i), 100 + i));
        QCOMPARE(announcer.follow(storm).size(), 3);
        for (int i = 0; i < 47; ++i)
            storm.push_back(lost(QString::number(i), 200 + i));
        QCOMPARE(announcer.follow(storm).size(), 1);
    }

    void stepsOfUploadsAreTold() {
        TaskAnnouncer announcer;
        QCOMPARE(texts(announcer.follow(tasks({"1 deviceFWUpgrade pTaskDone"}))), QStringList());
        QCOMPARE(texts(announcer.follow(
                     tasks({"2 deviceFWUpgrade pTaskScheduled", "3 deviceRestart pTaskProcessing",
                            "4 devicePackageUpload pTaskScheduled", "1 deviceFWUpgrade pTaskDone"}))),
                 QStringList{"2: Task - Upload Firmware created"});
        QCOMPARE(texts(announcer.follow(
                     tasks({"2 deviceFWUpgrade pTaskProcessing", "3 deviceRestart pTaskFailed",
                            "4 devicePackageUpload pTaskProcessing", "1 deviceFWUpgrade pTaskDone"}))),
                 (QStringList{"2: Task - Upload Firmware processing",
                              "4: Task - Upload Package File processing"}));
        // A failure is told like a success; an end that was told is not told again.
        const TaskList ended =
            tasks({"2 deviceFWUpgrade pTaskFailed", "5 deviceConfigFileUpload pTaskUploadDone"});
        QCOMPARE(texts(announcer.follow(ended)),
                 (QStringList{"2: Task - Upload Firmware finished",
                              "5: Task - Upload Configuration File finished"}));
        QCOMPARE(texts(announcer.follow(ended)), QStringList());
    }

    void taskThatIsMissingForOnceIsNotNewAgain() {
        TaskAnnouncer announcer;
        const TaskList list = tasks({"1 deviceFWUpgrade pTaskDone"});
        announcer.follow(list);
        announcer.follow({});
        QCOMPARE(texts(announcer.follow(list)), QStringList());
    }
};

NVLDM_TEST(TestAnnouncers)
#include "tst_announcers.moc"
