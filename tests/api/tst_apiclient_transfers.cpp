#include "api/transport/transfer.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/scriptedpeer.h"
#include "support/testmain.h"
#include "testsession.h"

#include <QElapsedTimer>
#include <QTest>

#include <filesystem>
#include <functional>
#include <future>

#include <sys/stat.h>

namespace fs = std::filesystem;
using Change = std::function<void(const fs::path &)>;

namespace {

constexpr std::size_t mebibyte = 1u << 20;
const JSON ids = {"DV1", "DV2"};

} // namespace

/// What goes wrong while a file is sent.
class TestApiClientTransfers : public QObject {
    Q_OBJECT

private slots:
    void init();

    void filesThatCannotBeSent();
    void filesThatDoNotStay_data();
    void filesThatDoNotStay();
    void services_data();
    void services();
    void hugeFileIsRefusedEarly();
    void cancel_data();
    void cancel();
    void progressCountsAndNotTime();

private:
    /// A new client with a transfer that can be looked at afterwards.
    std::unique_ptr<CApiClient> client();
    unsigned upload(const QByteArray &path) {
        return client()->uploadFWFile("T1", path.constData(), "a.bin");
    }

    IsolatedRoot m_root;
    ScriptedPeer m_peer;
    std::shared_ptr<Transfer> m_transfer;
    QByteArray m_big = m_root.filePath("big.bin").toUtf8();
};

/// With a file of the past, so that whatever is done to it shows.
void TestApiClientTransfers::init() {
    m_peer.greet(ScriptedPeer::Greeting::Handshake);
    m_peer.watchBody(0, {});
    m_peer.answer(ScriptedPeer::json({{"code", 0}}));
    m_peer.takeRequests();
    QVERIFY(m_root.write("big.bin", QByteArray(32 * mebibyte, 'x')));
    fs::last_write_time(m_big.toStdString(), fs::file_time_type::clock::now() - std::chrono::hours(1));
}

std::unique_ptr<CApiClient> TestApiClientTransfers::client() {
    m_transfer = std::make_shared<Transfer>();
    auto made = TestSession::client(m_peer.port());
    made->setTransfer(m_transfer);
    return made;
}

void TestApiClientTransfers::filesThatCannotBeSent() {
    const LogCapture log;
    QVERIFY(m_root.write("empty", {}) && m_root.write("locked", "x"));
    QFile::setPermissions(m_root.filePath("locked"), {});
    QCOMPARE(::mkfifo(m_root.filePath("pipe").toUtf8().constData(), 0600), 0);
    QStringList names = {"missing", ".", "pipe", "empty"};
    if (!QFile(m_root.filePath("locked")).open(QIODevice::ReadOnly))
        names << "locked";
    for (const QString &name : names) {
        QCOMPARE(upload(m_root.filePath(name).toUtf8()), unsigned(ApiException));
        QCOMPARE(m_transfer->failure(),
                 name == "empty" ? TransferFailure::FileEmpty : TransferFailure::FileUnreadable);
        QVERIFY(m_transfer->failureText().contains("“a.bin”"));
    }
    QCOMPARE(m_peer.connections(), 0);
}

void TestApiClientTransfers::filesThatDoNotStay_data() {
    QTest::addColumn<Change>("change");
    QTest::addColumn<TransferFailure>("failure");
    const auto resized = [](std::size_t size) {
        return Change([size](const fs::path &path) { fs::resize_file(path, size); });
    };
    QTest::newRow("shrinks") << resized(8 * mebibyte) << TransferFailure::FileChanged;
    QTest::newRow("shrinks at its end") << resized(32 * mebibyte - 1) << TransferFailure::FileChanged;
    QTest::newRow("grows") << resized(33 * mebibyte) << TransferFailure::FileChanged;
    QTest::newRow("written to") << Change([](const fs::path &path) {
        QFile file(path);
        QVERIFY(file.open(QIODevice::ReadWrite) && file.write("y") == 1);
    }) << TransferFailure::FileChanged;
    QTest::newRow("vanishes") << Change([](const fs::path &path) { fs::remove(path); })
                              << TransferFailure::FileGone;
}

void TestApiClientTransfers::filesThatDoNotStay() {
    QFETCH(Change, change);
    QFETCH(TransferFailure, failure);
    const LogCapture log;
    m_peer.watchBody(mebibyte, [&](std::size_t received) {
        if (received == mebibyte)
            change(m_big.toStdString());
        return true;
    });
    QCOMPARE(upload(m_big), unsigned(ApiException));
    QVERIFY2(m_peer.takeRequests().empty(), "the service must not take it for whole");
    QCOMPARE(m_transfer->failure(), failure);
    QCOMPARE(m_transfer->failedFile(), "a.bin");
}

void TestApiClientTransfers::services_data() {
    QTest::addColumn<bool>("early");
    QTest::addColumn<ScriptedPeer::Reply>("reply");
    QTest::addColumn<unsigned>("result");
    QTest::addColumn<TransferFailure>("failure");
    using End = ScriptedPeer::End;
    const auto row = [](const char *name, bool early, const std::string &bytes, End end, unsigned result,
                        TransferFailure failure) {
        QTest::newRow(name) << early << ScriptedPeer::Reply{bytes, end} << result << failure;
    };
    const std::string ok = ScriptedPeer::http(200, R"({"code":0})");
    const std::string full = ScriptedPeer::http(413, {});
    row("413", false, full, End::Close, 13, TransferFailure::TooLarge);
    row("500", false, ScriptedPeer::http(500, {}), End::Close, 13, TransferFailure::None);
    row("105", false, ScriptedPeer::http(200, R"({"code":105})"), End::Close, 17, TransferFailure::None);
    row("no answer", false, {}, End::Close, 12, TransferFailure::RefusedOrLost);
    row("early 413, closes", true, full, End::Close, 13, TransferFailure::TooLarge);
    row("early 413, waits", true, full, End::Hold, 13, TransferFailure::TooLarge);
    row("early 401, resets", true, ScriptedPeer::http(401, {}), End::Reset, 13, TransferFailure::None);
    row("early success", true, ok, End::Close, 12, TransferFailure::RefusedOrLost);
    row("closes midway", true, {}, End::Close, 12, TransferFailure::RefusedOrLost);
    row("resets midway", true, {}, End::Reset, 12, TransferFailure::RefusedOrLost);
}

void TestApiClientTransfers::services() {
    QFETCH(bool, early);
    QFETCH(ScriptedPeer::Reply, reply);
    QFETCH(unsigned, result);
    QFETCH(TransferFailure, failure);
    const LogCapture log;
    const int before = m_peer.connections();
    m_peer.answer(reply);
    if (early)
        m_peer.watchBody(mebibyte, [](std::size_t) { return false; });
    const auto made = client();
    QCOMPARE(made->uploadFWFile("T1", m_big.constData(), "a"), result);
    QCOMPARE(m_transfer->failure(), failure);
    const QByteArray name = QTest::currentDataTag();
    QVERIFY2(made->isUnanswered() == (name == "500" || name == "no answer"), "half a file begins nothing");
    QCOMPARE(log.count("File upload error: "), result == 12u ? 1 : 0);
    QCOMPARE(log.count("FW Upload Response -------> Status Code: "), result == 12u ? 0 : 1);
    QCOMPARE(client()->uploadPackage("T1", m_big.constData(), "a", ids, false), result);
    QCOMPARE(log.count("Encountered HTTP request error when CApiClient::uploadPackage: "),
             result == 12u ? 1 : 0);
    QVERIFY2(m_peer.connections() == before + 2, "an upload is never repeated by itself");
}

void TestApiClientTransfers::hugeFileIsRefusedEarly() {
    const LogCapture log;
    constexpr std::uintmax_t size = 5ull << 30;
    QVERIFY(m_root.write("huge.bin", "x"));
    const QByteArray path = m_root.filePath("huge.bin").toUtf8();
    fs::resize_file(path.toStdString(), size);
    m_peer.answer({ScriptedPeer::http(413, {})});
    m_peer.watchBody(mebibyte, [](std::size_t) { return false; });
    QCOMPARE(upload(path), unsigned(ApiHttpStatusError));
    const std::uint64_t total = m_transfer->bytesTotal();
    QCOMPARE(m_peer.takeRequests().at(0).header("content-length"), std::to_string(total));
    QVERIFY(total > size && total < size + 1000);
}

void TestApiClientTransfers::cancel_data() {
    QTest::addColumn<QString>("during");
    for (const char *during : {"nothing yet", "the handshake", "a standstill", "the wait for the answer"})
        QTest::newRow(during) << QString(during);
}

void TestApiClientTransfers::cancel() {
    QFETCH(QString, during);
    const LogCapture log;
    std::promise<void> over;
    m_peer.answer({{}, ScriptedPeer::End::Hold});
    if (during == "the handshake")
        m_peer.greet(ScriptedPeer::Greeting::Silence);
    if (during == "a standstill")
        m_peer.watchBody(mebibyte, [&](std::size_t) { return over.get_future().wait(), false; });
    const int before = m_peer.connections();
    const auto made = client();
    if (during == "nothing yet")
        m_transfer->cancel();
    auto result =
        std::async(std::launch::async, [&] { return made->uploadFWFile("T1", m_big.constData(), "a"); });
    QTest::qWait(500);
    QCOMPARE(m_peer.connections(), during == "nothing yet" ? before : before + 1);
    QElapsedTimer timer;
    timer.start();
    m_transfer->cancel();
    QCOMPARE(result.get(), unsigned(ApiTransportError));
    QVERIFY(timer.elapsed() < 1000);
    over.set_value();
    QCOMPARE(m_transfer->failure(), TransferFailure::Cancelled);
    QCOMPARE(log.count("File upload error: Canceled"), 1);
}

void TestApiClientTransfers::progressCountsAndNotTime() {
    const LogCapture log;
    auto made = client();
    made->setTotalTimeout(std::chrono::milliseconds(1500));
    m_peer.watchBody(2 * mebibyte, [](std::size_t) { return QTest::qSleep(150), true; });
    QElapsedTimer timer;
    timer.start();
    QCOMPARE(made->uploadFWFile("T1", m_big.constData(), "a"), unsigned(ApiOk));
    QVERIFY(timer.elapsed() > 1500);

    std::promise<void> over;
    m_peer.watchBody(mebibyte, [&](std::size_t) { return over.get_future().wait(), false; });
    made = client();
    made->setTotalTimeout(std::chrono::milliseconds(800));
    timer.restart();
    QCOMPARE(made->uploadFWFile("T1", m_big.constData(), "a"), unsigned(ApiTransportError));
    QVERIFY(timer.elapsed() < 4000);
    over.set_value();
    QCOMPARE(m_transfer->failure(), TransferFailure::Stalled);
}

NVLDM_GUILESS_TEST(TestApiClientTransfers)
#include "tst_apiclient_transfers.moc"
