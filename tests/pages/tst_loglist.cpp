#include "pages/log/logexport.h"
#include "pages/log/loghistogram.h"
#include "pages/log/loglist.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"

#include <QDateTime>
#include <QTest>

#include <nlohmann/json.hpp>

#include <stdexcept>

using nlohmann::json;

namespace {

constexpr qint64 hour = 3'600'000;
constexpr qint64 day = 24 * hour;

json row(const json &at, const char *source, const char *type, const char *user, const char *description) {
    return {
        {"Date/Time", at}, {"Source", source}, {"Type", type}, {"User", user}, {"Description", description}};
}

qint64 local(int year, int month, int dayOfMonth, int hours = 0) {
    return QDateTime(QDate(year, month, dayOfMonth), QTime(hours, 0)).toMSecsSinceEpoch();
}

/// The descriptions of the entries at the places.
QString shown(const LogList &list, const std::vector<int> &places) {
    QStringList texts;
    for (const int place : places)
        texts += list.at(place).description;
    return texts.join(QLatin1Char(' '));
}

LogListPtr sample() {
    return LogList::parse({row(local(1969, 7, 20), "Device", "Alarm", "", "moon"),
                           row(local(2150, 1, 1), "System", "Event", "zoe", "Future"),
                           row(local(2026, 5, 2, 9), "System", "Audit", "Adam", "alpha"),
                           row(local(2026, 5, 10, 9), "Device", "Event", "bea", "Beta"),
                           row(local(2026, 5, 10, 8), "Device", "Alarm", "adam", "gamma")});
}

} // namespace

class TestLogList : public QObject {
    Q_OBJECT

private slots:
    void sortsByWhatAColumnMeans_data() {
        QTest::addColumn<LogColumn>("column");
        QTest::addColumn<QString>("ascending");
        QTest::addColumn<QString>("descending");
        QTest::newRow("time") << LogColumn::Time << "moon alpha gamma Beta Future"
                              << "Future Beta gamma alpha moon";
        QTest::newRow("alike: newest first") << LogColumn::Source << "Beta gamma moon Future alpha"
                                             << "Future alpha Beta gamma moon";
        QTest::newRow("case apart") << LogColumn::User << "moon gamma alpha Beta Future"
                                    << "Future Beta gamma alpha moon";
        QTest::newRow("description") << LogColumn::Description << "alpha Beta Future gamma moon"
                                     << "moon gamma Future Beta alpha";
    }
    void sortsByWhatAColumnMeans() {
        QFETCH(LogColumn, column);
        const LogListPtr list = sample();
        QTEST(shown(*list, list->order(column, Qt::AscendingOrder)), "ascending");
        QTEST(shown(*list, list->order(column, Qt::DescendingOrder)), "descending");
    }

    void oddValuesSpoilThemselvesOnly() {
        const LogListPtr list = LogList::parse(
            {row("1700000000000", "Moon", "Noise", "u", "text time"),
             row(json::array(), "Device", "Alarm", "u", "no time"), row(1e300, "Device", "Alarm", "u", "far"),
             row(INT64_MIN, "Device", "Alarm", "u", "near"), json(7),
             json{
                 {"Date/Time", 5}, {"Source", 1}, {"Type", nullptr}, {"User", {1}}, {"Description", false}}});
        QCOMPARE(list->size(), 6);
        QCOMPARE(list->at(0).at, 1700000000000);
        QCOMPARE(list->at(0).source, LogEntry::Source::Other);
        QCOMPARE(list->at(0).sourceText, QStringLiteral("Moon"));
        QCOMPARE(list->at(0).typeText, QStringLiteral("Noise"));
        for (const int place : {1, 2, 3, 4})
            QCOMPARE(list->at(place).text(LogColumn::Time), QString());
        QCOMPARE(list->at(5).at, 5);
        QCOMPARE(list->at(5).user + list->at(5).description, QString());
        QVERIFY_THROWS_EXCEPTION(std::runtime_error, LogList::parse(json::object()));
        QCOMPARE(logTimeText(local(1969, 7, 20)), QStringLiteral("1969/07/20 00:00:00"));
        QCOMPARE(logTimeText(local(2150, 1, 1, 23)), QStringLiteral("2150/01/01 23:00:00"));
    }

    void filtersTogether_data() {
        QTest::addColumn<int>("source"); // -1 for all
        QTest::addColumn<int>("type");
        QTest::addColumn<QString>("search");
        QTest::addColumn<QString>("matching");
        QTest::newRow("all") << -1 << -1 << "  "
                             << "Future Beta gamma alpha moon";
        QTest::newRow("source") << 0 << -1 << ""
                                << "Beta gamma moon";
        QTest::newRow("source and type") << 0 << 0 << ""
                                         << "gamma moon";
        QTest::newRow("a letter") << -1 << -1 << "Z"
                                  << "Future";
        QTest::newRow("words in any column") << -1 << -1 << "DEVICE 2026/05/10 b"
                                             << "Beta";
        QTest::newRow("not across columns") << -1 << -1 << "systemaudit"
                                            << "";
        QTest::newRow("all three") << 1 << 2 << "adam"
                                   << "alpha";
    }
    void filtersTogether() {
        QFETCH(int, source);
        QFETCH(int, type);
        QFETCH(QString, search);
        LogFilter filter{{}, {}, search};
        if (source >= 0)
            filter.source = static_cast<LogEntry::Source>(source);
        if (type >= 0)
            filter.type = static_cast<LogEntry::Type>(type);
        const LogListPtr list = sample();
        const std::vector<char> matches = filter.matches(*list);
        QTEST(shown(*list, list->order(LogColumn::Time, Qt::DescendingOrder, matches)), "matching");
        const TimeRange span{local(2026, 5, 10), local(2026, 5, 10, 8)};
        const QString within = shown(*list, list->order(LogColumn::Time, Qt::DescendingOrder, matches, span));
        QFETCH(QString, matching);
        QCOMPARE(within, matching.contains("gamma") ? QStringLiteral("gamma") : QString());
    }

    void binsCoverTheFrame_data() {
        QTest::addColumn<qint64>("from");
        QTest::addColumn<qint64>("to");
        QTest::addColumn<LogHistogram::Unit>("unit");
        QTest::addColumn<int>("bins");
        QTest::addColumn<int>("counted");
        const qint64 may = local(2026, 5, 10);
        QTest::newRow("a day by hours") << may << may + day - 1 << LogHistogram::Unit::Hour << 24 << 2;
        QTest::newRow("from within an hour")
            << may + hour / 2 << may + hour + 1 << LogHistogram::Unit::Hour << 2 << 0;
        QTest::newRow("an instant") << may + 8 * hour << may + 8 * hour << LogHistogram::Unit::Hour << 1 << 1;
        QTest::newRow("two weeks by days")
            << local(2026, 5, 1) << local(2026, 5, 15) - 1 << LogHistogram::Unit::Day << 14 << 3;
        // Cut to where there are entries.
        QTest::newRow("all time") << qint64(0) << local(2100, 1, 1) << LogHistogram::Unit::Day << 9 << 3;
        QTest::newRow("ends before it starts") << may << may - 1 << LogHistogram::Unit::Hour << 0 << 0;
    }
    void binsCoverTheFrame() {
        QFETCH(qint64, from);
        QFETCH(qint64, to);
        const LogListPtr list = sample();
        LogHistogram bins({from, to}, *list);
        bins.count(*list, list->order(LogColumn::Time, Qt::AscendingOrder));
        QTEST(bins.unit(), "unit");
        QTEST(bins.size(), "bins");
        int counted = 0;
        for (int bin = 0; bin < bins.size(); ++bin) {
            counted += bins.total(bin);
            QCOMPARE(bins.binsOf(bins.frame(bin)), std::make_optional(std::pair(bin, bin)));
        }
        QTEST(counted, "counted");
        QVERIFY(!bins.binsOf({to + 400 * day, to + 401 * day}));
    }

    void wideFramesShareBins() {
        const LogListPtr list = LogList::parse({row(local(1990, 1, 1), "Device", "Alarm", "", ""),
                                                row(local(2020, 1, 1, 5), "Device", "Event", "", "")});
        LogHistogram bins({0, local(2100, 1, 1)}, *list);
        bins.count(*list, list->order(LogColumn::Time, Qt::AscendingOrder));
        QCOMPARE(bins.unit(), LogHistogram::Unit::Days);
        QVERIFY(bins.size() > 180 && bins.size() <= 366);
        QCOMPARE(bins.counts(0)[0], 1);
        QCOMPARE(bins.counts(bins.size() - 1)[1], 1);
        QCOMPARE(bins.frame(0, bins.size() - 1).from, local(1990, 1, 1));
    }

    void exportsWhatOtherProgramsRead() {
        const LogListPtr list =
            LogList::parse({row("none", "Probe", "Alarm", "a,b", "two\nlines\r\nand a \"word\""),
                            row(local(2026, 5, 2, 9), "System", "Audit", "Zürich", "plain")});
        const IsolatedRoot root;
        const LogCapture log;
        bool opened = false;
        const auto write = [&](const QString &path, const std::vector<int> &places) {
            return LogExport::write(path, *list, places, [&] { opened = true; });
        };
        const QByteArray header = "Date/Time,Source,Type,Description,User,\n";
        const QByteArray odd = ",Probe,Alarm,\"two lines and a \"\"word\"\"\",\"a,b\",\n";
        const QByteArray plain = "2026/05/02 09:00:00,System,Audit,plain,Zürich,\n";
        QVERIFY(write(root.filePath("log.csv"), {1, 0}));
        QVERIFY(opened);
        QCOMPARE(root.read("log.csv"), header + plain + odd);
        QVERIFY(write(root.filePath("log.csv"), {}));
        QCOMPARE(root.read("log.csv"), header);
        // 2 MiB, which go out in parts.
        QVERIFY(write(root.filePath("log.csv"), std::vector<int>(40000, 1)));
        QCOMPARE(root.read("log.csv").size(), header.size() + 40000 * plain.size());
        opened = false;
        QVERIFY(!write(root.filePath("no such folder/log.csv"), {1}));
        QVERIFY(!opened);
        QCOMPARE(log.count("The log could not be exported: "), 1);
    }
};

NVLDM_GUILESS_TEST(TestLogList)
#include "tst_loglist.moc"
