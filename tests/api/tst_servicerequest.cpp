#include "isolatedroot.h"
#include "logcapture.h"
#include "scriptedpeer.h"
#include "serverkeys.h"
#include "servicerequest.h"
#include "testsession.h"

#include <QSemaphore>
#include <QSignalSpy>
#include <QTest>

namespace {

constexpr const char *renewed = "renewed_token-0123456789";

unsigned removeSite(ServiceSession &session) {
    return session.call([](CApiClient &client) { return client.removeSite("SR1"); });
}

QString storedToken() {
    const std::string cipher = CLocalStore::instance().loginInfo().token.toStdString();
    return QString::fromStdString(Ciphers::openSecret(cipher).value_or(""));
}

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
    void lostSessionIsReportedOnce();
    void changedServerKeyIsAskedAboutOnce_data();
    void changedServerKeyIsAskedAboutOnce();
    void renewalsThatCrossed_data();
    void renewalsThatCrossed();
    void failureIsAResult();

private:
    void logIn() {
        const std::string cipher = Ciphers::sealSecret(TestSession::token).value_or("");
        CLocalStore::instance().setLoginInfo("127.0.0.1", m_peer.port(), TestSession::account,
                                             QByteArray::fromStdString(cipher));
    }
    bool post() {
        return ServiceRequest::post(
            NetJob::createRunner("test"), this, removeSite, [this](unsigned result) { m_results << result; },
            [this](JobEnd end) { m_ends << end; });
    }

    IsolatedRoot m_root;
    ScriptedPeer m_peer;
    std::unique_ptr<LogCapture> m_log;
    QList<unsigned> m_results;
    QList<JobEnd> m_ends;
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
    QTRY_COMPARE(m_ends, QList<JobEnd>{JobEnd::Delivered});
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
    QTRY_COMPARE(m_ends, QList<JobEnd>{JobEnd::SessionGone});
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
    QTRY_COMPARE(m_ends, QList<JobEnd>{JobEnd::Delivered});
    QCOMPARE(m_results, QList<unsigned>{ApiInvalidArgument});
    QCOMPARE(m_peer.connections(), before);
}

void TestServiceRequest::lostSessionIsReportedOnce() {
    m_peer.answer(ScriptedPeer::json({{"code", 105}}));
    const QSignalSpy lost(&SessionEvents::instance(), &SessionEvents::sessionLost);
    QVERIFY(post() && post() && post());
    QTRY_COMPARE(m_ends, QList<JobEnd>(3, JobEnd::SessionGone));
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
    QTRY_COMPARE(m_ends, QList<JobEnd>{JobEnd::Delivered});
    QCOMPARE(m_results, QList<unsigned>{ApiTransportError});
    m_peer.answer(ScriptedPeer::json({{"code", 108}}));
    QVERIFY(post());
    QTRY_COMPARE(m_results.value(1), unsigned(ApiCode108));
    QVERIFY(lost.isEmpty());
}

QTEST_GUILESS_MAIN(TestServiceRequest)
#include "tst_servicerequest.moc"
