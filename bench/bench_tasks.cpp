// A poll of ten thousand tasks with the panel that shows them, and the texts of state codes.
//   bench_tasks EMULATOR FOLDER

#include "api/client/apiclient.h"
#include "api/session/nettask.h"
#include "platform/log/messagelog.h"
#include "store/localstore.h"
#include "tasks/panels/taskpanel.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/taskstate.h"
#include "widgets/style/theme.h"

#include <QAbstractEventDispatcher>
#include <QApplication>
#include <QElapsedTimer>
#include <QProcess>
#include <QRegularExpression>
#include <QTreeView>

#include <cstdio>

namespace {

constexpr int tasks = 10000;
constexpr int devicesPerTask = 100;
constexpr int texts = 100000;
constexpr const char *account = "admin";

double milliseconds(const std::function<void()> &work) {
    QElapsedTimer timer;
    timer.start();
    work();
    return static_cast<double>(timer.nsecsElapsed()) / 1e6;
}

/// The time from one return of the event loop to its next wait, at its longest: how long the window stood
/// still.
class LongestTurn : public QObject {
public:
    LongestTurn() {
        QAbstractEventDispatcher *loop = QAbstractEventDispatcher::instance();
        connect(loop, &QAbstractEventDispatcher::awake, this, [this] { m_turn.start(); });
        connect(loop, &QAbstractEventDispatcher::aboutToBlock, this, [this] {
            if (m_turn.isValid())
                m_max = std::max(m_max, m_turn.nsecsElapsed());
        });
    }
    double take() { return static_cast<double>(std::exchange(m_max, 0)) / 1e6; }

private:
    QElapsedTimer m_turn;
    qint64 m_max = 0;
};

int startEmulator(QProcess &emulator, const QString &program, const QString &folder) {
    emulator.setProcessChannelMode(QProcess::SeparateChannels);
    emulator.start(program,
                   {"--root", folder + "/service", "--port", "0", "--devices", "5000", "--life", "0",
                    "--tasks", QString::number(tasks), "--task-devices", QString::number(devicesPerTask)});
    QByteArray output;
    while (!output.contains('\n') && emulator.waitForReadyRead(120000))
        output += emulator.readAllStandardOutput();
    return QRegularExpression(":(\\d+)\\s*$").match(QString::fromUtf8(output)).captured(1).toInt();
}

bool logIn(int port) {
    unsigned result = ApiException;
    NetTask::runAndWait([&] {
        result = CApiClient("127.0.0.1", static_cast<std::uint32_t>(port)).loginServer(account, "admin");
    });
    CLocalStore &store = CLocalStore::instance();
    store.setLoginInfo("127.0.0.1", static_cast<quint32>(port), account, store.access());
    return result == ApiOk;
}

/// One poll, from its start to the panel's last paint.
bool poll(LongestTurn &turns, const char *what) {
    CTaskInfoPool &pool = CTaskInfoPool::instance();
    bool ended = false;
    bool good = false;
    const auto updated =
        QObject::connect(&pool, &CTaskInfoPool::taskListUpdated, [&] { good = ended = true; });
    const auto failed = QObject::connect(&pool, &CTaskInfoPool::taskListFailed, [&] { ended = true; });
    QApplication::processEvents();
    // A poll is not begun while the last one's thread is still ending.
    NetTask::waitForAll(10000);
    turns.take();
    const double time = milliseconds([&] {
        pool.loadTaskStatuses();
        while (!ended)
            QApplication::processEvents(QEventLoop::WaitForMoreEvents);
    });
    const double end = milliseconds([] { QApplication::processEvents(); });
    QObject::disconnect(updated);
    QObject::disconnect(failed);
    std::printf("%-32s %9.0f ms   longest turn %6.1f ms   at most 16\n", what, time,
                std::max(turns.take(), end));
    return good;
}

void measureTexts() {
    const QStringList codes{"pTaskProcessing", "pTaskDone", "pTaskFailedToConnectToDeviceEx",
                            "pTaskBrokenFile_12", "pSomethingElse"};
    qsizetype letters = 0;
    const double own = milliseconds([&] {
        for (int i = 0; i < texts; ++i)
            letters += TaskState::text(codes[i % codes.size()]).size();
    });
    QHash<QString, QString> known;
    for (const QString &code : codes)
        known.insert(code, TaskState::text(code));
    const double bare = milliseconds([&] {
        for (int i = 0; i < texts; ++i)
            letters += known.value(codes[i % codes.size()]).size();
    });
    std::printf("%-32s %9.0f a second   bare look-up %9.0f a second   ratio %6.1f   (%lld letters)\n",
                "state texts", texts / own * 1000, texts / bare * 1000, own / bare,
                static_cast<long long>(letters));
}

} // namespace

int main(int argc, char *argv[]) {
    QApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.size() != 3)
        return 2;
    MessageLog::install();
    application.setStyleSheet(Theme::styleSheet());
    QProcess emulator;
    const int port = startEmulator(emulator, arguments[1], arguments[2]);
    if (port == 0 || !logIn(port))
        return 1;
    TaskPanel panel;
    panel.resize(340, 700);
    panel.show();
    LongestTurn turns;
    bool good = poll(turns, "first poll of 10,000 tasks");
    good &= CTaskInfoPool::instance().taskList()->records().size() == tasks;
    emulator.write("touch-tasks 100\n");
    emulator.waitForBytesWritten(1000);
    emulator.waitForReadyRead(5000);
    good &= poll(turns, "poll, 100 of them changed");
    good &= poll(turns, "poll, nothing changed");
    measureTexts();
    emulator.terminate();
    emulator.waitForFinished(5000);
    return good ? 0 : 1;
}
