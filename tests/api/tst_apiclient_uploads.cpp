#include "api/transport/transfer.h"
#include "store/clientstore.h"
#include "store/localstore.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/scriptedpeer.h"
#include "support/testmain.h"
#include "testsession.h"

#include <QTest>

#include <functional>

using Call = std::function<unsigned(CApiClient &)>;

namespace {

constexpr std::size_t mebibyte = 1u << 20;
constexpr const char *renewed = "renewed_token-0123456789ABCDEFGHIJKLMNOPQRS";
const JSON ids = {"DV1", "DV2"};

std::string partHead(const std::string &name, const std::string &fileName) {
    const bool isText = name == "text";
    return "Content-Disposition: form-data; name=\"" + name + "\"; filename=\"" + fileName + "\"" +
           (isText ? "" : "\r\nContent-Type: application/octet-stream");
}

/// Heads and contents of the parts, by turns; empty when the body is not framed as its type says.
std::vector<std::string> partsOf(const ScriptedPeer::Request &request) {
    const std::string type = request.header("content-type");
    const std::string start = "multipart/form-data; boundary=";
    const std::string line = "--" + type.substr(std::min(start.size(), type.size()));
    std::vector<std::string> parts;
    std::size_t at = 0;
    while (type.starts_with(start) && request.body.compare(at, line.size() + 2, line + "\r\n") == 0) {
        const std::size_t begin = at + line.size() + 2;
        const std::size_t middle = request.body.find("\r\n\r\n", begin);
        const std::size_t end = request.body.find("\r\n" + line, middle);
        if (end == std::string::npos)
            return {};
        parts.push_back(request.body.substr(begin, middle - begin));
        parts.push_back(request.body.substr(middle + 4, end - middle - 4));
        at = end + 2;
    }
    return request.body.substr(at) == line + "--\r\n" ? parts : std::vector<std::string>();
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
    void preconditions();
    void names();
    void exportedFile_data();
    void exportedFile();
    void exportTargets();

private:
    /// A new client with a transfer that can be looked at afterwards.
    std::unique_ptr<CApiClient> client();
    JSON file(const char *name, const char *mac) const {
        return {{"fpath", m_root.filePath(name).toStdString()}, {"fname", name}, {"d_mac", mac}};
    }

    IsolatedRoot m_root;
    ScriptedPeer m_peer;
    std::shared_ptr<Transfer> m_transfer;
};

void TestApiClientUploads::initTestCase() {
    for (const char *name : {"a.bin", "1.pem", "2.pem", "1.key", "2.key"})
        QVERIFY(m_root.write(name, QByteArray("\r\n--\xff\0", 6) + name));
}

void TestApiClientUploads::init() {
    m_peer.answer(ScriptedPeer::json({{"code", 0}}, {std::string("Authorization: ") + renewed}));
    m_peer.takeRequests();
    QVERIFY(CClientStore::instance().setThisComputer(false));
}

std::unique_ptr<CApiClient> TestApiClientUploads::client() {
    m_transfer = std::make_shared<Transfer>();
    auto made = TestSession::client(m_peer.port());
    made->setTransfer(m_transfer);
    return made;
}

void TestApiClientUploads::whatIsSent_data() {
    QTest::addColumn<Call>("call");
    QTest::addColumn<std::string>("path");
    QTest::addColumn<std::string>("members");
    QTest::addColumn<QStringList>("files");
    const auto row = [](const char *name, const char *path, const JSON &members, const QStringList &files,
                        Call call) {
        QTest::newRow(name) << std::move(call) << std::string(path) << members.dump() << files;
    };
    static const std::string image = m_root.filePath("a.bin").toStdString();
    static const char *at = image.c_str();
    static const JSON certs = {file("2.pem", "0:2"), file("1.pem", "0:1")};
    static const JSON keys = {file("1.key", "0:1"), file("2.key", "0:2")};
    const QStringList pairs = {"cert_0:1", "1.pem", "pkey_0:1", "1.key",
                               "cert_0:2", "2.pem", "pkey_0:2", "2.key"};
    const JSON none = JSON::object();
    row("uploadConfigFile", "/v1/config_file_upload", {{"device_ids", ids}}, {"fimage", "a.bin"},
        [](CApiClient &c) { return c.uploadConfigFile("T1", at, "a.bin", ids); });
    row("uploadFWFile", "/v1/fwupl", none, {"fimage", "a.bin"},
        [](CApiClient &c) { return c.uploadFWFile("T1", at, "a.bin"); });
    row("uploadPackage", "/v1/upload_package", {{"device_ids", ids}, {"sd_card", true}}, {"fimage", "a.bin"},
        [](CApiClient &c) { return c.uploadPackage("T1", at, "a.bin", ids, true); });
    row("createHttpsCertsInstall", "/v1/sslcertinst", none, {"cert_0:1", "1.pem", "cert_0:2", "2.pem"},
        [](CApiClient &c) { return c.createHttpsCertsInstall("T1", certs); });
    row("createHttpsCertsPKeys", "/v1/sslcertpkeys", none, pairs,
        [](CApiClient &c) { return c.createHttpsCertsPKeys("T1", certs, keys); });
    row("uploadPEAPCA", "/v1/ie_peap", none, {"ca_", "a.bin"},
        [](CApiClient &c) { return c.uploadPEAPCA("T1", at, "a.bin"); });
    row("uploadTLSCA", "/v1/ie_tls", none, QStringList{"ca_", "a.bin"} + pairs,
        [](CApiClient &c) { return c.uploadTLSCA("T1", at, "a.bin", certs, keys); });
}

void TestApiClientUploads::whatIsSent() {
    QFETCH(Call, call);
    QFETCH(std::string, path);
    QFETCH(std::string, members);
    QFETCH(QStringList, files);
    const LogCapture log;
    QCOMPARE(call(*client()), unsigned(ApiOk));
    const ScriptedPeer::Request request = m_peer.takeRequests().at(0);
    QCOMPARE(request.path, path);
    QCOMPARE(request.header("authorization"), TestSession::token);
    QCOMPARE(request.header("content-length"), std::to_string(request.body.size()));
    JSON parameters = JSON::parse(members);
    parameters.update({{"id", TestSession::account}, {"tid", "T1"}});
    std::vector<std::string> expected = {partHead("text", "data"), parameters.dump()};
    for (qsizetype i = 0; i < files.size(); i += 2) {
        expected.push_back(partHead(files[i].toStdString(), files[i + 1].toStdString()));
        expected.push_back(m_root.read(files[i + 1]).toStdString());
    }
    QCOMPARE(partsOf(request), expected);
    QCOMPARE(m_transfer->failure(), TransferFailure::None);
    QCOMPARE(m_transfer->bytesTotal(), request.body.size());
    QCOMPARE(m_transfer->bytesDone(), request.body.size());
    const QString method = QTest::currentDataTag();
    QCOMPARE(log.count("CApiClient::" + method + " > Set authorization to " + TestSession::token), 1);
    const bool isCertificate = files.at(0) != "fimage";
    QCOMPARE(log.count(QStringLiteral("renew token: ") + renewed), isCertificate ? 1 : 0);
    QCOMPARE(log.count("CApiClient::" + method + " > m_strAccess: " + renewed), isCertificate ? 0 : 1);
}

void TestApiClientUploads::imageOnThisComputer() {
    const LogCapture log;
    QVERIFY(CClientStore::instance().setThisComputer(true));
    CLocalStore::instance().setLoginInfo("127.0.0.1", m_peer.port(), TestSession::account, "token", true);
    m_peer.answer({ScriptedPeer::http(200, R"({"code":3,"msg":"%s"})")});
    QCOMPARE(client()->uploadFWFile("T1", "/images/a b.bin", "a b.bin"), unsigned(ApiServerError));
    const ScriptedPeer::Request request = m_peer.takeRequests().at(0);
    QCOMPARE(request.path, "/v1/fwuplex");
    const JSON parameters = {
        {"id", TestSession::account}, {"tid", "T1"}, {"local", "/images/a b.bin"}, {"localn", "a b.bin"}};
    QCOMPARE(partsOf(request), std::vector<std::string>({partHead("text", "data"), parameters.dump()}));
    QCOMPARE(log.count(R"(-> Status Code: 200, Code: 3, Body: {"code":3,"msg":"%s"})"), 1);
}

void TestApiClientUploads::preconditions() {
    const LogCapture log;
    const JSON one = {file("1.pem", "0:1")};
    const JSON other = {file("1.key", "0:2")};
    const int before = m_peer.connections();
    CApiClient noSession("127.0.0.1", m_peer.port());
    const std::vector<unsigned> results = {
        noSession.uploadFWFile("T1", "path", "a"),
        noSession.exportFile("T1", "path"),
        client()->uploadFWFile("", "path", "a"),
        client()->uploadConfigFile("T1", "", "a", ids),
        client()->uploadPackage("T1", "path", nullptr, ids, false),
        client()->uploadPackage("T1", "path", "a", "no list", false),
        client()->createHttpsCertsInstall("T1", JSON::array()),
        client()->createHttpsCertsInstall("T1", {one[0], one[0]}),
        client()->createHttpsCertsPKeys("T1", one, other),
        client()->uploadTLSCA("T1", nullptr, "a", one, one),
        client()->createHttpsSelfSignedCerts(nullptr, ids),
        client()->exportFile("T1", ""),
    };
    QCOMPARE(results, std::vector<unsigned>(results.size(), ApiInvalidArgument));
    QCOMPARE(m_peer.connections(), before);
}

void TestApiClientUploads::names() {
    const LogCapture log;
    const QString longest = QString(127, QChar(0xe4)) + 'x';
    for (const auto &[name, sent] :
         std::map<QString, std::string>{{longest, longest.toStdString()},
                                        {"a\"; name=\"text.bin", "a%22; name=%22text.bin"},
                                        {"a\r\nType: b\n.bin", "a%0D%0AType: b%0A.bin"},
                                        {"a\\", "a%5C"}}) {
        QVERIFY(m_root.write(name, "bytes"));
        const QByteArray path = m_root.filePath(name).toUtf8();
        QCOMPARE(client()->uploadFWFile("T1", path.constData(), name.toUtf8().constData()), unsigned(ApiOk));
        QCOMPARE(partsOf(m_peer.takeRequests().at(0)).at(2), partHead("fimage", sent));
    }
}

void TestApiClientUploads::exportedFile_data() {
    QTest::addColumn<std::string>("reply");
    QTest::addColumn<unsigned>("result");
    const std::string type = "Content-Type: application/octet-stream";
    const std::string bytes(3 * mebibyte, 'z');
    const std::string ok = "HTTP/1.1 200 OK\r\n" + type + "\r\n";
    const std::string chunk = ok + "Transfer-Encoding: chunked\r\n\r\n300000\r\n" + bytes + "\r\n";
    const auto row = [](const char *name, const std::string &reply, unsigned result) {
        QTest::newRow(name) << reply << result;
    };
    row("whole", ScriptedPeer::http(200, bytes, {type, std::string("Authorization: ") + renewed}), 0);
    row("chunks", chunk + "0\r\n\r\n", 0);
    row("cut off", ok + "Content-Length: 9999999\r\n\r\n" + bytes, 12);
    row("cut off in chunks", chunk, 12);
    row("chunk longer than it said",
        ok + "Transfer-Encoding: chunked\r\n\r\n2fffff\r\n" + bytes + "\r\n0\r\n\r\n", 12);
    row("5 GiB", ok + "Content-Length: 5368709120\r\n\r\n" + bytes, 12);
    row("a chunk of 5 GiB", ok + "Transfer-Encoding: chunked\r\n\r\n140000000\r\n" + bytes, 12);
    row("without an end", ok + "Connection: close\r\n\r\n" + bytes, 12);
    row("404", ScriptedPeer::http(404, bytes, {type}), 13);
    row("105", ScriptedPeer::http(200, R"({"code":105})"), 17);
    row("no file", ScriptedPeer::http(200, R"({"code":0,"data":"x"})"), 14);
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
    QCOMPARE(made->accessToken() == renewed, reply.find(renewed) != std::string::npos);
    const QDir::Filters all = QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot;
    QCOMPARE(QDir(folder.path()).entryList(all).size(), result == 0u ? 1 : 0);
    if (result != 0u)
        return;
    QCOMPARE(QFileInfo(target).size(), qint64(3 * mebibyte));
    QCOMPARE(QFile::permissions(target) & QFile::Permissions(0x0077), QFile::Permissions());
    QCOMPARE(m_transfer->bytesDone(), 3 * mebibyte);
}

void TestApiClientUploads::exportTargets() {
    const LogCapture log;
    QVERIFY(m_root.write("report.zip", "old"));
    const QByteArray target = m_root.filePath("report.zip").toUtf8();
    const int before = m_peer.connections();
    for (const QByteArray &path : {target, m_root.filePath("no/such/report.zip").toUtf8()})
        QCOMPARE(client()->exportFile("T1", path.constData()), unsigned(ApiTargetNotWritten));
    QCOMPARE(m_peer.connections(), before);
    QVERIFY(QFile::remove(target));
    m_peer.follow([&](const ScriptedPeer::Request &) {
        m_root.write("report.zip", "old");
        return ScriptedPeer::Reply{
            ScriptedPeer::http(200, "new", {"Content-Type: application/octet-stream"})};
    });
    QCOMPARE(client()->exportFile("T1", target.constData()), unsigned(ApiTargetNotWritten));
    QCOMPARE(m_transfer->failure(), TransferFailure::TargetNotWritten);
    QCOMPARE(m_root.read("report.zip"), "old");
}

NVLDM_GUILESS_TEST(TestApiClientUploads)
#include "tst_apiclient_uploads.moc"
