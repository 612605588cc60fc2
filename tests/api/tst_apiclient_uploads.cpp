#include "clientstore.h"
#include "isolatedroot.h"
#include "logcapture.h"
#include "scriptedpeer.h"
#include "testsession.h"
#include "transfer.h"

#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <QTest>

#include <filesystem>
#include <functional>
#include <future>

#include <sys/stat.h>

namespace fs = std::filesystem;
using Call = std::function<unsigned(CApiClient &)>;
using Hook = std::function<void(const fs::path &)>;
Q_DECLARE_METATYPE(Call)
Q_DECLARE_METATYPE(Hook)
Q_DECLARE_METATYPE(TransferFailure)
Q_DECLARE_METATYPE(ScriptedPeer::Reply)

namespace {

constexpr std::size_t mebibyte = 1u << 20;
constexpr const char *renewed = "renewed_token-0123456789ABCDEFGHIJKLMNOPQRS";
const JSON ids = {"DV1", "DV2"};

/// A part of a form as it stands on the wire.
struct Part {
    std::string head;
    std::string content;
    bool operator==(const Part &) const = default;
};

std::string head(const std::string &name, const std::string &fileName, bool typed = true) {
    return "Content-Disposition: form-data; name=\"" + name + "\"; filename=\"" + fileName + "\"" +
           (typed ? "\r\nContent-Type: application/octet-stream" : "");
}

/// Empty when the body is not framed as its head says.
std::vector<Part> partsOf(const ScriptedPeer::Request &request) {
    const std::string type = request.header("content-type");
    const std::string start = "multipart/form-data; boundary=";
    if (!type.starts_with(start))
        return {};
    const std::string line = "--" + type.substr(start.size());
    std::vector<Part> parts;
    std::size_t at = 0;
    while (request.body.compare(at, line.size() + 2, line + "\r\n") == 0) {
        const std::size_t headBegin = at + line.size() + 2;
        const std::size_t headEnd = request.body.find("\r\n\r\n", headBegin);
        const std::size_t end = request.body.find("\r\n" + line, headEnd);
        if (end == std::string::npos)
            return {};
        parts.push_back({request.body.substr(headBegin, headEnd - headBegin),
                         request.body.substr(headEnd + 4, end - headEnd - 4)});
        at = end + 2;
    }
    return request.body.substr(at) == line + "--\r\n" ? parts : std::vector<Part>();
}

JSON file(const QString &path, const std::string &name, const std::string &mac) {
    return {{"fpath", path.toStdString()}, {"fname", name}, {"d_mac", mac}};
}

} // namespace

class TestApiClientUploads : public QObject {
    Q_OBJECT

private slots:
    void initTestCase();
    void init();

    void whatIsSent_data();
    void whatIsSent();
    void imageOnThisComputer();
    void preconditions_data();
    void preconditions();
    void names_data();
    void names();
    void manyFiles();
    void filesThatCannotBeSent_data();
    void filesThatCannotBeSent();
    void filesThatDoNotStay_data();
    void filesThatDoNotStay();
    void services_data();
    void services();
    void hugeFileIsRefusedEarly();
    void renewal();
    void cancel_data();
    void cancel();
    void cancelledBefore();
    void progressCountsAndNotTime();
    void exportedFile_data();
    void exportedFile();
    void exportTargets();

private:
    /// A new client with a transfer that can be looked at afterwards.
    std::unique_ptr<CApiClient> client();
    unsigned uploadBig() { return client()->uploadFWFile("T1", m_big.constData(), "big.bin"); }
    /// A big file of the past, so that whatever is done to it now shows.
    void makeBig(const QString &name, std::size_t size);

    IsolatedRoot m_root;
    ScriptedPeer m_peer;
    std::shared_ptr<Transfer> m_transfer;
    QByteArray m_big;
};

void TestApiClientUploads::initTestCase() {
    QVERIFY(m_root.write("a.bin", "image\r\n--bytes\0\xff" + QByteArray(1, '\0')));
    QVERIFY(m_root.write("c.pem", "certificate") && m_root.write("k.pem", "key"));
    makeBig("big.bin", 32 * mebibyte);
}

void TestApiClientUploads::init() {
    m_peer.greet(ScriptedPeer::Greeting::Handshake);
    m_peer.watchBody(0, {});
    m_peer.answer(ScriptedPeer::json({{"code", 0}}));
    m_peer.takeRequests();
    QVERIFY(CClientStore::instance().setThisComputer(false));
}

std::unique_ptr<CApiClient> TestApiClientUploads::client() {
    m_transfer = std::make_shared<Transfer>();
    auto made = TestSession::client(m_peer.port());
    made->setTransfer(m_transfer);
    return made;
}

void TestApiClientUploads::makeBig(const QString &name, std::size_t size) {
    QVERIFY(m_root.write(name, QByteArray(static_cast<qsizetype>(size), 'x')));
    m_big = m_root.filePath(name).toUtf8();
    fs::last_write_time(m_big.toStdString(), fs::file_time_type::clock::now() - std::chrono::hours(1));
}

void TestApiClientUploads::whatIsSent_data() {
    QTest::addColumn<Call>("call");
    QTest::addColumn<std::string>("path");
    QTest::addColumn<std::string>("members");
    QTest::addColumn<QStringList>("files");
    const QString image = m_root.filePath("a.bin");
    const QString cert = m_root.filePath("c.pem");
    const QString key = m_root.filePath("k.pem");
    const JSON certs = {file(cert, "two.pem", "00:02"), file(cert, "one.pem", "00:01")};
    const JSON keys = {file(key, "one.key", "00:01"), file(key, "two.key", "00:02")};
    const QStringList pairs = {"cert_00:01", "one.pem", cert, "pkey_00:01", "one.key", key,
                               "cert_00:02", "two.pem", cert, "pkey_00:02", "two.key", key};
    const auto row = [](const char *name, Call call, const char *path, const JSON &members,
                        const QStringList &files) {
        QTest::newRow(name) << std::move(call) << std::string(path) << members.dump() << files;
    };
    const std::string at = image.toStdString();
    row("uploadConfigFile",
        [at](CApiClient &c) { return c.uploadConfigFile("T1", at.c_str(), "ä.cfg", ids); },
        "/v1/config_file_upload", {{"device_ids", ids}}, {"fimage", "ä.cfg", image});
    row("uploadFWFile", [at](CApiClient &c) { return c.uploadFWFile("T1", at.c_str(), "a.bin"); },
        "/v1/fwupl", JSON::object(), {"fimage", "a.bin", image});
    row("uploadPackage",
        [at](CApiClient &c) { return c.uploadPackage("T1", at.c_str(), "a.bin", ids, true); },
        "/v1/upload_package", {{"device_ids", ids}, {"sd_card", true}}, {"fimage", "a.bin", image});
    row("createHttpsCertsInstall", [certs](CApiClient &c) { return c.createHttpsCertsInstall("T1", certs); },
        "/v1/sslcertinst", JSON::object(), {"cert_00:01", "one.pem", cert, "cert_00:02", "two.pem", cert});
    row(
        "createHttpsCertsPKeys", [=](CApiClient &c) { return c.createHttpsCertsPKeys("T1", certs, keys); },
        "/v1/sslcertpkeys", JSON::object(), pairs);
    row("uploadPEAPCA", [at](CApiClient &c) { return c.uploadPEAPCA("T1", at.c_str(), "ca.pem"); },
        "/v1/ie_peap", JSON::object(), {"ca_", "ca.pem", image});
    row(
        "uploadTLSCA", [=](CApiClient &c) { return c.uploadTLSCA("T1", at.c_str(), "ca.pem", certs, keys); },
        "/v1/ie_tls", JSON::object(), QStringList{"ca_", "ca.pem", image} + pairs);
}

void TestApiClientUploads::whatIsSent() {
    QFETCH(Call, call);
    QFETCH(std::string, path);
    QFETCH(std::string, members);
    QFETCH(QStringList, files);
    const LogCapture log;
    QCOMPARE(call(*client()), unsigned(ApiOk));
    const std::vector<ScriptedPeer::Request> requests = m_peer.takeRequests();
    QCOMPARE(requests.size(), std::size_t(1));
    QCOMPARE(requests[0].path, path);
    QCOMPARE(requests[0].header("authorization"), TestSession::token);
    QCOMPARE(requests[0].header("content-length"), std::to_string(requests[0].body.size()));
    JSON parameters = JSON::parse(members);
    parameters["id"] = TestSession::account;
    parameters["tid"] = "T1";
    const std::vector<Part> parts = partsOf(requests[0]);
    QCOMPARE(parts.size(), static_cast<std::size_t>(files.size() / 3 + 1));
    QCOMPARE(parts[0].head, head("text", "data", false));
    QCOMPARE(parts[0].content, parameters.dump());
    for (qsizetype i = 0; i < files.size(); i += 3) {
        const Part &part = parts[static_cast<std::size_t>(i / 3 + 1)];
        QCOMPARE(part.head, head(files[i].toStdString(), files[i + 1].toStdString()));
        QFile contents(files[i + 2]);
        QVERIFY(contents.open(QIODevice::ReadOnly));
        QCOMPARE(QByteArray::fromStdString(part.content), contents.readAll());
    }
    QCOMPARE(m_transfer->failure(), TransferFailure::None);
    QCOMPARE(m_transfer->bytesTotal(), requests[0].body.size());
    QCOMPARE(m_transfer->bytesDone(), m_transfer->bytesTotal());
    QCOMPARE(log.count(QStringLiteral("CApiClient::%1 > Set authorization to ").arg(QTest::currentDataTag())),
             1);
}

void TestApiClientUploads::imageOnThisComputer() {
    const LogCapture log;
    QVERIFY(CClientStore::instance().setThisComputer(true));
    m_peer.answer({ScriptedPeer::http(200, R"({"code":3,"msg":"no \"image\""})")});
    QCOMPARE(client()->uploadFWFile("T1", "/images/a b.bin", "a b.bin"), unsigned(ApiServerError));
    const ScriptedPeer::Request request = m_peer.takeRequests().at(0);
    QCOMPARE(request.path, "/v1/fwuplex");
    const JSON parameters = {
        {"id", TestSession::account}, {"tid", "T1"}, {"local", "/images/a b.bin"}, {"localn", "a b.bin"}};
    QVERIFY(partsOf(request) == std::vector<Part>({{head("text", "data", false), parameters.dump()}}));
    QCOMPARE(log.count("FW Upload Response -------> Status Code: 200, Code: 3, Body: "
                       R"({"code":3,"msg":"no \"image\""})"),
             1);
}

void TestApiClientUploads::preconditions_data() {
    QTest::addColumn<Call>("call");
    static const std::string at = m_root.filePath("a.bin").toStdString();
    static const JSON one = {file(m_root.filePath("c.pem"), "c.pem", "00:01")};
    static const JSON other = {file(m_root.filePath("c.pem"), "c.pem", "00:02")};
    static const char *path = at.c_str();
    const auto row = [](const char *name, Call call) { QTest::newRow(name) << std::move(call); };
    row("no task", [](CApiClient &c) { return c.uploadFWFile("", path, "a"); });
    row("null task", [](CApiClient &c) { return c.uploadPEAPCA(nullptr, path, "a"); });
    row("no path", [](CApiClient &c) { return c.uploadConfigFile("T1", "", "a", ids); });
    row("no name", [](CApiClient &c) { return c.uploadPackage("T1", path, nullptr, ids, false); });
    row("devices no list", [](CApiClient &c) { return c.uploadPackage("T1", path, "a", "DV1", false); });
    row("no certificates", [](CApiClient &c) { return c.createHttpsCertsInstall("T1", JSON::array()); });
    row("a device twice", [](CApiClient &c) { return c.createHttpsCertsInstall("T1", {one[0], one[0]}); });
    row("entry without a path", [](CApiClient &c) {
        return c.createHttpsCertsInstall("T1", {{{"fname", "a"}, {"d_mac", "b"}}});
    });
    row("no keys", [](CApiClient &c) { return c.createHttpsCertsPKeys("T1", one, JSON::array()); });
    row("key of another device", [](CApiClient &c) { return c.createHttpsCertsPKeys("T1", one, other); });
    row("no CA", [](CApiClient &c) { return c.uploadTLSCA("T1", "", "a", one, one); });
    row("settings no object", [](CApiClient &c) { return c.createHttpsSelfSignedCerts(JSON::array(), ids); });
    row("export of no task", [](CApiClient &c) { return c.exportFile("", "/tmp/x"); });
    row("export without a target", [](CApiClient &c) { return c.exportFile("T1", ""); });
}

void TestApiClientUploads::preconditions() {
    QFETCH(Call, call);
    const LogCapture log;
    const int before = m_peer.connections();
    QCOMPARE(call(*client()), unsigned(ApiInvalidArgument));
    CApiClient noSession("127.0.0.1", m_peer.port());
    QCOMPARE(noSession.uploadFWFile("T1", m_big.constData(), "a"), unsigned(ApiInvalidArgument));
    QCOMPARE(noSession.exportFile("T1", "/tmp/x"), unsigned(ApiInvalidArgument));
    QCOMPARE(m_peer.connections(), before);
}

void TestApiClientUploads::names_data() {
    QTest::addColumn<QString>("name");
    QTest::addColumn<std::string>("sent");
    const QString longest = QString(127, QChar(0xe4)) + 'x';
    QTest::newRow("255 bytes") << longest << longest.toStdString();
    QTest::newRow("quote") << "a\"; name=\"text.bin" << std::string("a%22; name=%22text.bin");
    QTest::newRow("new lines") << "a\r\nContent-Type: b\n.bin"
                               << std::string("a%0D%0AContent-Type: b%0A.bin");
    QTest::newRow("backslash at the end") << "a\\" << std::string("a%5C");
    QTest::newRow("format") << "%s%n %1.bin" << std::string("%s%n %1.bin");
}

void TestApiClientUploads::names() {
    QFETCH(QString, name);
    QFETCH(std::string, sent);
    const LogCapture log;
    QVERIFY(m_root.write(name, "bytes"));
    const std::string path = m_root.filePath(name).toStdString();
    QCOMPARE(client()->uploadFWFile("T1", path.c_str(), name.toUtf8().constData()), unsigned(ApiOk));
    const std::vector<Part> parts = partsOf(m_peer.takeRequests().at(0));
    QCOMPARE(parts.size(), std::size_t(2));
    QCOMPARE(parts[1].head, head("fimage", sent));
    QCOMPARE(parts[1].content, "bytes");
}

/// More than a process may have open at once.
void TestApiClientUploads::manyFiles() {
    const LogCapture log;
    JSON certs = JSON::array();
    for (int i = 0; i < 2000; ++i)
        certs.push_back(file(m_root.filePath("c.pem"), "c.pem", std::to_string(i)));
    QCOMPARE(client()->createHttpsCertsInstall("T1", certs), unsigned(ApiOk));
    QCOMPARE(partsOf(m_peer.takeRequests().at(0)).size(), std::size_t(2001));
}

void TestApiClientUploads::filesThatCannotBeSent_data() {
    QTest::addColumn<QString>("name");
    QTest::addColumn<TransferFailure>("failure");
    QVERIFY(m_root.write("empty", {}) && m_root.write("locked", "x"));
    QFile::setPermissions(m_root.filePath("locked"), {});
    ::mkfifo(m_root.filePath("pipe").toUtf8().constData(), 0600);
    QTest::newRow("missing") << "missing" << TransferFailure::FileUnreadable;
    QTest::newRow("folder") << "." << TransferFailure::FileUnreadable;
    QTest::newRow("pipe") << "pipe" << TransferFailure::FileUnreadable;
    QTest::newRow("empty") << "empty" << TransferFailure::FileEmpty;
    if (!QFile(m_root.filePath("locked")).open(QIODevice::ReadOnly))
        QTest::newRow("locked") << "locked" << TransferFailure::FileUnreadable;
}

void TestApiClientUploads::filesThatCannotBeSent() {
    QFETCH(QString, name);
    QFETCH(TransferFailure, failure);
    const LogCapture log;
    const int before = m_peer.connections();
    const std::string path = m_root.filePath(name).toStdString();
    QCOMPARE(client()->uploadFWFile("T1", path.c_str(), "shown.bin"), unsigned(ApiException));
    QCOMPARE(m_peer.connections(), before);
    QCOMPARE(m_transfer->failure(), failure);
    QVERIFY(m_transfer->failureText().contains("“shown.bin”"));
}

void TestApiClientUploads::filesThatDoNotStay_data() {
    QTest::addColumn<Hook>("change");
    QTest::addColumn<TransferFailure>("failure");
    const auto row = [](const char *name, TransferFailure failure, Hook change) {
        QTest::newRow(name) << std::move(change) << failure;
    };
    row("shrinks", TransferFailure::FileChanged,
        [](const fs::path &path) { fs::resize_file(path, 8 * mebibyte); });
    row("shrinks in its last block", TransferFailure::FileChanged,
        [](const fs::path &path) { fs::resize_file(path, 32 * mebibyte - 1); });
    row("grows", TransferFailure::FileChanged,
        [](const fs::path &path) { fs::resize_file(path, 33 * mebibyte); });
    row("written to", TransferFailure::FileChanged, [](const fs::path &path) {
        QFile file(path);
        QVERIFY(file.open(QIODevice::ReadWrite) && file.write("y") == 1);
    });
    row("replaced", TransferFailure::FileChanged, [](const fs::path &path) {
        fs::copy_file(path, path.string() + "2");
        fs::rename(path.string() + "2", path);
    });
    row("vanishes", TransferFailure::FileGone, [](const fs::path &path) { fs::remove(path); });
}

void TestApiClientUploads::filesThatDoNotStay() {
    QFETCH(Hook, change);
    QFETCH(TransferFailure, failure);
    const LogCapture log;
    makeBig("changing.bin", 32 * mebibyte);
    m_peer.watchBody(mebibyte, [&](std::size_t received) {
        if (received == mebibyte)
            change(m_big.toStdString());
        return true;
    });
    QCOMPARE(uploadBig(), unsigned(ApiException));
    QVERIFY2(m_peer.takeRequests().empty(), "the service must not take it for whole");
    QCOMPARE(m_transfer->failure(), failure);
    QCOMPARE(m_transfer->failedFile(), "big.bin");
    QVERIFY(m_transfer->bytesDone() < m_transfer->bytesTotal());
    makeBig("big.bin", 32 * mebibyte);
}

void TestApiClientUploads::services_data() {
    QTest::addColumn<bool>("early");
    QTest::addColumn<ScriptedPeer::Reply>("reply");
    QTest::addColumn<unsigned>("result");
    QTest::addColumn<TransferFailure>("failure");
    using End = ScriptedPeer::End;
    using Reply = ScriptedPeer::Reply;
    const auto http = [](int status, End end = End::Close) {
        return Reply{ScriptedPeer::http(status, R"({"code":0})"), end};
    };
    const auto lost = TransferFailure::RefusedOrLost;
    QTest::newRow("413") << false << http(413) << 13u << TransferFailure::TooLarge;
    QTest::newRow("500") << false << http(500) << 13u << TransferFailure::None;
    QTest::newRow("session gone") << false << ScriptedPeer::json({{"code", 105}}) << 17u
                                  << TransferFailure::None;
    QTest::newRow("no JSON") << false << Reply{ScriptedPeer::http(200, "<html>")} << 1u
                             << TransferFailure::None;
    QTest::newRow("no answer") << false << Reply{} << 12u << lost;
    QTest::newRow("early 413 and closes") << true << http(413) << 13u << TransferFailure::TooLarge;
    QTest::newRow("early 413 and waits") << true << http(413, End::Hold) << 13u << TransferFailure::TooLarge;
    QTest::newRow("early 401 and resets") << true << http(401, End::Reset) << 13u << TransferFailure::None;
    QTest::newRow("early success and closes") << true << http(200) << 12u << lost;
    QTest::newRow("closes in the middle") << true << Reply{} << 12u << lost;
    QTest::newRow("resets in the middle") << true << Reply{{}, End::Reset} << 12u << lost;
}

void TestApiClientUploads::services() {
    QFETCH(bool, early);
    QFETCH(ScriptedPeer::Reply, reply);
    QFETCH(unsigned, result);
    QFETCH(TransferFailure, failure);
    const LogCapture log;
    const int before = m_peer.connections();
    m_peer.answer(reply);
    if (early)
        m_peer.watchBody(mebibyte, [](std::size_t) { return false; });
    QCOMPARE(uploadBig(), result);
    QCOMPARE(m_transfer->failure(), failure);
    QCOMPARE(m_transfer->failureText().isEmpty(), failure == TransferFailure::None);
    QCOMPARE(log.count("File upload error: "), result == 12u ? 1 : 0);
    QCOMPARE(log.count("FW Upload Response -------> Status Code: "), result == 12u ? 0 : 1);
    QVERIFY2(m_peer.connections() == before + 1, "an upload is never repeated by itself");
    if (result != 12u)
        return;
    QCOMPARE(client()->uploadPackage("T1", m_big.constData(), "a", ids, false), 12u);
    QCOMPARE(client()->uploadConfigFile("T1", m_big.constData(), "a", ids), 12u);
    for (const char *method : {"uploadPackage: ", "uploadConfigFile: "})
        QCOMPARE(log.count(QStringLiteral("Encountered HTTP request error when CApiClient::") + method), 1);
}

void TestApiClientUploads::hugeFileIsRefusedEarly() {
    const LogCapture log;
    constexpr std::uintmax_t size = 5ull << 30;
    QVERIFY(m_root.write("huge.bin", "x"));
    const std::string path = m_root.filePath("huge.bin").toStdString();
    fs::resize_file(path, size);
    m_peer.answer({ScriptedPeer::http(413, {})});
    m_peer.watchBody(mebibyte, [](std::size_t) { return false; });
    QCOMPARE(client()->uploadFWFile("T1", path.c_str(), "huge.bin"), unsigned(ApiHttpStatusError));
    QCOMPARE(m_transfer->failure(), TransferFailure::TooLarge);
    const ScriptedPeer::Request request = m_peer.takeRequests().at(0);
    QCOMPARE(request.header("content-length"), std::to_string(m_transfer->bytesTotal()));
    QVERIFY(m_transfer->bytesTotal() > size && m_transfer->bytesTotal() < size + 1000);
}

void TestApiClientUploads::renewal() {
    const LogCapture log;
    m_peer.answer(ScriptedPeer::json({{"code", 0}}, {std::string("Authorization: ") + renewed}));
    const auto first = client();
    QCOMPARE(first->uploadFWFile("T1", m_big.constData(), "a"), unsigned(ApiOk));
    QCOMPARE(first->accessToken(), renewed);
    QCOMPARE(log.count(QStringLiteral("CApiClient::uploadFWFile > m_strAccess: ") + renewed), 1);
    const auto second = client();
    QCOMPARE(second->uploadPEAPCA("T1", m_big.constData(), "a"), unsigned(ApiOk));
    QCOMPARE(second->accessToken(), renewed);
    QCOMPARE(log.count(QStringLiteral("renew token: ") + renewed), 1);
    QCOMPARE(log.count("CApiClient::uploadPEAPCA > m_strAccess"), 0);
}

void TestApiClientUploads::cancel_data() {
    QTest::addColumn<QString>("during");
    for (const char *during : {"handshake", "sending", "standstill", "waiting for the answer"})
        QTest::newRow(during) << QString(during);
}

void TestApiClientUploads::cancel() {
    QFETCH(QString, during);
    const LogCapture log;
    std::promise<void> atStandstill;
    std::promise<void> over;
    m_peer.answer({{}, ScriptedPeer::End::Hold});
    if (during == "handshake")
        m_peer.greet(ScriptedPeer::Greeting::Silence);
    if (during == "sending" || during == "standstill")
        m_peer.watchBody(mebibyte / 4, [&](std::size_t received) {
            if (received == mebibyte / 4)
                atStandstill.set_value();
            if (during == "standstill")
                over.get_future().wait();
            else
                QTest::qSleep(30);
            return during == "sending";
        });
    const int before = m_peer.connections();
    const auto made = client();
    auto result =
        std::async(std::launch::async, [&] { return made->uploadFWFile("T1", m_big.constData(), "a"); });
    QTRY_VERIFY(m_peer.connections() > before);
    if (during == "sending" || during == "standstill")
        atStandstill.get_future().wait();
    if (during == "standstill")
        QTest::qWait(300);
    if (during == "waiting for the answer")
        QTRY_VERIFY(m_transfer->bytesTotal() != 0 && m_transfer->bytesDone() == m_transfer->bytesTotal());
    QElapsedTimer timer;
    timer.start();
    m_transfer->cancel();
    QCOMPARE(result.get(), unsigned(ApiTransportError));
    QVERIFY2(timer.elapsed() < 1000, "within a second");
    over.set_value();
    QCOMPARE(m_transfer->failure(), TransferFailure::Cancelled);
    QCOMPARE(log.count("File upload error: Canceled"), 1);
}

void TestApiClientUploads::cancelledBefore() {
    const LogCapture log;
    const int before = m_peer.connections();
    const auto made = client();
    m_transfer->cancel();
    QCOMPARE(made->uploadFWFile("T1", m_big.constData(), "a"), unsigned(ApiTransportError));
    QCOMPARE(m_transfer->failure(), TransferFailure::Cancelled);
    QCOMPARE(m_peer.connections(), before);
}

void TestApiClientUploads::progressCountsAndNotTime() {
    const LogCapture log;
    const auto slow = client();
    slow->setTotalTimeout(std::chrono::milliseconds(1500));
    m_peer.watchBody(2 * mebibyte, [](std::size_t) {
        QTest::qSleep(150);
        return true;
    });
    QElapsedTimer timer;
    timer.start();
    QCOMPARE(slow->uploadFWFile("T1", m_big.constData(), "a"), unsigned(ApiOk));
    QVERIFY(timer.elapsed() > 1500);

    std::promise<void> over;
    m_peer.watchBody(mebibyte, [&](std::size_t) {
        over.get_future().wait();
        return false;
    });
    const auto stalled = client();
    stalled->setTotalTimeout(std::chrono::milliseconds(800));
    timer.restart();
    QCOMPARE(stalled->uploadFWFile("T1", m_big.constData(), "a"), unsigned(ApiTransportError));
    QVERIFY(timer.elapsed() < 4000);
    over.set_value();
    QCOMPARE(m_transfer->failure(), TransferFailure::Stalled);
}

void TestApiClientUploads::exportedFile_data() {
    QTest::addColumn<std::string>("reply");
    QTest::addColumn<unsigned>("result");
    const std::string type = "Content-Type: application/octet-stream";
    const std::string bytes(3 * mebibyte, 'z');
    const std::string ok = "HTTP/1.1 200 OK\r\n" + type + "\r\n";
    QTest::newRow("whole") << ScriptedPeer::http(200, bytes, {type, std::string("Authorization: ") + renewed})
                           << 0u;
    QTest::newRow("chunks") << ok + "Transfer-Encoding: chunked\r\n\r\n300000\r\n" + bytes + "\r\n0\r\n\r\n"
                            << 0u;
    QTest::newRow("cut off") << ok + "Content-Length: 9999999\r\n\r\n" + bytes << 12u;
    QTest::newRow("cut off in chunks") << ok + "Transfer-Encoding: chunked\r\n\r\n300000\r\n" + bytes + "\r\n"
                                       << 12u;
    QTest::newRow("without an end") << ok + "Connection: close\r\n\r\n" + bytes << 12u;
    QTest::newRow("404") << ScriptedPeer::http(404, bytes, {type}) << 13u;
    QTest::newRow("session gone") << ScriptedPeer::http(200, R"({"code":105})") << 17u;
    QTest::newRow("no file") << ScriptedPeer::http(200, R"({"code":0,"data":"x"})") << 14u;
    QTest::newRow("no JSON") << ScriptedPeer::http(200, bytes) << 1u;
}

void TestApiClientUploads::exportedFile() {
    QFETCH(std::string, reply);
    QFETCH(unsigned, result);
    const LogCapture log;
    const QTemporaryDir folder;
    const QString target = folder.filePath("ä report.zip");
    m_peer.answer({reply});
    const auto made = client();
    QCOMPARE(made->exportFile("T1", target.toUtf8().constData()), result);
    const ScriptedPeer::Request request = m_peer.takeRequests().at(0);
    QCOMPARE(request.path, "/v1/export/file");
    QCOMPARE(request.body, R"({"id":")" + std::string(TestSession::account) + R"(","tid":"T1"})");
    const auto all = QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot;
    QCOMPARE(QDir(folder.path()).entryList(all).size(), result == 0u ? 1 : 0);
    QCOMPARE(made->accessToken(), reply.find(renewed) != std::string::npos ? renewed : TestSession::token);
    if (result != 0u)
        return;
    QCOMPARE(QFileInfo(target).size(), qint64(3 * mebibyte));
    QCOMPARE(QFile::permissions(target) & QFile::Permissions(0x0077), QFile::Permissions());
    QCOMPARE(m_transfer->bytesDone(), 3 * mebibyte);
}

void TestApiClientUploads::exportTargets() {
    const LogCapture log;
    const std::string answer = ScriptedPeer::http(200, "new", {"Content-Type: application/octet-stream"});
    QVERIFY(m_root.write("report.zip", "old"));
    const QByteArray target = m_root.filePath("report.zip").toUtf8();
    const int before = m_peer.connections();
    QCOMPARE(client()->exportFile("T1", target.constData()), unsigned(ApiTargetNotWritten));
    QCOMPARE(m_transfer->failure(), TransferFailure::TargetNotWritten);
    QCOMPARE(client()->exportFile("T1", m_root.filePath("no/such/report.zip").toUtf8().constData()),
             unsigned(ApiTargetNotWritten));
    QCOMPARE(m_peer.connections(), before);
    QVERIFY(QFile::remove(m_root.filePath("report.zip")));
    m_peer.follow([&](const ScriptedPeer::Request &) {
        m_root.write("report.zip", "old");
        return ScriptedPeer::Reply{answer};
    });
    QCOMPARE(client()->exportFile("T1", target.constData()), unsigned(ApiTargetNotWritten));
    QCOMPARE(m_root.read("report.zip"), "old");
}

QTEST_GUILESS_MAIN(TestApiClientUploads)
#include "tst_apiclient_uploads.moc"
