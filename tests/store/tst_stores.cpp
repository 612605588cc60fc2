#include "platform/crypto/ciphers.h"
#include "platform/files/nvldmstore.h"
#include "store/clientstore.h"
#include "store/configstore.h"
#include "store/lastfolder.h"
#include "store/localstore.h"
#include "store/serverkeys.h"
#include "store/storewriter.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"

#include <QDir>
#include <QTest>

#include <nlohmann/json.hpp>

namespace {

constexpr const char *plainPassword = "Tr0ub4dor-plain";

QString openedToken(const QByteArray &cipher) {
    return QString::fromStdString(Ciphers::openSecret(cipher.toStdString()).value_or(""));
}

} // namespace

class TestStores : public QObject {
    Q_OBJECT

private slots:
    void flags();
    void baseStore();
    void storedAccount_data();
    void storedAccount();
    void unreadableAccountIsEmpty_data();
    void unreadableAccountIsEmpty();
    void serverList();
    void unreadableServerList();
    void serverKeys();
    void passwordsOutliveABrokenKey();
    void removedFileIsBegunAnew();
    void servicePort_data();
    void servicePort();
    void sessionTokens();
    void renewalOfAnEndedSession();
    void defaultFilePath();
    void dialogsBeginInTheLastFolder();
    void noPlainPasswordInAnyFile();

private:
    QByteArray path(const QString &name) const { return m_root.filePath(name).toUtf8(); }

    IsolatedRoot m_root;
};

void TestStores::flags() {
    CClientStore &store = CClientStore::instance();
    QVERIFY(!store.isThisComputer() && !store.isLoginRememberMe());
    QVERIFY(store.setLoginRememberMe(true));
    QVERIFY(store.isLoginRememberMe() && !store.isThisComputer());
    CBaseStore sameTable(m_root.filePath("nvldmgr.sdb"), "appMainT");
    QCOMPARE(sameTable.query("kIsLoginRememberMe"), "YES");
    QVERIFY(store.setLoginRememberMe(false));
    QCOMPARE(sameTable.query("kIsLoginRememberMe"), "NO");
    QVERIFY(sameTable.replace("kIsThisComputer", "yes"));
    QVERIFY2(!store.isThisComputer(), "only the given word is a yes");
    QVERIFY(store.setThisComputer(true) && store.isThisComputer());
}

void TestStores::baseStore() {
    CBaseStore store(m_root.filePath("base.sdb"), "appMainT");
    const QString text = "it's \"so\"\n東京'";
    QVERIFY(store.replace("key", text));
    QCOMPARE(store.query("key"), text);
    QVERIFY(!store.replace("", "value"));
    QCOMPARE(store.query(""), QString());
    QCOMPARE(store.query("other"), QString());

    const LogCapture log;
    CBaseStore foreign(m_root.filePath("foreign.sdb"), "svcMainT", CBaseStore::Access::ReadOnly);
    QVERIFY(!foreign.replace("key", "value"));
    QCOMPARE(foreign.query("key"), QString());
    QVERIFY(!QFile::exists(m_root.filePath("foreign.sdb")));
}

void TestStores::storedAccount_data() {
    QTest::addColumn<QString>("password");
    QTest::newRow("remembered") << plainPassword;
    QTest::newRow("not remembered") << "";
    QTest::newRow("any character") << "p'\"\\ä€\n";
}

void TestStores::storedAccount() {
    QFETCH(QString, password);
    CClientStore &store = CClientStore::instance();
    const AccountInfo here{"", "me@here.example", password};
    const AccountInfo there{"10.0.0.1:9443", "me@there.example", password + password};
    QVERIFY(store.setThisComputerAccount(here) && store.setRemoteComputerAccount(there));
    QCOMPARE(store.thisComputerAccount().email, here.email);
    QCOMPARE(store.thisComputerAccount().password, here.password);
    QCOMPARE(store.remoteComputerAccount().server, there.server);
    QCOMPARE(store.remoteComputerAccount().email, there.email);
    QCOMPARE(store.remoteComputerAccount().password, there.password);
    QVERIFY(store.setLoginRememberMe(true));
    QCOMPARE(store.remoteComputerAccount().password, there.password);
    QVERIFY(store.setLoginRememberMe(false));
    QCOMPARE(store.thisComputerAccount().password + store.remoteComputerAccount().password, QString());
    QCOMPARE(store.thisComputerAccount().email, here.email);
    QCOMPARE(store.remoteComputerAccount().server, there.server);
}

void TestStores::unreadableAccountIsEmpty_data() {
    QTest::addColumn<QString>("text");
    QTest::newRow("no JSON") << "{";
    QTest::newRow("no object") << "[1]";
    QTest::newRow("wrong types") << R"({"server":1,"email":null,"pass":["P1:"]})";
    QTest::newRow("plain password") << R"({"pass":"secret"})";
}

void TestStores::unreadableAccountIsEmpty() {
    QFETCH(QString, text);
    CBaseStore sameTable(m_root.filePath("nvldmgr.sdb"), "appMainT");
    QVERIFY(sameTable.replace("kThisComputerAccountInfo", text));
    const AccountInfo account = CClientStore::instance().thisComputerAccount();
    QVERIFY(account.server.isEmpty() && account.email.isEmpty() && account.password.isEmpty());
}

void TestStores::serverList() {
    CClientStore &store = CClientStore::instance();
    JSON loaded;
    QCOMPARE(store.loadServerList(loaded), 0u);
    QCOMPARE(loaded.dump(), "[]");

    JSON servers = {{{"id", "SVR1"},
                     {"svrname", "It's \"one\""},
                     {"info", "10.0.0.1:9443"},
                     {"acc", "a@x"},
                     {"pass", plainPassword},
                     {"remember", "YES"}},
                    {{"id", "SVR2"},
                     {"svrname", "Zwei €"},
                     {"info", "nvr.example"},
                     {"acc", "b@x"},
                     {"pass", plainPassword},
                     {"remember", "NO"}},
                    {{"id", "SVR3"}, {"svrname", 7}, {"remember", true}, {"pass", plainPassword}}};
    QVERIFY(store.saveServerList(servers));
    QCOMPARE(store.loadServerList(loaded), 0u);
    servers[1]["pass"] = "";
    servers[2] = {{"id", "SVR3"}, {"svrname", ""}, {"info", ""}, {"acc", ""}, {"pass", ""}, {"remember", ""}};
    QCOMPARE(loaded.dump(), servers.dump());

    const LogCapture log;
    const JSON twice = {{{"id", "SVR1"}}, {{"id", "SVR1"}}};
    QVERIFY(!store.saveServerList(twice));
    QCOMPARE(store.loadServerList(loaded), 0u);
    QCOMPARE(loaded.dump(), servers.dump());

    QVERIFY(store.saveServerList(JSON::array()));
    QCOMPARE(store.loadServerList(loaded), 0u);
    QCOMPARE(loaded.dump(), "[]");
}

void TestStores::unreadableServerList() {
    CClientStore &store = CClientStore::instance();
    const LogCapture log;
    JSON loaded;
    QCOMPARE(nvldmstore::createDBTable(path("ndclisvrs.sdb").constData(), "taken",
                                       "id TEXT PRIMARY KEY, "
                                       "svrname TEXT, info TEXT, acc TEXT, pass TEXT, remember TEXT"),
             0);
    QCOMPARE(nvldmstore::replaceTable(path("ndclisvrs.sdb").constData(), "svrsMainT", "taken"), 0);
    QCOMPARE(store.loadServerList(loaded), 1002u);
    QVERIFY(loaded.is_array() && loaded.empty());
}

void TestStores::serverKeys() {
    const QString file = m_root.filePath("keys.sdb");
    const QString odd = QStringLiteral("it's:8079");
    const std::string first(64, 'a');
    const std::string second(64, 'b');
    const QDateTime before = QDateTime::currentDateTime();
    {
        ServerKeys keys(file);
        QVERIFY(!keys.find(odd) && keys.fingerprint(odd).empty());
        QVERIFY(keys.keep(odd, first) && keys.keep(ServerKeys::thisComputer, second));
        QVERIFY(!keys.keep(odd, first));
        QVERIFY2(!keys.keep(odd, second) && keys.fingerprint(odd) == first, "only trust replaces a key");
        StoreWriter::flush();
    }
    ServerKeys again(file);
    QCOMPARE(again.fingerprint(odd), first);
    QCOMPARE(again.fingerprint(ServerKeys::thisComputer), second);
    const ServerKey kept = again.find(odd).value();
    QVERIFY(kept.firstSeen.msecsTo(kept.lastSeen) >= 0 && before.msecsTo(kept.firstSeen) >= 0);
    again.trust(odd, second);
    again.forget(ServerKeys::thisComputer);
    StoreWriter::flush();
    const ServerKeys last(file);
    QCOMPARE(last.fingerprint(odd), second);
    QVERIFY(!last.find(ServerKeys::thisComputer));
    QCOMPARE(ServerKeys::readable("0123abcd4567"), "0123 ABCD 4567");
}

void TestStores::passwordsOutliveABrokenKey() {
    CClientStore &store = CClientStore::instance();
    const LogCapture log;
    const JSON servers = {{{"id", "SVR1"}, {"pass", plainPassword}, {"remember", "YES"}}};
    QVERIFY(store.saveServerList(servers));
    QVERIFY(m_root.write("nvlcrypto.key", "no key"));
    JSON loaded;
    QCOMPARE(store.loadServerList(loaded), 0u);
    QCOMPARE(textMember(loaded.at(0), "pass"), "");
    loaded[0]["svrname"] = "Renamed";
    QVERIFY(store.saveServerList(loaded));
    QVERIFY2(!store.saveServerList(servers), "a password that cannot be ciphered");
    QVERIFY(QFile::remove(m_root.filePath("nvlcrypto.key")));
    QCOMPARE(store.loadServerList(loaded), 0u);
    QCOMPARE(textMember(loaded.at(0), "svrname"), "Renamed");
    QCOMPARE(textMember(loaded.at(0), "pass"), plainPassword);
    QVERIFY(!loaded.at(0).contains("sealed"));
    loaded[0]["remember"] = "NO";
    QVERIFY(store.saveServerList(loaded));
}

void TestStores::removedFileIsBegunAnew() {
    const LogCapture log;
    CClientStore &store = CClientStore::instance();
    QVERIFY(store.setLoginRememberMe(true));
    for (const char *name : {"nvldmgr.sdb", "ndclisvrs.sdb"}) {
        for (const char *suffix : {"", "-wal", "-shm"})
            QFile::remove(m_root.filePath(QLatin1String(name) + suffix));
    }
    QVERIFY(store.setLoginRememberMe(true));
    QVERIFY(store.isLoginRememberMe());
    QVERIFY(store.saveServerList({{{"id", "SVR1"}}}));
    JSON loaded;
    QCOMPARE(store.loadServerList(loaded), 0u);
    QCOMPARE(loaded.size(), std::size_t(1));
    QVERIFY(store.saveServerList(JSON::array()));
    QVERIFY(store.setLoginRememberMe(false));
}

void TestStores::servicePort_data() {
    QTest::addColumn<QString>("value");
    QTest::addColumn<quint32>("port");
    QTest::newRow("usual") << R"({"port":9443})" << 9443u;
    QTest::newRow("largest") << R"({"port":65535,"more":1})" << 65535u;
    QTest::newRow("too large") << R"({"port":65536})" << 0u;
    QTest::newRow("beyond 32 bits") << R"({"port":4294976739})" << 0u;
    QTest::newRow("beyond 64 bits") << R"({"port":18446744073709551615})" << 0u;
    QTest::newRow("zero") << R"({"port":0})" << 0u;
    QTest::newRow("negative") << R"({"port":-1})" << 0u;
    QTest::newRow("fraction") << R"({"port":9443.5})" << 0u;
    QTest::newRow("text") << R"({"port":"9443"})" << 0u;
    QTest::newRow("no port") << "{}" << 0u;
    QTest::newRow("no object") << "9443" << 0u;
    QTest::newRow("no JSON") << "port" << 0u;
    QTest::newRow("empty") << "" << 0u;
}

void TestStores::servicePort() {
    QFETCH(QString, value);
    QFETCH(quint32, port);
    if (!QFile::exists(m_root.filePath("nvldmsvc.sdb"))) {
        const LogCapture log;
        QCOMPARE(CConfigStore().serverPort(), 0u);
        QVERIFY2(!QFile::exists(m_root.filePath("nvldmsvc.sdb")), "the service's file is not the client's");
    }
    CBaseStore service(m_root.filePath("nvldmsvc.sdb"), "svcMainT");
    QVERIFY(service.replace("kSvcAndTrayServerPort", value));
    QCOMPARE(CConfigStore().serverPort(), port);
}

void TestStores::sessionTokens() {
    CLocalStore &store = CLocalStore::instance();
    const LogCapture log;
    const quint64 generation = store.loginInfo().generation;
    store.setAccess("raw-token-of-the-login");
    const QByteArray cipher = store.access();
    QVERIFY(cipher.startsWith("P1:"));
    store.setLoginInfo("10.0.0.1", 9443, "admin", cipher);
    const LoginInfo login = store.loginInfo();
    QVERIFY(login.isComplete());
    QVERIFY(login.generation > generation);
    QCOMPARE(login.port, 9443u);
    QCOMPARE(openedToken(login.token), "raw-token-of-the-login");

    store.renewAccess("renewed-token", login.token, login.generation);
    QCOMPARE(openedToken(store.loginInfo().token), "renewed-token");
    QCOMPARE(openedToken(store.access()), "renewed-token");
    QCOMPARE(store.loginInfo().generation, login.generation);
    store.renewAccess("", login.token, login.generation);
    QCOMPARE(openedToken(store.loginInfo().token), "renewed-token");
}

void TestStores::renewalOfAnEndedSession() {
    CLocalStore &store = CLocalStore::instance();
    const LogCapture log;
    store.setLoginInfo("10.0.0.1", 9443, "admin", "P1:first");
    const quint64 first = store.loginInfo().generation;
    store.clearLoginInfo();
    store.renewAccess("too-late", "P1:first", first);
    QVERIFY(store.access().isEmpty() && !store.loginInfo().isComplete());

    store.setLoginInfo("10.0.0.2", 9443, "admin", "P1:second");
    store.renewAccess("too-late", "P1:first", first);
    QCOMPARE(store.loginInfo().token, "P1:second");
    QCOMPARE(store.access(), "P1:second");
    store.clearLoginInfo();
}

void TestStores::defaultFilePath() {
    CLocalStore &store = CLocalStore::instance();
    QCOMPARE(store.defaultFilePath(), QString());
    QVERIFY(store.setDefaultFilePath("/home/it's/Zürich"));
    QCOMPARE(store.defaultFilePath(), "/home/it's/Zürich");
}

void TestStores::dialogsBeginInTheLastFolder() {
    CLocalStore &store = CLocalStore::instance();
    const auto load = [] {
        LastFolder::load();
        StoreWriter::flush();
    };
    QCOMPARE(LastFolder::path(), QDir::homePath());
    QVERIFY(store.setDefaultFilePath({}));
#ifdef Q_OS_LINUX
    qputenv("HOME", m_root.path().toUtf8());
    qputenv("XDG_CONFIG_HOME", m_root.path().toUtf8());
    QVERIFY(m_root.write("user-dirs.dirs", "XDG_DOCUMENTS_DIR=\"$HOME/Papers\"\n"));
    load();
    QCOMPARE(LastFolder::file("a.csv"), m_root.filePath("a.csv"));
    QVERIFY(QDir(m_root.path()).mkdir("Papers"));
    load();
    QCOMPARE(LastFolder::file("a.csv"), m_root.filePath("Papers/a.csv"));
#endif
    QVERIFY(store.setDefaultFilePath("/srv/it's"));
    load();
    QCOMPARE(LastFolder::path(), "/srv/it's");
    // What is chosen while the store is read counts.
    LastFolder::load();
    const QString latest = m_root.filePath("new");
    LastFolder::rememberFile(latest + "/a.csv");
    QCOMPARE(LastFolder::path(), latest);
    StoreWriter::flush();
    QCOMPARE(LastFolder::path(), latest);
    QCOMPARE(store.defaultFilePath(), latest);
}

void TestStores::noPlainPasswordInAnyFile() {
    CClientStore &store = CClientStore::instance();
    QVERIFY(store.setThisComputerAccount({"", "marked@here.example", plainPassword}));
    const QByteArray columns =
        "id TEXT PRIMARY KEY, svrname TEXT, info TEXT, acc TEXT, pass TEXT, remember TEXT";
    QCOMPARE(nvldmstore::createDBTable(path("ndclisvrs.sdb").constData(), "svrsMainT", columns.constData()),
             0);
    QVERIFY(store.saveServerList(
        {{{"id", "S"}, {"acc", "marked@there.example"}, {"pass", plainPassword}, {"remember", "YES"}}}));
    {
        const LogCapture log;
        CLocalStore::instance().setAccess("raw-token-of-a-session");
    }
    QByteArray bytes;
    for (const QString &name : QDir(m_root.path()).entryList(QDir::Files))
        bytes += m_root.read(name);
    QVERIFY2(bytes.contains("marked@here.example") && bytes.contains("marked@there.example"),
             "the files that were written are the ones that were read");
    QVERIFY(!bytes.contains(plainPassword));
    QVERIFY(!bytes.contains("raw-token-of-a-session"));
}

NVLDM_GUILESS_TEST(TestStores)
#include "tst_stores.moc"
