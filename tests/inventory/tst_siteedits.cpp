#include "devices/sites/siteedits.h"
#include "devices/sites/sitemembership.h"
#include "support/testmain.h"

#include <QTest>

#include <nlohmann/json.hpp>

using SiteMembership::Outcome;

namespace {

/// Records from words "id<parent", named like their ids; "root" is the hierarchy's root.
Sites::List sites(const QString &words, const JSON &members = JSON::object()) {
    JSON records = JSON::array();
    for (const QString &word : words.split(u' ', Qt::SkipEmptyParts)) {
        const QString parent = word.section(u'<', 1);
        JSON record = {{"siteid", word.section(u'<', 0, 0).toStdString()},
                       {"parentid", (parent == "root" ? Sites::rootId : parent).toStdString()},
                       {"sitename", word.section(u'<', 0, 0).toStdString()}};
        record.update(members);
        records.push_back(record);
    }
    return Sites::parse(records);
}

/// The same words back, with "=name" where a name is not the id.
QString told(const Sites::List &list) {
    QStringList words;
    for (const Sites::Site &site : list)
        words.append(site.id + u'<' + (site.parentId == Sites::rootId ? "root" : site.parentId) +
                     (site.name == site.id ? QString() : u'=' + site.name));
    return words.join(u' ');
}

SiteEdits reading(const QString &words) {
    SiteEdits edits;
    edits.takeReading(sites(words));
    return edits;
}

/// Edits from words: "a=name" renames, "a<b" moves, "-a" deletes, "+a" adds SR1, SR2, ... below a.
QStringList edit(SiteEdits &edits, const QString &words) {
    QStringList problems;
    for (const QString &word : words.split(u' ', Qt::SkipEmptyParts)) {
        const auto parent = [](const QString &id) { return id == "root" ? Sites::rootId : id; };
        if (word.startsWith(u'-'))
            edits.remove(word.mid(1));
        else if (word.startsWith(u'+'))
            problems.append(edits.add(parent(word.mid(1)), 1).isEmpty() ? "no room" : QString());
        else if (word.contains(u'='))
            problems.append(edits.rename(word.section(u'=', 0, 0), word.section(u'=', 1)));
        else
            problems.append(edits.move(word.section(u'<', 0, 0), parent(word.section(u'<', 1))));
    }
    problems.removeAll(QString());
    return problems;
}

/// An array with one record.
JSON devices(const JSON &siteIds) {
    return JSON::array({{{"id", "DV1"}, {"siteid", siteIds}, {"x", {1, nullptr}}}});
}

/// JSON with plain quotes in place of double ones, and "DO" for the overview.
QByteArray quoted(QByteArray text) {
    return text.replace('\'', '"').replace("DO", Sites::overviewId.toUtf8());
}

const JSON overview = Sites::overviewId.toStdString();

} // namespace

class TestSiteEdits : public QObject {
    Q_OBJECT

private slots:
    void edits_data() {
        QTest::addColumn<QString>("words");
        QTest::addColumn<QString>("shown");
        QTest::addColumn<int>("refused");
        const QString all = "a<root f<root b<a g<f c<b d<c e<d";
        QTest::newRow("rename") << "a=north" << QString(all).replace("a<root", "a<root=north") << 0;
        QTest::newRow("white space around a name")
            << "a=\tn " << QString(all).replace("a<root", "a<root=n") << 0;
        QTest::newRow("rename there and back") << "a=x a=a" << all << 0;
        QTest::newRow("no name") << "a= a=\t" << all << 2;
        QTest::newRow("longest name")
            << "a=" + QString(255, 'n') << QString(all).replace("a<root", "a<root=" + QString(255, 'n')) << 0;
        QTest::newRow("too long a name") << "a=" + QString(256, 'n') << all << 1;
        QTest::newRow("two added in a millisecond") << "+g +g" << all + " SR1<g=Site SR2<g=Site" << 0;
        QTest::newRow("sixth level") << "+e" << all << 1;
        QTest::newRow("into itself") << "b<b" << all << 1;
        QTest::newRow("into its own branch") << "b<d" << all << 1;
        QTest::newRow("where it is") << "b<a" << all << 1;
        QTest::newRow("to nowhere") << "b<gone" << all << 1;
        QTest::newRow("a branch too deep") << "f<d" << all << 1;
        QTest::newRow("a branch that just fits") << "f<c"
                                                 << "a<root b<a c<b d<c f<c e<d g<f" << 0;
        QTest::newRow("to the top") << "d<root"
                                    << "a<root d<root f<root b<a e<d g<f c<b" << 0;
        QTest::newRow("deleted with all below") << "-b"
                                                << "a<root f<root g<f" << 0;
        QTest::newRow("moved out before") << "c<f -b"
                                          << "a<root f<root c<f g<f d<c e<d" << 0;
        QTest::newRow("not there") << "gone=x gone<a +gone" << all << 3;
    }
    void edits() {
        QFETCH(QString, words);
        QFETCH(QString, shown);
        SiteEdits edits = reading("a<root b<a c<b d<c e<d f<root g<f");
        const QString before = told(edits.merged());
        QTEST(static_cast<int>(edit(edits, words).size()), "refused");
        const QStringList now = told(edits.merged()).split(u' ');
        QCOMPARE(QSet<QString>(now.begin(), now.end()).size(), now.size());
        const QStringList wanted = shown.split(u' ');
        QCOMPARE(QSet<QString>(now.begin(), now.end()), QSet<QString>(wanted.begin(), wanted.end()));
        QCOMPARE(edits.isDirty(), told(edits.merged()) != before);
    }

    void rebase_data() {
        QTest::addColumn<QString>("words");
        QTest::addColumn<QString>("reading");
        QTest::addColumn<QString>("shown");
        QTest::addColumn<int>("dropped");
        QTest::newRow("others add") << "a=x"
                                    << "a<root b<a c<root n<b"
                                    << "a<root=x c<root b<a n<b" << 0;
        QTest::newRow("others delete what was edited") << "b=x b<c"
                                                       << "a<root c<root"
                                                       << "a<root c<root" << 1;
        QTest::newRow("others delete what was deleted") << "-b"
                                                        << "a<root c<root"
                                                        << "a<root c<root" << 0;
        QTest::newRow("others delete the parent of a new one") << "+b"
                                                               << "a<root c<root"
                                                               << "a<root c<root" << 1;
        QTest::newRow("others delete the target of a move") << "b<c"
                                                            << "a<root b<a"
                                                            << "a<root b<a" << 1;
        QTest::newRow("others put one below a deleted one") << "-a"
                                                            << "a<root b<a c<root n<a"
                                                            << "c<root" << 0;
        QTest::newRow("two moves make a cycle") << "a<c"
                                                << "a<root b<a c<b"
                                                << "a<root b<a c<b" << 1;
        QTest::newRow("two moves go too deep") << "+b"
                                               << "a<r3 b<a c<root r1<root r2<r1 r3<r2"
                                               << "c<root r1<root r2<r1 r3<r2 a<r3 b<a" << 1;
        QTest::newRow("the name is kept when the move is not") << "b<c b=x"
                                                               << "a<root b<a"
                                                               << "a<root b<a=x" << 1;
    }
    void rebase() {
        QFETCH(QString, words);
        QFETCH(QString, reading);
        SiteEdits edits = ::reading("a<root b<a c<root");
        QCOMPARE(edit(edits, words), QStringList());
        QTEST(static_cast<int>(edits.takeReading(sites(reading)).size()), "dropped");
        QTEST(told(edits.merged()), "shown");
    }

    void othersRenameIsKeptUnlessEdited() {
        SiteEdits edits = reading("a<root b<a");
        edit(edits, "a=mine");
        edits.takeReading(sites("a<root b<a", {{"sitename", "theirs"}}));
        QCOMPARE(told(edits.merged()), QStringLiteral("a<root=mine b<a=theirs"));
        // Somebody else has given it the very name: nothing is left to send.
        edits.takeReading(sites("a<root b<a", {{"sitename", "mine"}}));
        QVERIFY(!edits.isDirty());
    }

    void commitRecordsTellEverything() {
        SiteEdits edits;
        edits.takeReading(sites("a<root b<a c<b d<gone", {{"colour", {1, 2}}}));
        edit(edits, "a=x -b +a");
        const std::string root = Sites::rootId.toStdString();
        const JSON expected = {{{"siteid", "a"}, {"parentid", root}, {"sitename", "x"}, {"colour", {1, 2}}},
                               {{"siteid", "d"}, {"parentid", root}, {"sitename", "d"}, {"colour", {1, 2}}},
                               {{"siteid", "SR1"}, {"parentid", "a"}, {"sitename", "Site"}},
                               {{"siteid", "b"}, {"deleted", true}},
                               {{"siteid", "c"}, {"deleted", true}}};
        QCOMPARE(edits.commitRecords().dump(), expected.dump());
        // One that the service itself has without a name would make it refuse everything.
        edits.takeReading(sites("a<root", {{"sitename", ""}}));
        QCOMPARE(edits.commitRecords()[0].value("sitename", "none"), std::string("x"));
        SiteEdits nameless;
        nameless.takeReading(sites("a<root", {{"sitename", ""}}));
        QCOMPARE(nameless.commitRecords().size(), std::size_t(0));
    }

    void commitClearsWhatWasSent() {
        SiteEdits edits = reading("a<root b<a c<root");
        edit(edits, "a=x -b +c +c");
        edits.beginCommit();
        edit(edits, "c=late a=y SR1=new -SR2");
        edits.commitSucceeded();
        QCOMPARE(told(edits.reading()), QStringLiteral("a<root=x c<root SR1<c=Site SR2<c=Site"));
        QCOMPARE(told(edits.merged()), QStringLiteral("a<root=y c<root=late SR1<c=new"));
        QVERIFY(edits.isDirty());
        // A service may hold what a failed commit has sent, so the deletion has to be told.
        SiteEdits failed = reading("a<root");
        edit(failed, "+a");
        failed.beginCommit();
        failed.commitFailed();
        QVERIFY(failed.isDirty());
        edit(failed, "-SR1");
        failed.takeReading(sites("a<root"));
        QCOMPARE(failed.takeReading(sites("a<root SR1<a")), QStringList());
        QCOMPARE(told(failed.merged()), QStringLiteral("a<root"));
        QCOMPARE(failed.commitRecords().back().value("siteid", ""), std::string("SR1"));
        failed.beginCommit();
        failed.takeReading(sites("a<root"));
        failed.commitSucceeded();
        QVERIFY(!failed.isDirty());
        QCOMPARE(told(failed.merged()), QStringLiteral("a<root"));
    }

    void membership_data() {
        QTest::addColumn<QByteArray>("siteIds");
        QTest::addColumn<QString>("source");   // empty for a removal from "b"
        QTest::addColumn<QByteArray>("after"); // empty for a record that is not sent
        QTest::addColumn<int>("outcome");
        const auto row = [](const char *name, const QByteArray &before, const char *source,
                            const QByteArray &after, Outcome outcome) {
            QTest::newRow(name) << quoted(before) << QString(source).replace("DO", Sites::overviewId)
                                << quoted(after) << static_cast<int>(outcome);
        };
        row("added", "['DO']", "DO", "['DO','b']", Outcome::Added);
        row("a text that holds an array", "'[\\'DO\\']'", "DO", "['DO','b']", Outcome::Added);
        row("no array", "'?'", "DO", "['b']", Outcome::Added);
        row("there already", "['DO','b']", "DO", "", Outcome::Unchanged);
        row("moved", "['DO','a','c']", "a", "['DO','c','b']", Outcome::Moved);
        row("moved to where it was", "['DO','a','b']", "a", "['DO','b']", Outcome::Moved);
        row("onto its own site", "['DO','b']", "b", "", Outcome::Unchanged);
        row("left meanwhile", "['DO','c']", "a", "['DO','c','b']", Outcome::Added);
        row("removed", "['DO','b','c']", "", "['DO','c']", Outcome::Removed);
        row("removed from its only site", "['b']", "", "['DO']", Outcome::Removed);
        row("not in the site", "['DO']", "", "", Outcome::Unchanged);
    }
    void membership() {
        QFETCH(QByteArray, siteIds);
        QFETCH(QString, source);
        QFETCH(QByteArray, after);
        const JSON records = devices(JSON::parse(siteIds.toStdString()));
        JSON changed;
        const auto outcomes = source.isEmpty()
                                  ? SiteMembership::removeFromSite(records, "b", changed)
                                  : SiteMembership::assign(records, {"b", source, true}, changed);
        QCOMPARE(outcomes.size(), std::size_t(1));
        QTEST(static_cast<int>(outcomes[0].outcome), "outcome");
        QCOMPARE(outcomes[0].deviceId, QStringLiteral("DV1"));
        const JSON expected = after.isEmpty() ? JSON::array() : devices(JSON::parse(after.toStdString()));
        QCOMPARE(changed.dump(), expected.dump());
    }

    void nothingLeavesTheOverview() {
        JSON changed;
        SiteMembership::assign(devices(JSON::array({overview})), {"b", Sites::overviewId, true}, changed);
        QCOMPARE(changed[0]["siteid"].dump(), JSON({overview, "b"}).dump());
        SiteMembership::removeFromSite(devices({overview, "b"}), Sites::overviewId, changed);
        QVERIFY(changed.empty());
        SiteMembership::assign(devices({overview, "a"}), {"b", "a", false}, changed);
        QCOMPARE(changed[0]["siteid"].dump(), JSON({overview, "a", "b"}).dump());
    }

    void dragDataIsChecked() {
        const auto dragged = SiteMembership::decode(SiteMembership::encode({"a", {"DV1", "DV2"}}));
        QVERIFY(dragged);
        QCOMPARE(dragged->sourceSiteId, QStringLiteral("a"));
        QCOMPARE(dragged->deviceIds, (QStringList{"DV1", "DV2"}));
        for (const char *text : {"", "[", "[]", "{'source':'a'}", "{'source':'a','devices':[7,'']}",
                                 "{'devices':['DV1']}", "{'source':'a','devices':'DV1'}"})
            QVERIFY2(!SiteMembership::decode(quoted(text)), text);
    }
};

NVLDM_APPLESS_TEST(TestSiteEdits)
#include "tst_siteedits.moc"
