#include "platform/files/apppaths.h"
#include "platform/log/messagelog.h"
#include "platform/log/repeatedlines.h"
#include "support/isolatedroot.h"
#include "support/secondlife.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QDir>
#include <QRegularExpression>
#include <QTest>

#include <functional>
#include <map>
#include <memory>
#include <thread>
#include <vector>

namespace {

constexpr int writers = 8;
constexpr int linesOfWriter = 50;

QMessageLogger logger() {
    return QMessageLogger("main.cpp", 7, "void start()");
}

void logEverySeverity() {
    logger().debug("plain %s", "text");
    logger().warning("two\nlines\r\x1b[2J\tend\u2028");
    logger().critical("ä€");
    logger().info("told");
    QMessageLogger().debug("nowhere");
    logger().fatal("the end");
}

void logAndRemoveFolder() {
    logger().debug("before");
    if (QDir(AppPaths::logFolder()).removeRecursively())
        logger().debug("after");
}

void logFromThreads() {
    std::vector<std::thread> threads;
    for (int writer = 0; writer < writers; ++writer)
        threads.emplace_back([writer] {
            const std::string text(200, static_cast<char>('a' + writer));
            for (int i = 0; i < linesOfWriter; ++i)
                logger().debug("%s", text.c_str());
        });
    for (std::thread &thread : threads)
        thread.join();
}

void logSecrets() {
    logger().debug("bytes %s", MessageLog::secret(QByteArray("hunter2")).constData());
    logger().debug("text %s", MessageLog::secret(QStringLiteral("hunter2")).constData());
    logger().debug("string %s", MessageLog::secret(std::string("hunter2")).constData());
    logger().debug("empty [%s]", MessageLog::secret(QByteArray()).constData());
}

void logPolls() {
    {
        const MessageLog::PollScope counted;
        for (int i = 0; i < 500; ++i) {
            logger().debug("the same");
            if (i % 100 == 0)
                logger().debug("answer %d", i);
        }
    }
    logger().debug("the same");
    MessageLog::finish();
}

void logMuch() {
    const QByteArray text(1 << 20, 'x');
    for (int i = 0; i < 70; ++i)
        logger().debug("%d %s", i, text.constData());
}

void logTwice() {
    logger().debug("one");
    logger().debug("two");
}

int playScene(const QString &name) {
    const std::map<QString, std::function<void()>> scenes = {{"severities", logEverySeverity},
                                                             {"folder", logAndRemoveFolder},
                                                             {"threads", logFromThreads},
                                                             {"secrets", logSecrets},
                                                             {"polls", logPolls},
                                                             {"much", logMuch},
                                                             {"twice", logTwice}};
    MessageLog::install();
    scenes.at(name)();
    return 0;
}

QProcessEnvironment with(const QString &name, const QString &value) {
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(name, value);
    return environment;
}

} // namespace

class TestMessageLog : public QObject {
    Q_OBJECT

private slots:
    void init();

    void lineFormat();
    void localTimeAndFileOfTheDay();
    void folderIsMadeAgain();
    void filesAreOfTheUserAlone();
    void unusableFolder();
    void linesOfThreadsStayWhole();
    void repeatedLinesOfPollsAreCounted();
    void countsEndWithTheirMinute();
    void dayHasABound();
    void oldFilesAreRemoved();
    void secretsAreMaskedOnDemand();
    void secretsStayOffForeignOutput();

private:
    QStringList logFiles() const { return QDir(AppPaths::logFolder()).entryList(QDir::Files); }
    QByteArray logged() const { return m_root->read("Logs/" + logFiles().value(0)).replace("\r\n", "\n"); }

    std::unique_ptr<IsolatedRoot> m_root;
};

void TestMessageLog::init() {
    // The earlier folder takes its setting back when it goes.
    m_root.reset();
    m_root = std::make_unique<IsolatedRoot>();
}

void TestMessageLog::lineFormat() {
    const SecondLife::Outcome outcome = SecondLife::run({"severities"});
    QVERIFY2(!outcome.exited || outcome.status != 0, "a fatal message ends the program");
    // What would end a line or steer a terminal is written in letters.
    const QString second = "two\\nlines\\r\\u001b[2J\tend\\u2028";
    QCOMPARE(QString::fromUtf8(outcome.output), "plain text\n" + second + "\nä€\ntold\nnowhere\nthe end\n");
    static const QRegularExpression stamp(R"(^\d{4}-\d\d-\d\d \d\d:\d\d:\d\d\.\d{3} )",
                                          QRegularExpression::MultilineOption);
    const QString place = ", file: main.cpp, line: 7, function: void start()\n";
    QString text = QString::fromUtf8(logged());
    QCOMPARE(text.count(stamp), 6);
    QCOMPARE(text.remove(stamp), "DEBUG: plain text" + place + "WARNING: " + second + place + "CRITICAL: ä€" +
                                     place + "INFO: WARNING: told" + place +
                                     "DEBUG: nowhere, file: , line: 0, function: \n" +
                                     "FATAL: DEFAULT: the end" + place);
}

void TestMessageLog::localTimeAndFileOfTheDay() {
    // Far enough from everywhere that the zone's own day is told from the day in UTC.
    const auto nowThere = [] { return QDateTime::currentDateTimeUtc().addSecs(14 * 3600); };
    const QDateTime before = nowThere();
    QVERIFY(SecondLife::run({"twice"}, with("TZ", "FAR-14")).exited);
    const QDateTime after = nowThere();
    const QString stamp = QString::fromUtf8(logged().first(23));
    QDateTime time = QDateTime::fromString(stamp, "yyyy-MM-dd hh:mm:ss.zzz");
    time.setTimeSpec(Qt::UTC);
    QVERIFY2(time >= before && time <= after, qPrintable(stamp));
    QCOMPARE(logFiles().value(0), stamp.first(10) + ".log");
}

void TestMessageLog::folderIsMadeAgain() {
    QVERIFY(SecondLife::run({"folder"}).exited);
    QVERIFY(!logged().contains("before"));
    QVERIFY(logged().contains("DEBUG: after"));
}

void TestMessageLog::filesAreOfTheUserAlone() {
#ifdef Q_OS_WIN
    QSKIP("Access lists do not show as permissions.");
#endif
    QVERIFY(SecondLife::run({"twice"}).exited);
    const QFileDevice::Permissions others = QFileDevice::ReadGroup | QFileDevice::WriteGroup |
                                            QFileDevice::ExeGroup | QFileDevice::ReadOther |
                                            QFileDevice::WriteOther | QFileDevice::ExeOther;
    QVERIFY(!(QFile::permissions(AppPaths::logFolder()) & others));
    QVERIFY(!(QFile::permissions(AppPaths::logFolder() + '/' + logFiles().value(0)) & others));
}

void TestMessageLog::unusableFolder() {
    QVERIFY(m_root->write("Logs", "a file where the folder should be"));
    const SecondLife::Outcome outcome = SecondLife::run({"twice"});
    QVERIFY(outcome.exited);
    QCOMPARE(outcome.output, "one\nFailed to open log file\ntwo\nFailed to open log file\n");
}

void TestMessageLog::linesOfThreadsStayWhole() {
    QVERIFY(SecondLife::run({"threads"}).exited);
    std::map<QByteArray, int> counts;
    for (const QByteArray &line : logged().split('\n')) {
        if (!line.isEmpty())
            ++counts[line.mid(24)];
    }
    QCOMPARE(counts.size(), writers);
    for (int writer = 0; writer < writers; ++writer)
        QCOMPARE(counts["DEBUG: " + QByteArray(200, static_cast<char>('a' + writer)) +
                        ", file: main.cpp, line: 7, function: void start()"],
                 linesOfWriter);
}

void TestMessageLog::repeatedLinesOfPollsAreCounted() {
    const QByteArray output = SecondLife::run({"polls"}).output;
    QCOMPARE(output.count("the same\n"), 2);
    QCOMPARE(output.count("the same [repeated 499 times within a minute]\n"), 1);
    QCOMPARE(output.count("answer "), 5);
    QCOMPARE(logged().count("DEBUG: the same"), 3);
}

void TestMessageLog::countsEndWithTheirMinute() {
    QByteArrayList written;
    RepeatedLines lines([&](const RepeatedLines::Line &line) { written += line.text; });
    const auto count = [&](const char *text, qint64 nowMs) {
        return lines.count({QtDebugMsg, "main.cpp", 7, "start", text}, nowMs);
    };
    QVERIFY(!count("poll", 1000));
    QVERIFY(count("poll", 2000) && count("poll", 60999));
    QVERIFY(!count("other", 60999));
    QCOMPARE(written, QByteArrayList());
    QVERIFY(!count("poll", 61000));
    QCOMPARE(written, QByteArrayList{"poll [repeated 2 times within a minute]"});
    QVERIFY(count("other", 62000));
    // A clock that was set back by an hour.
    lines.writeEnded(62000 - 3600000);
    QCOMPARE(written.mid(1), QByteArrayList{"other [repeated 1 times within a minute]"});
    QVERIFY(!count(QByteArray(5000, 'x').constData(), 70000) &&
            !count(QByteArray(5000, 'x').constData(), 70001));
}

void TestMessageLog::dayHasABound() {
    QVERIFY(SecondLife::run({"much"}).exited);
    QCOMPARE(logFiles().size(), 2);
    const QString day = logFiles()[1];
    const QString earlier = logFiles()[0];
    QVERIFY2(earlier.endsWith(".earlier.log"), qPrintable(earlier));
    for (const QString &name : logFiles())
        QVERIFY(m_root->read("Logs/" + name).size() <= 32 * 1024 * 1024);
    const QByteArray newest = m_root->read("Logs/" + day);
    const QByteArray firstLine = newest.left(newest.indexOf('\n'));
    QVERIFY2(firstLine.contains("cut") && firstLine.contains(earlier.toUtf8()), firstLine.constData());
    QVERIFY(newest.contains("DEBUG: 69 x"));
}

void TestMessageLog::oldFilesAreRemoved() {
    const auto name = [](int daysAgo, const char *ending) {
        return QDate::currentDate().addDays(-daysAgo).toString("yyyy-MM-dd") + ending;
    };
    QVERIFY(QDir(m_root->path()).mkdir("Logs"));
    const QStringList kept = {name(29, ".log"), "crash-2020-01-02-120000-7.txt", "notes.log"};
    const QStringList old = {name(32, ".log"), name(400, ".log"), name(32, ".earlier.log")};
    for (const QString &file : kept + old)
        QVERIFY(m_root->write("Logs/" + file, "text"));
    QVERIFY(SecondLife::run({"twice"}).exited);
    for (const QString &file : kept)
        QVERIFY2(logFiles().contains(file), qPrintable(file));
    for (const QString &file : old)
        QVERIFY2(!logFiles().contains(file), qPrintable(file));
}

void TestMessageLog::secretsAreMaskedOnDemand() {
    QVERIFY(SecondLife::run({"secrets"}, with("NVLDM_LOG_REDACT", "0")).exited);
    QVERIFY(logged().contains("bytes hunter2") && logged().contains("string hunter2"));
    init();
    const QByteArray masked = SecondLife::run({"secrets"}, with("NVLDM_LOG_REDACT", "1")).output;
    QCOMPARE(masked, "bytes ***\ntext ***\nstring ***\nempty []\n");
    QVERIFY(logged().contains("bytes ***") && !logged().contains("hunter2"));
}

void TestMessageLog::secretsStayOffForeignOutput() {
    // A pipe may lead to a journal that others read.
    const QByteArray piped = SecondLife::run({"secrets"}, with("NVLDM_LOG_REDACT", "0")).output;
    QCOMPARE(piped, "bytes ***\ntext ***\nstring ***\nempty []\n");
    QProcess process;
    process.setStandardOutputFile(m_root->filePath("output.txt"));
    SecondLife::start(process, {"secrets"});
    QVERIFY(process.waitForFinished());
    QCOMPARE(m_root->read("output.txt"), "bytes hunter2\ntext hunter2\nstring hunter2\nempty []\n");
}

int main(int argc, char *argv[]) {
    const QCoreApplication application(argc, argv);
    if (SecondLife::isSecondLife(argc, argv))
        return playScene(SecondLife::arguments(argc, argv).value(0));
    TestMessageLog test;
    return QTest::qExec(&test, argc, argv);
}
#include "tst_messagelog.moc"
