#include "api/session/servicerequest.h"
#include "store/serverkeys.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/scriptedpeer.h"
#include "support/testmain.h"
#include "testsession.h"

#include <QElapsedTimer>
#include <QSemaphore>
#include <QSignalSpy>
#include <QTest>

#include <array>
#include <netinet/in.h>
#include <sys/socket.h>
#include <unistd.h>

namespace {

constexpr const char *renewed = "renewed_token-0123456789";

unsigned removeSite(ServiceSession &session) {
    return session.call([](CApiClient &client) { return client.removeSite("SR1"); });
}

QString storedToken() {
    const std::string cipher = CLocalStore::instance().loginInfo().token.toStdString();
    return QString::fromStdString(Ciphers::openSecret(cipher).value_or(""));
}

/// A port where a connection is neither made nor refused: nobody takes those that fill its queue.
class FullPort {
public:
    FullPort() {
        sockaddr_in address{};
        address.sin_family = AF_INET;
        address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
        socklen_t size = sizeof address;
        auto *const raw = reinterpret_cast<sockaddr *>(&address);
        const bool listens = ::bind(m_sockets[0], raw, size) == 0 && ::listen(m_sockets[0], 0) == 0 &&
                             ::getsockname(m_sockets[0], raw, &size) == 0;
        m_port = listens ? ntohs(address.sin_port) : 0;
        for (std::size_t i = 1; i < m_sockets.size(); ++i)
            (void)::connect(m_sockets[i], raw, size);
    }
    ~FullPort() {
        for (const int socket : m_sockets)
            ::close(socket);
    }
    FullPort(const FullPort &) = delete;
    FullPort &operator=(const FullPort &) = delete;
    std::uint32_t port() const { return m_port; }

private:
    static int made(int flags) { return ::socket(AF_INET, SOCK_STREAM | flags, 0); }

    std::array<int, 3> m_sockets{made(0), made(SOCK_NONBLOCK), made(SOCK_NONBLOCK)};
    std::uint32_t m_port = 0;
};

} // namespace

class TestServiceRequest : public QObject {
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void renewedTokenIsStored();
    void nextCallOfAJobCarriesTheRenewedToken();
    void answerAfterTheLogOff_data();
    void answerAfterTheLogOff();
    void nothingIsSentAfterTheLogOff();
    void endOfTheSessionCutsItsRequests_data();
    void endOfTheSessionCutsItsRequests();
    void lostSessionIsReportedOnce();
    void changedServerKeyIsAskedAboutOnce_data();
    void changedServerKeyIsAskedAboutOnce();
    void renewalsThatCrossed_data();
    void renewalsThatCrossed();
    void failureIsAResult();

private:
    void logIn(std::uint32_t port = 0) {
        const std::string cipher = Ciphers::sealSecret(TestSession::token).value_or("");
        CLocalStore::instance().setLoginInfo("127.0.0.1", port != 0 ? port : m_peer.port(),
                                             TestSession::account, QByteArray::fromStdString(cipher));
    }
    bool post() {
        return ServiceRequest::post(
            NetJob::createRunner("test"), this, removeSite, [this](unsigned result) { m_results << result; },
            [this](JobOutcome end) { m_ends << end; });
    }

    IsolatedRoot m_root;
    ScriptedPeer m_peer;
    std::unique_ptr<LogCapture> m_log;
    QList<unsigned> m_results;
    QList<JobOutcome> m_ends;
};

void TestServiceRequest::init() {
    m_log = std::make_unique<LogCapture>();
    m_results.clear();
    m_ends.clear();
    m_peer.takeRequests();
    logIn();
}

void TestServiceRequest::cleanup() {
    QVERIFY(NetTask::waitForAll(10000));
    m_log.reset();
}

void TestServiceRequest::renewedTokenIsStored() {
    m_peer.answer(ScriptedPeer::json({{"code", 0}}, {std::string("Authorization: ") + renewed}));
    QVERIFY(post());
    QTRY_COMPARE(m_ends, QList<JobOutcome>{JobOutcome::Delivered});
    QCOMPARE(m_results, QList<unsigned>{ApiOk});
    QCOMPARE(m_peer.takeRequests().at(0).header("authorization"), TestSession::token);
    QCOMPARE(storedToken(), renewed);
    QVERIFY(post());
    QTRY_COMPARE(m_ends.size(), 2);
    QCOMPARE(m_peer.takeRequests().at(0).header("authorization"), renewed);
}

void TestServiceRequest::nextCallOfAJobCarriesTheRenewedToken() {
    m_peer.answer(ScriptedPeer::json({{"code", 0}}, {std::string("Authorization: ") + renewed}));
    const auto twice = [](ServiceSession &session) { return removeSite(session) + removeSite(session); };
    QVERIFY(ServiceRequest::post(NetJob::createRunner("test"), this, twice,
                                 [this](unsigned result) { m_results << result; }));
    QTRY_COMPARE(m_results, QList<unsigned>{ApiOk});
    QCOMPARE(m_peer.takeRequests().at(1).header("authorization"), renewed);
}

void TestServiceRequest::answerAfterTheLogOff_data() {
    QTest::addColumn<int>("code");
    QTest::addColumn<bool>("newSession");
    QTest::newRow("log-off") << 0 << false;
    QTest::newRow("log-off and log-in") << 0 << true;
    QTest::newRow("session unknown, log-off") << 105 << false;
    QTest::newRow("session unknown, log-off and log-in") << 105 << true;
}

void TestServiceRequest::answerAfterTheLogOff() {
    QFETCH(int, code);
    QFETCH(bool, newSession);
    QSemaphore asked;
    QSemaphore answered;
    m_peer.follow([&, code](const ScriptedPeer::Request &) {
        asked.release();
        answered.acquire();
        return ScriptedPeer::json({{"code", code}}, {std::string("Authorization: ") + renewed});
    });
    const QSignalSpy lost(&SessionEvents::instance(), &SessionEvents::sessionLost);
    QVERIFY(post());
    QVERIFY(asked.tryAcquire(1, 10000));
    CLocalStore::instance().clearLoginInfo();
    if (newSession)
        logIn();
    answered.release();
    QTRY_COMPARE(m_ends, QList<JobOutcome>{JobOutcome::SessionGone});
    QVERIFY(m_results.isEmpty());
    QCOMPARE(storedToken(), newSession ? TestSession::token : "");
    QVERIFY2(lost.isEmpty(), "an earlier session's end is nobody's concern");
}

void TestServiceRequest::nothingIsSentAfterTheLogOff() {
    const int before = m_peer.connections();
    ServiceSession session(CLocalStore::instance().loginInfo());
    QVERIFY(session.isPresent());
    CLocalStore::instance().clearLoginInfo();
    QVERIFY(!session.isPresent());
    QCOMPARE(removeSite(session), unsigned(ApiInvalidArgument));
    QVERIFY(post());
    QTRY_COMPARE(m_ends, QList<JobOutcome>{JobOutcome::Delivered});
    QCOMPARE(m_results, QList<unsigned>{ApiInvalidArgument});
    QCOMPARE(m_peer.connections(), before);
}

void TestServiceRequest::endOfTheSessionCutsItsRequests_data() {
    QTest::addColumn<ScriptedPeer::Greeting>("greeting");
    QTest::addColumn<bool>("isFull");
    QTest::newRow("no answer") << ScriptedPeer::Greeting::Handshake << false;
    QTest::newRow("no handshake") << ScriptedPeer::Greeting::Silence << false;
    QTest::newRow("no connection") << ScriptedPeer::Greeting::Handshake << true;
}

void TestServiceRequest::endOfTheSessionCutsItsRequests() {
    QFETCH(ScriptedPeer::Greeting, greeting);
    QFETCH(bool, isFull);
    const FullPort full;
    ScriptedPeer peer;
    peer.greet(greeting);
    peer.answer({"", ScriptedPeer::End::Hold});
    logIn(isFull ? full.port() : peer.port());
    QVERIFY(post() && post());
    // Nothing of a session ends a login that is under way.
    unsigned other = ApiOk;
    auto *runner = NetJob::createRunner("test", NetTask::Turn::Beside);
    const RequestGroup login;
    const auto work = [&] {
        const RequestGroup::Scope scope(login);
        return CApiClient("127.0.0.1", peer.port()).loginServer("a", "b");
    };
    QVERIFY(NetJob::post(runner, this, work, [&](unsigned result) { other = result; }));
    QTest::qWait(300);
    QElapsedTimer clock;
    clock.start();
    ServiceSession::end();
    QTRY_COMPARE(m_ends, QList<JobOutcome>(2, JobOutcome::SessionGone));
    QVERIFY2(clock.elapsed() < 1000, "the end of the session was waited for");
    QCOMPARE(other, unsigned(ApiOk));
    login.cut();
    QTRY_COMPARE_WITH_TIMEOUT(other, unsigned(ApiTransportError), 1000);
}

void TestServiceRequest::lostSessionIsReportedOnce() {
    m_peer.answer(ScriptedPeer::json({{"code", 105}}));
    const QSignalSpy lost(&SessionEvents::instance(), &SessionEvents::sessionLost);
    QVERIFY(post() && post() && post());
    QTRY_COMPARE(m_ends, QList<JobOutcome>(3, JobOutcome::SessionGone));
    QCOMPARE(lost.size(), 1);
    QVERIFY(m_results.isEmpty());

    logIn();
    QVERIFY(post());
    QTRY_COMPARE(m_ends.size(), 4);
    QCOMPARE(lost.size(), 2);
}

void TestServiceRequest::changedServerKeyIsAskedAboutOnce_data() {
    QTest::addColumn<bool>("trusted");
    QTest::newRow("trusted") << true;
    QTest::newRow("refused") << false;
}

void TestServiceRequest::changedServerKeyIsAskedAboutOnce() {
    QFETCH(bool, trusted);
    SessionEvents &events = SessionEvents::instance();
    const QSignalSpy asked(&events, &SessionEvents::keyChanged);
    const QSignalSpy lost(&events, &SessionEvents::sessionLost);
    const std::string first = m_peer.keyFingerprint();
    CLocalStore::instance().setServerKey("here:1", first);
    ServerKeys::instance().trust("here:1", first);
    m_peer.answer(ScriptedPeer::json({{"code", 0}}));
    m_peer.renewKey();
    QVERIFY(post() && post() && post());
    QTRY_COMPARE(m_results, QList<unsigned>(3, ApiKeyChanged));
    QTRY_COMPARE(asked.size(), 1);
    QCOMPARE(asked[0][0].toString().toStdString(), m_peer.keyFingerprint());
    QVERIFY(events.isKeyInQuestion() && lost.isEmpty());
    QVERIFY(m_peer.takeRequests().empty());

    events.answerKeyQuestion(trusted);
    QVERIFY(!events.isKeyInQuestion());
    QVERIFY(post());
    QTRY_COMPARE(m_results.size(), 4);
    QCOMPARE(m_results[3], unsigned(trusted ? ApiOk : ApiKeyChanged));
    QCOMPARE(ServerKeys::instance().fingerprint("here:1"), trusted ? m_peer.keyFingerprint() : first);
    QCOMPARE(m_peer.takeRequests().size(), std::size_t(trusted ? 1 : 0));
    m_peer.renewKey();
    QVERIFY(post());
    QTRY_COMPARE(m_results.value(4), unsigned(ApiKeyChanged));
    QCoreApplication::processEvents();
    QCOMPARE(asked.size(), trusted ? 2 : 1);
    QCOMPARE(events.isKeyInQuestion(), trusted);
    CLocalStore::instance().clearLoginInfo();
    QVERIFY2(!events.isKeyInQuestion(), "the question was about a session that is over");
}

void TestServiceRequest::renewalsThatCrossed_data() {
    QTest::addColumn<QStringList>("ended");
    QTest::addColumn<QStringList>("carried"); ///< by the call that comes later
    QTest::newRow("good") << QStringList() << QStringList{"first"};
    QTest::newRow("the older one has ended") << QStringList{"first"} << QStringList{"first", "second"};
    QTest::newRow("all have ended") << QStringList{"first", "second"} << QStringList{"first", "second"};
}

/// Two requests carry the same token, both answers renew it, and that of the second comes first.
void TestServiceRequest::renewalsThatCrossed() {
    QFETCH(QStringList, ended);
    QFETCH(QStringList, carried);
    const QString tail = QStringLiteral("_token-0123456789");
    QStringList renewals{"second", "first"};
    m_peer.follow([&](const ScriptedPeer::Request &request) {
        const QString token = QString::fromStdString(request.header("authorization")).remove(tail);
        if (ended.contains(token))
            return ScriptedPeer::json({{"code", 105}});
        if (renewals.isEmpty())
            return ScriptedPeer::json({{"code", 0}});
        const std::string header = "Authorization: " + (renewals.takeFirst() + tail).toStdString();
        return ScriptedPeer::json({{"code", 0}}, {header});
    });
    const LoginInfo login = CLocalStore::instance().loginInfo();
    ServiceSession outer(login);
    const unsigned result = outer.call([&](CApiClient &client) {
        ServiceSession inner(login);
        const unsigned first = removeSite(inner);
        return first == ApiOk ? client.removeSite("SR2") : first;
    });
    QCOMPARE(result, unsigned(ApiOk));
    QCOMPARE(storedToken(), "first" + tail);
    m_peer.takeRequests();

    ServiceSession later(login);
    const bool isOver = ended.size() == 2;
    QCOMPARE(removeSite(later), unsigned(isOver ? ApiCode105 : ApiOk));
    QCOMPARE(later.isLost(), isOver);
    QStringList sent;
    for (const ScriptedPeer::Request &request : m_peer.takeRequests())
        sent << QString::fromStdString(request.header("authorization")).remove(tail);
    QCOMPARE(sent, carried);
    QCOMPARE(storedToken(), carried.last() + tail);
}

void TestServiceRequest::failureIsAResult() {
    m_peer.answer(ScriptedPeer::Reply{});
    const QSignalSpy lost(&SessionEvents::instance(), &SessionEvents::sessionLost);
    QVERIFY(post());
    QTRY_COMPARE(m_ends, QList<JobOutcome>{JobOutcome::Delivered});
    QCOMPARE(m_results, QList<unsigned>{ApiTransportError});
    m_peer.answer(ScriptedPeer::json({{"code", 108}}));
    QVERIFY(post());
    QTRY_COMPARE(m_results.value(1), unsigned(ApiCode108));
    QVERIFY(lost.isEmpty());
}

NVLDM_GUILESS_TEST(TestServiceRequest)
#include "tst_servicerequest.moc"
