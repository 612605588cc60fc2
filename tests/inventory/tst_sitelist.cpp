#include "devices/sites/sitelist.h"
#include "support/testmain.h"

#include <QTest>

#include <nlohmann/json.hpp>

class TestSiteList : public QObject {
    Q_OBJECT

private slots:
    void parse_data() {
        QTest::addColumn<QString>("records"); // words "id<parent"; "root" is the hierarchy's root
        QTest::addColumn<QString>("expected");
        QTest::newRow("children before their parents") << "c<b b<a a<root"
                                                       << "a<root b<a c<b";
        QTest::newRow("the service's order among brothers") << "z<root a<root m<root"
                                                            << "z<root a<root m<root";
        QTest::newRow("unknown parent") << "a<gone b<a"
                                        << "a<root b<a";
        QTest::newRow("no parent") << "a< b<"
                                   << "a<root b<root";
        QTest::newRow("its own parent") << "a<a b<a"
                                        << "a<root b<a";
        QTest::newRow("a cycle with a branch") << "a<c b<a c<b d<c e<root"
                                               << "e<root a<root b<a c<b d<c";
        QTest::newRow("two cycles") << "a<b b<a c<d d<c"
                                    << "a<root b<a c<root d<c";
        QTest::newRow("the first of duplicates") << "a<root b<a a<b"
                                                 << "a<root b<a";
        QTest::newRow("fixed nodes are no sites") << "root<a DO000000000000<a a<root"
                                                  << "a<root";
    }
    void parse() {
        QFETCH(QString, records);
        JSON json = JSON::array();
        for (const QString &word : records.replace("root", Sites::rootId).split(u' '))
            json.push_back({{"siteid", word.section(u'<', 0, 0).toStdString()},
                            {"parentid", word.section(u'<', 1).toStdString()}});
        QStringList told;
        for (const Sites::Site &site : Sites::parse(json))
            told.append(site.id + u'<' + site.parentId);
        QTEST(told.join(u' ').replace(Sites::rootId, "root"), "expected");
    }

    void brokenRecordsAreLeftOut() {
        const JSON records = {7,
                              nullptr,
                              "a",
                              JSON::array(),
                              JSON::object(),
                              {{"siteid", 5}},
                              {{"siteid", ""}},
                              {{"siteid", "a"}, {"parentid", {1}}, {"sitename", false}}};
        const Sites::List sites = Sites::parse(records);
        QCOMPARE(sites.size(), 1u);
        QCOMPARE(sites[0].id, QString("a"));
        QCOMPARE(sites[0].parentId, Sites::rootId);
        QCOMPARE(sites[0].name, QString());
        QVERIFY(Sites::parse({{"siteid", "a"}}).empty());
    }

    void deepChainIsCutIntoSiteTrees() {
        constexpr std::size_t depth = 28000;
        JSON records = JSON::array();
        for (std::size_t i = depth; i > 0; --i)
            records.push_back(
                {{"siteid", "s" + std::to_string(i)}, {"parentid", "s" + std::to_string(i - 1)}});
        const Sites::List sites = Sites::parse(records);
        QCOMPARE(sites.size(), depth);
        QHash<QString, int> levels{{Sites::rootId, 0}};
        int top = 0;
        for (const Sites::Site &site : sites) {
            QVERIFY(levels.contains(site.parentId));
            levels[site.id] = levels[site.parentId] + 1;
            QVERIFY(levels[site.id] <= 64);
            top += site.parentId == Sites::rootId ? 1 : 0;
        }
        QCOMPARE(top, int(depth + 63) / 64);
    }
};

NVLDM_APPLESS_TEST(TestSiteList)
#include "tst_sitelist.moc"
