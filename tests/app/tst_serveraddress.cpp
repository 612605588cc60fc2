#include "app/login/serveraddress.h"
#include "support/testmain.h"

#include <QHostInfo>
#include <QTest>

class TestServerAddress : public QObject {
    Q_OBJECT

private slots:
    void parse_data() {
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("expected"); // empty: refused
        const std::pair<const char *, const char *> rows[] = {{"192.168.1.5", "192.168.1.5|8079"},
                                                              {"192.168.1.5:443", "192.168.1.5|443"},
                                                              {"cameras.example", "cameras.example|8079"},
                                                              {"  10.0.0.1:1 ", "10.0.0.1|1"},
                                                              {"10.0.0.1:65535", "10.0.0.1|65535"}};
        for (const auto &[text, expected] : rows)
            QTest::newRow(text) << QString::fromLatin1(text) << QString::fromLatin1(expected);
        for (const char *text :
             {"10.0.0.1:65536", "10.0.0.1:0", "10.0.0.1:-1", "10.0.0.1:", "10.0.0.1:443x",
              "10.0.0.1:443/path", "10.0.0.1:443:80", "10.0.0.1:4294967739", "10.0.0.1:0x1BB",
              "https://10.0.0.1", "10.0.0.1/", "ten hosts", "::1", ":443", ":", "   ", ""})
            QTest::addRow("none: \"%s\"", text) << QString::fromLatin1(text) << QString();
        const QString longest(127, u'h');
        QTest::newRow("127 characters") << longest + ":443" << longest + "|443";
        QTest::newRow("128 characters") << longest + u'h' << QString();
        QTest::newRow("128 characters and a port") << longest + "h:443" << QString();
    }
    void parse() {
        QFETCH(QString, text);
        const std::optional<ServerAddress> server = ServerAddress::parse(text);
        QTEST(server ? server->host + u'|' + QString::number(server->port) : QString(), "expected");
    }

    void keyName() {
        for (const char *text : {"Cameras.Example", "cameras.example:8079"})
            QCOMPARE(ServerAddress::parse(text).value().keyName(), QStringLiteral("cameras.example:8079"));
    }

    void isIpAddress() {
        for (const char *host : {"0.0.0.0", "10.0.0.1", "255.255.255.255", "192.168.001.01"})
            QVERIFY2(ServerAddress{host}.isIpAddress(), host);
        for (const char *host :
             {"256.0.0.1", "10.0.0", "10.0.0.1.2", "a.b.c.d", "10.0.0.1.example", "localhost"})
            QVERIFY2(!ServerAddress{host}.isIpAddress(), host);
    }

    void nameIsLookedUp() {
        QCOMPARE(ServerAddress{"10.1.2.3"}.resolved(), QStringLiteral("10.1.2.3"));
        QCOMPARE(ServerAddress{"no-such-host.invalid"}.resolved(), QString());
        // A bare file system has no table of hosts, and then nobody knows this name.
        if (QHostInfo::fromName("localhost").error() != QHostInfo::NoError)
            QSKIP("localhost has no address on this machine");
        QCOMPARE(ServerAddress{"localhost"}.resolved(), QStringLiteral("127.0.0.1"));
    }
};

NVLDM_GUILESS_TEST(TestServerAddress)
#include "tst_serveraddress.moc"
