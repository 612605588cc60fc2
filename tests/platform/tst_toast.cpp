#include "platform/toast/toast.h"
#include "support/logcapture.h"
#include "support/notificationservice.h"

#include <QScopeGuard>
#include <QTest>

namespace {

/// Writes down what it is told, and its end.
class Recorder : public ToastHandler {
public:
    Recorder(QStringList &events, const QString &name) : m_events(events), m_name(name) {}
    ~Recorder() override { add("deleted"); }
    void toastActivated() override { add("activated"); }
    void toastActivated(int actionIndex) override { add("action" + QString::number(actionIndex)); }
    void toastDismissed() override { add("dismissed"); }
    void toastFailed() override { add("failed"); }

private:
    void add(const QString &event) { m_events += m_name + ' ' + event; }

    QStringList &m_events;
    QString m_name;
};

} // namespace

class TestToast : public QObject {
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void textFollowsCapabilities_data();
    void textFollowsCapabilities();
    void textIsOneBoundedLine();
    void notifyTellsTheProgram();
    void handlerIsToldOnce_data();
    void handlerIsToldOnce();
    void sameSubjectReplaces();
    void serviceComesLater();
    void serviceDies();
    void refusedToastFails();
    void pendingIsBounded();
    void noSessionBus_data();
    void noSessionBus();

private:
    bool start() { return m_presenter->initialize("Norvell Device Manager/Device Manager", "id"); }
    void show(const QString &text, const QString &subject = {});
    /// Shows a toast and waits for the service to have it. All that went over the bus before the answer to
    /// one toast has been taken in when the service has the next.
    bool isShown(const QString &text, const QString &subject = {});
    const NotificationService::Notification &last() const { return m_service->notifications.back(); }

    QStringList m_events;
    std::unique_ptr<NotificationService> m_service;
    std::unique_ptr<ToastPresenter> m_presenter;
    int m_incompatible = 0;
    int m_launchFailed = 0;
};

void TestToast::init() {
    m_events.clear();
    m_service = std::make_unique<NotificationService>();
    m_presenter = ToastPresenter::create();
    m_incompatible = m_launchFailed = 0;
    connect(m_presenter.get(), &ToastPresenter::incompatible, this, [this] { ++m_incompatible; });
    connect(m_presenter.get(), &ToastPresenter::launchFailed, this, [this] { ++m_launchFailed; });
}

void TestToast::cleanup() {
    m_presenter.reset();
    m_service.reset();
}

void TestToast::show(const QString &text, const QString &subject) {
    m_presenter->showToast({text, {"Open", "Dismiss"}, subject}, std::make_unique<Recorder>(m_events, text));
}

bool TestToast::isShown(const QString &text, const QString &subject) {
    const std::size_t before = m_service->notifications.size();
    show(text, subject);
    return QTest::qWaitFor([&] { return m_service->notifications.size() > before; });
}

void TestToast::textFollowsCapabilities_data() {
    QTest::addColumn<QStringList>("capabilities");
    QTest::addColumn<QString>("summary");
    QTest::addColumn<QString>("body");
    QTest::addColumn<qsizetype>("actions");
    const QString name = "Device Manager";
    QTest::newRow("markup") << QStringList{"actions", "body", "body-markup"} << name << "a &lt;b&gt; &amp; c"
                            << qsizetype(6);
    QTest::newRow("plain body") << QStringList{"body"} << name << "a <b> & c" << qsizetype(0);
    QTest::newRow("no body") << QStringList{"body-markup"} << "a <b> & c"
                             << "" << qsizetype(0);
}

void TestToast::textFollowsCapabilities() {
    QFETCH(QStringList, capabilities);
    m_service->capabilities = capabilities;
    QVERIFY(m_service->appear() && start() && isShown("a <b> & c"));
    QCOMPARE(m_service->calls, QStringList({"GetCapabilities", "Notify"}));
    QTEST(last().summary, "summary");
    QTEST(last().body, "body");
    QTEST(last().actions.size(), "actions");
}

void TestToast::textIsOneBoundedLine() {
    m_service->capabilities = {};
    QVERIFY(m_service->appear() && start());
    QVERIFY(isShown(QString("two\nlines\x1b\u0085") + QChar(0)));
    QCOMPARE(last().summary, QString("two lines "));
    QVERIFY(isShown(QString(298, 'x') + "\U0001F4F7\U0001F4F7"));
    QCOMPARE(last().summary, QString(298, 'x') + QChar(0x2026));
    QVERIFY(isShown(QString(300, 'x')));
    QCOMPARE(last().summary, QString(300, 'x'));
}

void TestToast::notifyTellsTheProgram() {
    QVERIFY(m_service->appear() && start() && isShown("text"));
    QCOMPARE(last().applicationName + '/' + last().icon, "Device Manager/norvell-device-manager");
    QCOMPARE(last().replaced, 0u);
    QCOMPARE(last().timeout, -1);
    QCOMPARE(last().actions, QStringList({"default", "Open", "0", "Open", "1", "Dismiss"}));
    QCOMPARE(last().hints, QVariantMap({{"desktop-entry", "norvell-device-manager"},
                                        {"urgency", QVariant::fromValue(uchar(1))}}));
}

void TestToast::handlerIsToldOnce_data() {
    QTest::addColumn<QString>("key");
    QTest::addColumn<QString>("event");
    QTest::newRow("body") << "default"
                          << "t activated";
    QTest::newRow("first button") << "0"
                                  << "t action0";
    QTest::newRow("second button") << "1"
                                   << "t action1";
    QTest::newRow("no such button") << "2"
                                    << "t dismissed";
    QTest::newRow("no button") << "settings"
                               << "t dismissed";
}

void TestToast::handlerIsToldOnce() {
    QFETCH(QString, key);
    QFETCH(QString, event);
    QVERIFY(m_service->appear() && start() && isShown("t"));
    m_service->invokeAction(last().id + 1, key);
    m_service->closeNotification(last().id + 1, 2);
    m_service->invokeAction(last().id, key);
    m_service->invokeAction(last().id, key);
    m_service->closeNotification(last().id, 2);
    m_service->closeNotification(last().id, 2);
    QVERIFY(isShown("next") && isShown("last"));
    QCOMPARE(m_events, QStringList({event, "t deleted"}));
}

void TestToast::sameSubjectReplaces() {
    QVERIFY(m_service->appear() && start());
    QVERIFY(isShown("a", "1") && isShown("b", "2"));
    // The second one starts while the number of the first is not known yet.
    show("c", "3");
    show("d", "3");
    QTRY_COMPARE(m_service->notifications.size(), 4u);
    QVERIFY(isShown("e", "1") && isShown("f") && isShown("g"));
    QList<uint> replaced;
    for (const auto &notification : m_service->notifications)
        replaced += notification.replaced;
    QCOMPARE(replaced, QList<uint>({0, 0, 0, 3, 1, 0, 0}));
    QCOMPARE(m_events, QStringList({"c dismissed", "c deleted", "a dismissed", "a deleted"}));
    m_service->closeNotification(1, 2);
    QTRY_VERIFY(m_events.contains("e deleted"));
    QVERIFY(isShown("h", "1"));
    QCOMPARE(last().replaced, 0u);
}

void TestToast::serviceComesLater() {
    QVERIFY(start());
    show("early");
    QTRY_COMPARE(m_launchFailed, 1);
    show("still early");
    QTRY_COMPARE(m_launchFailed, 2);
    QCOMPARE(m_incompatible, 1);
    QCOMPARE(m_events, QStringList({"early deleted", "still early deleted"}));
    QVERIFY(m_service->appear());
    QTRY_COMPARE(m_service->calls, QStringList("GetCapabilities"));
    QVERIFY(isShown("now"));
    QCOMPARE(m_launchFailed, 2);
}

void TestToast::serviceDies() {
    QVERIFY(m_service->appear() && start() && isShown("a", "1"));
    m_service->vanish();
    QTRY_COMPARE(m_events, QStringList({"a failed", "a deleted"}));
    show("b");
    QTRY_COMPARE(m_launchFailed, 1);
    // Another service took over, with toasts and abilities of its own.
    m_service->capabilities = {};
    QVERIFY(m_service->appear() && isShown("c", "1"));
    QCOMPARE(last().replaced, 0u);
    QCOMPARE(last().summary, "c");
    QCOMPARE(m_launchFailed, 1);
    QCOMPARE(m_incompatible, 0);
}

void TestToast::refusedToastFails() {
    m_service->failing = "Notify";
    QVERIFY(m_service->appear() && start() && isShown("a"));
    QTRY_COMPARE(m_launchFailed, 1);
    QCOMPARE(m_events, QStringList("a deleted"));
    QCOMPARE(m_incompatible, 0);
}

void TestToast::pendingIsBounded() {
    QVERIFY(start());
    for (int i = 0; i < 65; ++i)
        show("a");
    QCOMPARE(m_launchFailed, 1);
    QTRY_COMPARE(m_launchFailed, 65);
}

void TestToast::noSessionBus_data() {
    QTest::addColumn<QByteArray>("address");
    QTest::newRow("none") << QByteArray();
    QTest::newRow("gone") << QByteArray("unix:path=/nonexistent/bus");
    QTest::newRow("nonsense") << QByteArray("nonsense");
}

void TestToast::noSessionBus() {
    QFETCH(QByteArray, address);
    const QByteArray before = qgetenv("DBUS_SESSION_BUS_ADDRESS");
    const auto restore = qScopeGuard([&] { qputenv("DBUS_SESSION_BUS_ADDRESS", before); });
    address.isEmpty() ? qunsetenv("DBUS_SESSION_BUS_ADDRESS") : qputenv("DBUS_SESSION_BUS_ADDRESS", address);
    const LogCapture log;
    QVERIFY(!start());
    show("a");
    QCOMPARE(m_launchFailed, 1);
    QCOMPARE(log.lines(), QStringList());
}

QTEST_GUILESS_MAIN(TestToast)
#include "tst_toast.moc"
