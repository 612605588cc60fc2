#include "platform/files/nvldmstore.h"
#include "platform/files/storetrouble.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/secondlife.h"

#include <QCoreApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QTest>

#include <nlohmann/json.hpp>
#include <sqlite3.h>
#include <sys/resource.h>
#include <unistd.h>

#include <csignal>
#include <functional>
#include <future>
#include <map>
#include <thread>

using Json = nlohmann::json;
using namespace nvldmstore;

namespace {

constexpr const char *keyColumns = "key TEXT PRIMARY KEY, value TEXT";
constexpr const char *listColumns = "id TEXT PRIMARY KEY, name TEXT";
constexpr const char *table = "mainT";
constexpr const char *scratch = "tempMainT";
constexpr int manyRows = 300;

int replaceValue(const QByteArray &file, const std::string &key, const std::string &value) {
    const QByteArray doubled = QByteArray::fromStdString(value).replace('\'', "''");
    const QByteArray values = "'" + QByteArray::fromStdString(key) + "','" + doubled + "'";
    return replaceData(file.constData(), table, values.constData());
}

/// The rows as JSON text, or "failed".
std::string rows(const QByteArray &file, const char *name = table, const char *condition = "") {
    std::string result;
    return queryData(file.constData(), name, condition, result) == 0 ? result : "failed";
}

int fillScratch(const QByteArray &file, const Json &list) {
    const int created = createDBTable(file.constData(), scratch, listColumns);
    return created != 0 ? created : insertListData(file.constData(), scratch, list.dump().c_str());
}

/// Writes a value and stays alive until it is killed.
int writeAndWait(const QByteArray &file) {
    createDBTable(file.constData(), table, keyColumns);
    if (replaceValue(file, "k", "written") == 0)
        SecondLife::reportAndWait("written");
    return 1;
}

QString longValue(int row) {
    return QStringLiteral("value-%1-").arg(row).leftJustified(300, QLatin1Char('x'));
}

/// Fills a file of many pages and leaves it closed, or with its log beside it.
int fillAndEnd(const QByteArray &file, bool closed) {
    createDBTable(file.constData(), table, keyColumns);
    Json list = Json::array();
    for (int row = 0; row < manyRows; ++row)
        list.push_back({{"key", std::to_string(row)}, {"value", longValue(row).toStdString()}});
    insertListData(file.constData(), table, list.dump().c_str());
    if (!closed)
        SecondLife::reportAndWait("filled");
    return 0;
}

/// Uses a file on a disk that takes nothing more.
int useWithoutRoom(const QByteArray &file) {
    std::signal(SIGXFSZ, SIG_IGN);
    const rlimit none{0, 0};
    ::setrlimit(RLIMIT_FSIZE, &none);
    int told = 0;
    StoreTrouble::setReceiver(
        [&](const StoreTrouble::Report &report) { told += report.kind == StoreTrouble::Kind::Unwritable; });
    const bool refused =
        createDBTable(file.constData(), table, keyColumns) == 1 && replaceValue(file, "k", "new") == 1;
    const bool readable = Json::parse(rows(file)).size() == manyRows;
    return refused && readable && told == 1 ? 0 : 1;
}

/// Tries to write as a user who may only read: the super user may always write.
int writeAsStranger(const QByteArray &file) {
    if (::geteuid() == 0 && ::setuid(65534) != 0)
        ::_exit(2);
    const int created = createDBTable(file.constData(), table, keyColumns);
    // The way out of main would look for leaks, which this user may not.
    ::_exit(created == 1 && replaceValue(file, "k", "new") == 1 ? 0 : 1);
}

/// A second program on the same file.
class OtherConnection {
public:
    explicit OtherConnection(const QByteArray &file) { sqlite3_open(file.constData(), &m_database); }
    ~OtherConnection() { sqlite3_close(m_database); }
    bool exec(const char *statement) {
        return sqlite3_exec(m_database, statement, nullptr, nullptr, nullptr) == SQLITE_OK;
    }

private:
    sqlite3 *m_database = nullptr;
};

} // namespace

class TestNvldmStore : public QObject {
    Q_OBJECT

private slots:
    void init();

    void keepsTexts_data();
    void keepsTexts();
    void refusesOtherValues_data();
    void refusesOtherValues();
    void queryChangesNothing();
    void survivesBeingKilled();
    void listIsSwappedAsAWhole();
    void badListLeavesNothing_data();
    void badListLeavesNothing();
    void interruptedFillIsForgotten();
    void damagedFileIsSetAside_data();
    void damagedFileIsSetAside();
    void readableRowsAreRescued_data();
    void readableRowsAreRescued();
    void fullDiskIsNoDamage_data();
    void fullDiskIsNoDamage();
    void removedFileIsBegunAnew();
    void unwritableFile();
    void waitsForAnotherConnection();
    void givesUpOnALockedFile();
    void manyThreads();
    void filesAreOfTheUserAlone();

private:
    void fill(bool closed) const;
    QStringList setAside() const {
        return QDir(m_root.path()).entryList({QFileInfo(m_file).fileName() + ".damaged-*"});
    }

    IsolatedRoot m_root;
    QByteArray m_file;
    int m_files = 0;
};

void TestNvldmStore::init() {
    m_file = m_root.filePath(QStringLiteral("store%1.sdb").arg(++m_files)).toUtf8();
}

void TestNvldmStore::keepsTexts_data() {
    QTest::addColumn<std::string>("text");
    QTest::newRow("empty") << std::string();
    QTest::newRow("quotes") << std::string("'it''s' \"so\"', '); DROP TABLE mainT; --");
    QTest::newRow("line ends") << std::string("a\nb\r\n\tc");
    QTest::newRow("UTF-8") << std::string("Zürich 東京 \xf0\x9f\x93\xb7");
    QTest::newRow("1 MiB") << std::string(1 << 20, '\'');
}

void TestNvldmStore::keepsTexts() {
    QFETCH(std::string, text);
    QCOMPARE(createDBTable(m_file.constData(), table, keyColumns), 0);
    QCOMPARE(replaceValue(m_file, "k", "earlier"), 0);
    QCOMPARE(replaceValue(m_file, "other", "stays"), 0);
    QCOMPARE(replaceValue(m_file, "k", text), 0);
    QCOMPARE(createDBTable(m_file.constData(), table, keyColumns), 0);
    const Json expected = Json::array({{{"key", "k"}, {"value", text}}});
    QCOMPARE(rows(m_file, table, "WHERE key=\"k\""), expected.dump());
    QCOMPARE(rows(m_file, table, "WHERE key=\"other\""), R"([{"key":"other","value":"stays"}])");
    QCOMPARE(rows(m_file, table, "WHERE key=\"none\""), "[]");
}

void TestNvldmStore::refusesOtherValues_data() {
    QTest::addColumn<QByteArray>("values");
    QTest::newRow("nothing") << QByteArray("");
    QTest::newRow("open quote") << QByteArray("'k','v");
    QTest::newRow("no quotes") << QByteArray("k,v");
    QTest::newRow("no comma") << QByteArray("'k' 'v'");
    QTest::newRow("comma behind") << QByteArray("'k','v',");
    QTest::newRow("one text") << QByteArray("'k'");
    QTest::newRow("three texts") << QByteArray("'k','v','w'");
    QTest::newRow("a statement behind") << QByteArray("'k','v'); DROP TABLE mainT; --");
}

void TestNvldmStore::refusesOtherValues() {
    QFETCH(QByteArray, values);
    const LogCapture log;
    QCOMPARE(createDBTable(m_file.constData(), table, keyColumns), 0);
    QCOMPARE(replaceData(m_file.constData(), table, values.constData()), 1);
    QCOMPARE(rows(m_file), "[]");
    QCOMPARE(log.count("Store replaceData failed"), 1);
}

void TestNvldmStore::queryChangesNothing() {
    const LogCapture log;
    QCOMPARE(rows(m_file), "failed");
    QVERIFY(!QFile::exists(m_file));
    QCOMPARE(createDBTable(m_file.constData(), table, keyColumns), 0);
    QCOMPARE(rows(m_file, "noSuchTable"), "failed");
    QCOMPARE(rows(m_file, table, "WHERE"), "failed");
    QCOMPARE(rows(""), "failed");
}

void TestNvldmStore::survivesBeingKilled() {
    QProcess writer;
    SecondLife::start(writer, {"write", m_file});
    QVERIFY(SecondLife::waitForLine(writer, "written"));
    writer.kill();
    QVERIFY(writer.waitForFinished());
    QCOMPARE(rows(m_file), R"([{"key":"k","value":"written"}])");
    QCOMPARE(replaceValue(m_file, "k", "later"), 0);
    QCOMPARE(rows(m_file), R"([{"key":"k","value":"later"}])");
}

void TestNvldmStore::listIsSwappedAsAWhole() {
    QCOMPARE(createDBTable(m_file.constData(), table, listColumns), 0);
    QCOMPARE(fillScratch(m_file, {{{"id", "1"}, {"name", "a"}}, {{"id", "2"}, {"other", "x"}}}), 0);
    QCOMPARE(rows(m_file), "[]");
    QCOMPARE(replaceTable(m_file.constData(), scratch, table), 0);
    QCOMPARE(rows(m_file), R"([{"id":"1","name":"a"},{"id":"2","name":null}])");
    {
        const LogCapture log;
        QCOMPARE(replaceTable(m_file.constData(), scratch, table), 1);
    }
    QCOMPARE(rows(m_file), R"([{"id":"1","name":"a"},{"id":"2","name":null}])");
    QCOMPARE(fillScratch(m_file, Json::array()), 0);
    QCOMPARE(replaceTable(m_file.constData(), scratch, table), 0);
    QCOMPARE(rows(m_file), "[]");
}

void TestNvldmStore::badListLeavesNothing_data() {
    QTest::addColumn<QByteArray>("list");
    QTest::newRow("the same id twice") << QByteArray(R"([{"id":"1"},{"id":"2"},{"id":"1"}])");
    QTest::newRow("a row that is none") << QByteArray(R"([{"id":"1"},7])");
    QTest::newRow("no list") << QByteArray(R"({"id":"1"})");
    QTest::newRow("no JSON") << QByteArray("[");
}

void TestNvldmStore::badListLeavesNothing() {
    QFETCH(QByteArray, list);
    const LogCapture log;
    QCOMPARE(fillScratch(m_file, {{{"id", "0"}, {"name", "a"}}}), 0);
    QCOMPARE(insertListData(m_file.constData(), scratch, list.constData()), 1);
    QCOMPARE(rows(m_file, scratch), R"([{"id":"0","name":"a"}])");
}

void TestNvldmStore::interruptedFillIsForgotten() {
    QCOMPARE(createDBTable(m_file.constData(), table, listColumns), 0);
    QCOMPARE(fillScratch(m_file, {{{"id", "1"}, {"name", "left behind"}}}), 0);
    QCOMPARE(fillScratch(m_file, {{{"id", "2"}, {"name", "wanted"}}}), 0);
    QCOMPARE(replaceTable(m_file.constData(), scratch, table), 0);
    QCOMPARE(rows(m_file), R"([{"id":"2","name":"wanted"}])");
}

void TestNvldmStore::damagedFileIsSetAside_data() {
    QTest::addColumn<QByteArray>("contents");
    QTest::newRow("something else")
        << QByteArray("no database, but long enough to be taken for one").repeated(99);
    QTest::newRow("broken behind its head") << QByteArray("SQLite format 3\0", 16) + QByteArray(8176, '\x7f');
}

void TestNvldmStore::damagedFileIsSetAside() {
    QFETCH(QByteArray, contents);
    const QString name = QFileInfo(m_file).fileName();
    QVERIFY(m_root.write(name, contents));
    QVERIFY(m_root.write(name + "-wal", "what was not written back yet"));
    const LogCapture log;
    QCOMPARE(createDBTable(m_file.constData(), table, keyColumns), 0);
    QCOMPARE(replaceValue(m_file, "k", "v"), 0);
    QCOMPARE(rows(m_file), R"([{"key":"k","value":"v"}])");
    QStringList aside = setAside();
    QCOMPARE(m_root.read(aside.takeLast()), "what was not written back yet");
    QCOMPARE(aside.size(), 1);
    QCOMPARE(m_root.read(aside[0]), contents);
    QCOMPARE(log.count(aside[0]), 1);
}

void TestNvldmStore::fill(bool closed) const {
    QProcess writer;
    SecondLife::start(writer, {closed ? "fill" : "fillAndWait", m_file});
    if (!closed) {
        QVERIFY(SecondLife::waitForLine(writer, "filled"));
        writer.kill();
    }
    QVERIFY(writer.waitForFinished());
    QVERIFY(!closed || !QFile::exists(m_file + "-wal"));
}

void TestNvldmStore::readableRowsAreRescued_data() {
    using Operation = std::function<int(const QByteArray &)>;
    QTest::addColumn<QByteArrayList>(
        "damaged");                // texts whose pages are overwritten; none: the end is cut off
    QTest::addColumn<int>("lost"); // rows at most
    QTest::addColumn<Operation>("operation");
    const Operation query = [](const QByteArray &file) { return rows(file) == "failed" ? 1 : 0; };
    const Operation replace = [](const QByteArray &file) { return replaceValue(file, "10", "new"); };
    const Operation fillList = [](const QByteArray &file) {
        return insertListData(file.constData(), table, R"([{"key":"1","value":"a"}])");
    };
    QTest::newRow("query") << QByteArrayList{"value-150-"} << 20 << query;
    QTest::newRow("replace") << QByteArrayList{"value-10-"} << 20 << replace;
    QTest::newRow("list") << QByteArrayList{"value-10-"} << manyRows << fillList;
    QTest::newRow("several pages") << QByteArrayList{"value-10-", "value-150-", "value-290-"} << 60 << query;
    QTest::newRow("where the table begins") << QByteArrayList{"root"} << 20 << query;
    QTest::newRow("there and more") << QByteArrayList{"root", "value-150-"} << 40 << replace;
    QTest::newRow("end cut off") << QByteArrayList{} << 60 << query;
}

void TestNvldmStore::readableRowsAreRescued() {
    constexpr int pageSize = 4096;
    QFETCH(QByteArrayList, damaged);
    QFETCH(int, lost);
    QFETCH(std::function<int(const QByteArray &)>, operation);
    fill(true);
    const QString name = QFileInfo(m_file).fileName();
    QByteArray contents = m_root.read(name);
    for (const QByteArray &text : damaged) {
        const qsizetype found = text == "root" ? pageSize : contents.indexOf(text);
        QVERIFY(found >= pageSize);
        contents.replace(found / pageSize * pageSize, pageSize, QByteArray(pageSize, '\xff'));
    }
    if (damaged.isEmpty())
        contents.chop(4 * pageSize);
    QVERIFY(m_root.write(name, contents));

    std::vector<StoreTrouble::Report> told;
    StoreTrouble::setReceiver([&](const StoreTrouble::Report &report) {
        if (report.file == QString::fromUtf8(m_file))
            told.push_back(report);
    });
    const LogCapture log;
    QCOMPARE(createDBTable(m_file.constData(), table, keyColumns), 0);
    QCOMPARE(operation(m_file), 0);
    QCOMPARE(replaceValue(m_file, "200", "later"), 0);
    StoreTrouble::setReceiver({});
    const Json kept = Json::parse(rows(m_file));
    QVERIFY2(static_cast<int>(kept.size()) >= manyRows - lost, std::to_string(kept.size()).c_str());
    for (const Json &row : kept)
        QVERIFY(row["value"].get<std::string>().size() == 300 || row["key"] == "200" || lost == manyRows ||
                row["key"] == "10");
    QCOMPARE(m_root.read(setAside().value(0)), contents);
    QCOMPARE(setAside().size(), 1);
    QCOMPARE(told.size(), std::size_t{1});
    QVERIFY(told[0].kind == StoreTrouble::Kind::Repaired && told[0].keptAs.endsWith(setAside()[0]));
}

void TestNvldmStore::fullDiskIsNoDamage_data() {
    QTest::addColumn<bool>("closed");
    QTest::newRow("closed file") << true;
    QTest::newRow("file with its log") << false;
}

void TestNvldmStore::fullDiskIsNoDamage() {
    QFETCH(bool, closed);
    fill(closed);
    QCOMPARE(SecondLife::run({"noRoom", m_file}).status, 0);
    QVERIFY(setAside().isEmpty());
    QCOMPARE(Json::parse(rows(m_file)).size(), std::size_t{manyRows});
}

void TestNvldmStore::removedFileIsBegunAnew() {
    QCOMPARE(createDBTable(m_file.constData(), table, keyColumns), 0);
    for (const char *suffix : {"", "-wal", "-shm"})
        QFile::remove(m_file + suffix);
    QCOMPARE(createDBTable(m_file.constData(), table, keyColumns), 0);
    QCOMPARE(replaceValue(m_file, "k", "v"), 0);
    QVERIFY(QFile::exists(m_file));
    QCOMPARE(rows(m_file), R"([{"key":"k","value":"v"}])");
}

void TestNvldmStore::unwritableFile() {
    const QByteArray contents = "the file of somebody else";
    QVERIFY(m_root.write(QFileInfo(m_file).fileName(), contents));
    QVERIFY(QFile::setPermissions(m_file, QFileDevice::ReadOwner | QFileDevice::ReadOther));
    const auto folder =
        QFileDevice::ReadOwner | QFileDevice::ExeOwner | QFileDevice::ReadOther | QFileDevice::ExeOther;
    QVERIFY(QFile::setPermissions(m_root.path(), folder));
    const SecondLife::Outcome outcome = SecondLife::run({"stranger", m_file});
    QVERIFY(QFile::setPermissions(m_root.path(), folder | QFileDevice::WriteOwner));
    QVERIFY2(outcome.exited, "a file that cannot be written must not end the program");
    QCOMPARE(outcome.status, 0);
    QCOMPARE(m_root.read(QFileInfo(m_file).fileName()), contents);

    const LogCapture log;
    const QByteArray below = m_file + "/below.sdb";
    QCOMPARE(createDBTable(below.constData(), table, keyColumns), 1);
}

void TestNvldmStore::waitsForAnotherConnection() {
    QCOMPARE(createDBTable(m_file.constData(), table, keyColumns), 0);
    OtherConnection other(m_file);
    QVERIFY(other.exec("BEGIN IMMEDIATE; INSERT INTO mainT VALUES('theirs','1')"));
    auto written = std::async(std::launch::async, [this] { return replaceValue(m_file, "ours", "2"); });
    QCOMPARE(written.wait_for(std::chrono::milliseconds(300)), std::future_status::timeout);
    QVERIFY(other.exec("COMMIT"));
    QCOMPARE(written.get(), 0);
    QCOMPARE(rows(m_file), R"([{"key":"theirs","value":"1"},{"key":"ours","value":"2"}])");
}

void TestNvldmStore::givesUpOnALockedFile() {
    QCOMPARE(createDBTable(m_file.constData(), table, keyColumns), 0);
    QCOMPARE(replaceValue(m_file, "k", "v"), 0);
    OtherConnection other(m_file);
    QVERIFY(other.exec("BEGIN IMMEDIATE"));
    const LogCapture log;
    QCOMPARE(rows(m_file), R"([{"key":"k","value":"v"}])");
    QElapsedTimer timer;
    timer.start();
    QCOMPARE(replaceValue(m_file, "k", "w"), 1);
    QVERIFY(timer.elapsed() < 20000);
    QCOMPARE(log.count("locked"), 1);
}

void TestNvldmStore::manyThreads() {
    constexpr int threadCount = 8;
    constexpr int writes = 20;
    std::vector<std::future<int>> threads;
    for (int thread = 0; thread < threadCount; ++thread)
        threads.push_back(std::async(std::launch::async, [this, thread] {
            int failures = 0;
            for (int i = 0; i < writes; ++i) {
                const std::string key = std::to_string(thread) + "/" + std::to_string(i);
                failures += createDBTable(m_file.constData(), table, keyColumns);
                failures += replaceValue(m_file, key, key);
                failures += rows(m_file).find('"' + key + '"') == std::string::npos;
            }
            return failures;
        }));
    for (std::future<int> &thread : threads)
        QCOMPARE(thread.get(), 0);
    QCOMPARE(Json::parse(rows(m_file)).size(), std::size_t(threadCount * writes));
}

void TestNvldmStore::filesAreOfTheUserAlone() {
    m_file = m_root.filePath("new/folder/store.sdb").toUtf8();
    QCOMPARE(createDBTable(m_file.constData(), table, keyColumns), 0);
    QCOMPARE(replaceValue(m_file, "k", "v"), 0);
    const QFileDevice::Permissions others = QFileDevice::ReadGroup | QFileDevice::WriteGroup |
                                            QFileDevice::ExeGroup | QFileDevice::ReadOther |
                                            QFileDevice::WriteOther | QFileDevice::ExeOther;
    const QDir folder = QFileInfo(m_file).dir();
    const QStringList names = folder.entryList(QDir::Files) << ".";
    QVERIFY(names.size() > 1);
    for (const QString &name : names)
        QVERIFY2(!(QFile::permissions(folder.filePath(name)) & others), qPrintable(name));
}

int main(int argc, char *argv[]) {
    const QCoreApplication application(argc, argv);
    if (SecondLife::isSecondLife(argc, argv)) {
        const QStringList arguments = SecondLife::arguments(argc, argv);
        const QByteArray file = arguments.value(1).toUtf8();
        const std::map<QString, std::function<int()>> scenes = {
            {"write", [&] { return writeAndWait(file); }},
            {"stranger", [&] { return writeAsStranger(file); }},
            {"fill", [&] { return fillAndEnd(file, true); }},
            {"fillAndWait", [&] { return fillAndEnd(file, false); }},
            {"noRoom", [&] { return useWithoutRoom(file); }}};
        return scenes.at(arguments.value(0))();
    }
    TestNvldmStore test;
    return QTest::qExec(&test, argc, argv);
}
#include "tst_nvldmstore.moc"
