#include "apppaths.h"
#include "isolatedroot.h"
#include "messagelog.h"
#include "secondlife.h"

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
    logger().warning("two\nlines");
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

void logTwice() {
    logger().debug("one");
    logger().debug("two");
}

int playScene(const QString &name) {
    const std::map<QString, std::function<void()>> scenes = {{"severities", logEverySeverity},
                                                             {"folder", logAndRemoveFolder},
                                                             {"threads", logFromThreads},
                                                             {"secrets", logSecrets},
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
    void secretsAreMaskedOnDemand();

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
    QCOMPARE(outcome.output, "plain text\ntwo\nlines\nä€\ntold\nnowhere\nthe end\n");
    static const QRegularExpression stamp(R"(^\d{4}-\d\d-\d\d \d\d:\d\d:\d\d\.\d{3} )",
                                          QRegularExpression::MultilineOption);
    const QString place = ", file: main.cpp, line: 7, function: void start()\n";
    QString text = QString::fromUtf8(logged());
    QCOMPARE(text.count(stamp), 6);
    QCOMPARE(text.remove(stamp), "DEBUG: plain text" + place + "WARNING: two\nlines" + place +
                                     "CRITICAL: ä€" + place + "INFO: WARNING: told" + place +
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

void TestMessageLog::secretsAreMaskedOnDemand() {
    const QByteArray told = SecondLife::run({"secrets"}, with("NVLDM_LOG_REDACT", "0")).output;
    QCOMPARE(told, "bytes hunter2\ntext hunter2\nstring hunter2\nempty []\n");
    init();
    const QByteArray masked = SecondLife::run({"secrets"}, with("NVLDM_LOG_REDACT", "1")).output;
    QCOMPARE(masked, "bytes ***\ntext ***\nstring ***\nempty []\n");
    QVERIFY(logged().contains("bytes ***") && !logged().contains("hunter2"));
}

int main(int argc, char *argv[]) {
    const QCoreApplication application(argc, argv);
    if (SecondLife::isSecondLife(argc, argv))
        return playScene(SecondLife::arguments(argc, argv).value(0));
    TestMessageLog test;
    return QTest::qExec(&test, argc, argv);
}
#include "tst_messagelog.moc"
