#include "support/emulatorprocess.h"
#include "support/isolatedroot.h"

#include <QDate>
#include <QDir>
#include <QFileInfo>
#include <QProcess>
#include <QRegularExpression>
#include <QTest>

namespace {

constexpr int patienceMs = 20000;
const QByteArray instanceMessage = "An instance of this application is running!";

/// The client as a process whose output is watched.
class Client {
public:
    void start() {
        m_process.setProcessChannelMode(QProcess::MergedChannels);
        m_process.start(qEnvironmentVariable("NVLDM_CLIENT"), QStringList());
    }
    ~Client() { kill(); }

    /// True once the client has printed the text.
    bool prints(const QByteArray &text) {
        while (!m_output.contains(text)) {
            if (!m_process.waitForReadyRead(patienceMs))
                return false;
            m_output += m_process.readAll();
        }
        return true;
    }
    bool isRunning() {
        m_process.waitForFinished(0);
        return m_process.state() == QProcess::Running;
    }
    bool waitForEnd() { return m_process.waitForFinished(patienceMs); }
    int status() const { return m_process.exitStatus() == QProcess::NormalExit ? m_process.exitCode() : -1; }
    void kill() {
        m_process.kill();
        m_process.waitForFinished(patienceMs);
    }

private:
    QProcess m_process;
    QByteArray m_output;
};

} // namespace

class TestPrograms : public QObject {
    Q_OBJECT

private slots:
    void secondStartEnds() {
        const IsolatedRoot root;
        Client first;
        first.start();
        QVERIFY(first.prints("MainWindow constructor"));
        Client second;
        second.start();
        QVERIFY(second.prints(instanceMessage));
        QVERIFY(second.waitForEnd());
        QCOMPARE(second.status(), 0);
        QVERIFY(first.isRunning());
        // A client with a root of its own has nobody in its way.
        const IsolatedRoot otherRoot;
        Client third;
        third.start();
        QVERIFY(third.prints("MainWindow constructor"));
    }

    void startAfterACrash() {
        const IsolatedRoot root;
        for (int start = 0; start < 3; ++start) {
            Client client;
            client.start();
            QVERIFY(client.prints("MainWindow constructor"));
            client.kill();
        }
    }

    void logOfTheDay() {
        const IsolatedRoot root;
        const QDir folder(root.filePath("Logs"));
        Client client;
        client.start();
        QVERIFY(client.prints("MainWindow constructor"));
        // The day may have changed since the line was written.
        const QString today = QDate::currentDate().toString("yyyy-MM-dd");
        const QString name = folder.entryList({"*.log"}, QDir::Files).value(0);
        QVERIFY(name == today + ".log" ||
                name == QDate::fromString(today, Qt::ISODate).addDays(-1).toString("yyyy-MM-dd") + ".log");
        QTRY_VERIFY(root.read("Logs/" + name).contains("MainWindow constructor, file"));
        client.kill();
        const auto others = QFileDevice::ReadGroup | QFileDevice::WriteGroup | QFileDevice::ReadOther |
                            QFileDevice::WriteOther;
        QCOMPARE(QFileInfo(folder.filePath(name)).permissions() & others, QFileDevice::Permissions());
        QCOMPARE(QFileInfo(folder.path()).permissions() & others, QFileDevice::Permissions());
        static const QRegularExpression format(
            "^\\d{4}-\\d\\d-\\d\\d \\d\\d:\\d\\d:\\d\\d\\.\\d{3} (DEBUG|WARNING|CRITICAL|INFO: WARNING): "
            ".*, file: .*, line: \\d+, function: .*$");
        // The last one may have been cut by the kill.
        QList<QByteArray> lines = root.read("Logs/" + name).split('\n');
        lines.removeLast();
        for (const QByteArray &line : lines)
            QVERIFY2(format.match(QString::fromUtf8(line)).hasMatch(), line.constData());
        static const QRegularExpression constructed(
            "DEBUG: MainWindow constructor, file: \\S*mainwindow\\.cpp, "
            "line: [1-9]\\d*, function: .*MainWindow::MainWindow");
        QVERIFY(QString::fromUtf8(root.read("Logs/" + name)).contains(constructed));
    }

    void serviceThatDiesTakesNobodyAlong() {
        const IsolatedRoot root;
        EmulatorProcess service(root.path());
        QVERIFY(service.start({"--fault", "no-answer@/v1/accm/list"}));
        Client client;
        client.start();
        QVERIFY(client.prints("Local server online!"));
        service.kill();
        QVERIFY(client.prints("HTTP API(memberList) failed!"));
        QVERIFY(client.prints("member list: "));
        QVERIFY(client.isRunning());
    }
};

QTEST_GUILESS_MAIN(TestPrograms)
#include "tst_programs.moc"
