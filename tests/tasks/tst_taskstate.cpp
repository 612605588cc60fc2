#include "support/testmain.h"
#include "tasks/service/taskstate.h"

#include <QTest>

/// Texts, icons and judgements of state codes: what users read about a failure.
class TestTaskState : public QObject {
    Q_OBJECT

private slots:
    void codes_data() {
        QTest::addColumn<QString>("code");
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("cause");
        QTest::addColumn<int>("kind");
        QTest::addColumn<bool>("failure");
        const auto row = [](const char *code, const char *text, const char *cause, TaskState::Kind kind,
                            bool failure) {
            QTest::newRow(code) << code << text << cause << static_cast<int>(kind) << failure;
        };
        using Kind = TaskState::Kind;
        row("pTaskQueueState", "Queuing", "Queuing", Kind::Time, false);
        row("pTaskDonePending", "Applied successfully", "Applied successfully", Kind::Success, false);
        // Not "Failed to connect to device", whose code this one begins with.
        row("pTaskFailedToConnectToDeviceEx",
            "Failed to connect to device. Check device status and connection, then retry.",
            "Failed to connect to device", Kind::Warning, true);
        row("pTaskCertificateNotInstalled", "Certificate not installed", "Certificate not installed",
            Kind::Notice, true);
        row("pTaskBrokenFile_12",
            "Failed to upload: _12 Broken or invalid file. Select valid file, then retry.",
            "Broken or invalid file", Kind::Warning, true);
        row("x pInternalProcessError_03",
            "Failed to upload: _03 Internal process error.Contact Norvell technical support for further "
            "assistant.",
            "Internal process error", Kind::Warning, true);
        row("pTaskIncompatibleFirmware",
            "Failed to upload: Incompatible Firmware. Check the firmware release notes for compatibility.",
            "Incompatible Firmware", Kind::Warning, true);
        row("pTaskAborted", "pTaskAborted", "pTaskAborted", Kind::Notice, false);
        row("pT", "pT", "pT", Kind::Notice, false);
        row("", "", "", Kind::Notice, false);
    }
    void codes() {
        QFETCH(QString, code);
        QTEST(TaskState::text(code), "text");
        QTEST(TaskState::cause(code), "cause");
        QTEST(static_cast<int>(TaskState::kind(code)), "kind");
        QTEST(TaskState::isFailure(code), "failure");
    }

    void finalCodes() {
        for (const char *code :
             {"pTaskDone", "pTaskAborted", "pTaskFailed", "pTaskUploadDone", "pTaskSdCardError_01"})
            QVERIFY2(TaskState::isFinal(code), code);
        for (const char *code : {"pTaskInitState", "pTaskScheduled", "pTaskChecking", "pSomethingNew"})
            QVERIFY2(!TaskState::isFinal(code), code);
    }

    void iconsAreDrawnAtNine() {
        QIcon icon;
        TaskState::addIcon("pTaskDone", icon);
        QCOMPARE(icon.availableSizes().value(0), QSize(9, 9));
        QVERIFY(icon.pixmap(9, 9).toImage() != QImage(9, 9, icon.pixmap(9, 9).toImage().format()));
    }
};

NVLDM_TEST(TestTaskState)
#include "tst_taskstate.moc"
