#include "platform/files/apppaths.h"
#include "platform/log/crashcatcher.h"
#include "platform/log/crashreport.h"
#include "platform/log/messagelog.h"
#include "platform/system/processsetup.h"
#include "support/isolatedroot.h"
#include "support/secondlife.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QDir>
#include <QRegularExpression>
#include <QTest>

#include <csignal>
#include <cstdint>
#include <map>
#include <memory>
#include <stdexcept>
#include <thread>

#ifdef Q_OS_UNIX
#include <sys/resource.h>
#endif

namespace {

constexpr int manyLines = 2000;

/// Nothing is there. A null would be noticed by what sanitizers add, before it is a fault.
int *volatile nowhere = reinterpret_cast<int *>(std::uintptr_t{64});

volatile bool goOn = true;

int useUpTheStack(volatile char *above) {
    volatile char room[4096];
    room[0] = above ? above[0] : '\0';
    return goOn ? useUpTheStack(room) + room[0] : 0;
}

const std::map<QString, void (*)()> scenes = {
    {"fault", [] { *nowhere = 1; }},
    {"stack", [] { useUpTheStack(nullptr); }},
    {"stack of a thread",
     [] {
         std::thread([] {
             const CrashCatcher::ThreadGuard guard;
             useUpTheStack(nullptr);
         }).join();
     }},
    {"exception", [] { std::thread([] { throw std::runtime_error("hunter2"); }).join(); }},
    {"fatal", [] { qFatal("no way on"); }},
    {"two threads",
     [] {
         std::thread other([] { *nowhere = 1; });
         *nowhere = 2;
         other.join();
     }},
    {"busy log",
     [] {
         for (int i = 0; i < manyLines; ++i)
             qDebug("line %d of many", i);
         std::abort();
     }},
    {"end", [] {}},
};

int playScene(const QString &name) {
    ProcessSetup::keepMemoryPrivate();
    MessageLog::install();
    CrashReport::install("Program v1.2");
    qDebug("password %s of \"%s\"", MessageLog::secret(QStringLiteral("hunter2")).constData(),
           MessageLog::secret(std::string("hunter2\xEF\xB7\x91hunter2")).constData());
    scenes.at(name)();
#ifdef Q_OS_UNIX
    rlimit limit{1, 1};
    return ::getrlimit(RLIMIT_CORE, &limit) == 0 ? static_cast<int>(limit.rlim_cur) : -1;
#else
    return 0;
#endif
}

} // namespace

class TestCrashReport : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_root.reset();
        m_root = std::make_unique<IsolatedRoot>();
        QVERIFY(QDir().mkpath(AppPaths::logFolder()));
    }

    void crashLeavesAText_data() {
        QTest::addColumn<QString>("reason");
        const QString fault = "Reason: SIGSEGV at address 0x[0-9a-f]+\n";
        QTest::newRow("fault") << fault;
        QTest::newRow("stack") << fault;
        QTest::newRow("stack of a thread") << fault;
        QTest::newRow("exception") << "Reason: SIGABRT, uncaught exception of type std::runtime_error\n";
        QTest::newRow("fatal") << "Reason: SIGABRT\n";
        QTest::newRow("two threads") << fault;
    }
    void crashLeavesAText() {
        QFETCH(QString, reason);
        const QDateTime before = QDateTime::currentDateTimeUtc().addSecs(-1);
        const SecondLife::Outcome outcome = SecondLife::run({QTest::currentDataTag()});
        QVERIFY(!outcome.exited && outcome.status > 0);
        const QString log = QDir(AppPaths::logFolder()).entryList({"2*.log"}).value(0);
        QVERIFY2(m_root->read("Logs/" + log).contains("password hunter2 of \"hunter2hunter2\""),
                 "the log tells it");

        const QString path = CrashReport::takePending();
        const QString text = QString::fromUtf8(read(path));
        const QRegularExpression form("\\AProgram v1\\.2 ended unexpectedly\\.\n"
                                      "Time: (\\d{4}-\\d\\d-\\d\\d \\d\\d:\\d\\d:\\d\\d) UTC\n" +
                                      reason +
                                      "\nPlace:\n(.*tst_crashreport\\(.*\\[0x[0-9a-f]+\\]\n|.+\n){2,}"
                                      "\nLast log lines:\n.* DEBUG: password \\*\\*\\* of \"\\*\\*\\*\"\n");
        const QRegularExpressionMatch match = form.match(text);
        QVERIFY2(match.hasMatch(), qUtf8Printable(text));
        QVERIFY(text.contains("tst_crashreport(") && !text.contains("hunter2"));
        QDateTime time = QDateTime::fromString(match.captured(1), "yyyy-MM-dd hh:mm:ss");
        time.setTimeSpec(Qt::UTC);
        QVERIFY(time >= before && time <= QDateTime::currentDateTimeUtc());
        QCOMPARE(QFile::permissions(path) & ~(QFile::ReadUser | QFile::WriteUser),
                 QFile::ReadOwner | QFile::WriteOwner);
        QCOMPARE(CrashReport::takePending(), QString());
        QCOMPARE(reports().size(), 1);
    }

    void oldestLogLinesGiveWay() {
        QVERIFY(!SecondLife::run({"busy log"}).exited);
        const QStringList lines = QString::fromUtf8(read(CrashReport::takePending())).trimmed().split('\n');
        const qsizetype first = lines.indexOf("Last log lines:") + 1;
        QVERIFY(lines.size() - first > 100 && lines.size() - first < manyLines);
        for (qsizetype i = first, number = manyLines - (lines.size() - first); i < lines.size();
             ++i, ++number)
            QVERIFY2(lines[i].endsWith(QString("DEBUG: line %1 of many").arg(number)),
                     qUtf8Printable(lines[i]));
    }

    void normalEndLeavesNothing() {
        const SecondLife::Outcome outcome = SecondLife::run({"end"});
        QVERIFY(outcome.exited);
        QCOMPARE(outcome.status, 0);
        QVERIFY(reports().isEmpty());
    }

    void newestIsOfferedAndFewAreKept() {
        for (int day = 10; day < 25; ++day)
            QVERIFY(m_root->write(QString("Logs/crash-2026-01-%1-120000-7.new.txt").arg(day), "text"));
        QVERIFY(CrashReport::takePending().endsWith("Logs/crash-2026-01-24-120000-7.txt"));
        QCOMPARE(reports().size(), 10);
        QCOMPARE(reports().value(0), QString("crash-2026-01-15-120000-7.txt"));
    }

private:
    QStringList reports() const { return QDir(AppPaths::logFolder()).entryList({"crash-*"}, QDir::Files); }
    static QByteArray read(const QString &path) {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }

    std::unique_ptr<IsolatedRoot> m_root;
};

int main(int argc, char *argv[]) {
    const QCoreApplication application(argc, argv);
    if (SecondLife::isSecondLife(argc, argv))
        return playScene(SecondLife::arguments(argc, argv).value(0));
    TestCrashReport test;
    return QTest::qExec(&test, argc, argv);
}
#include "tst_crashreport.moc"
