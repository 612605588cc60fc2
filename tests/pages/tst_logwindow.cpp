#include "api/session/nettask.h"
#include "fakeservice.h"
#include "pages/log/logchart.h"
#include "pages/log/logtable.h"
#include "pages/log/logwindow.h"
#include "store/lastfolder.h"
#include "support/isolatedroot.h"
#include "support/logcapture.h"
#include "support/testmain.h"

#include <QComboBox>
#include <QDateEdit>
#include <QFile>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QSignalSpy>
#include <QStackedWidget>
#include <QTest>
#include <QTimeEdit>
#include <QToolButton>

using nlohmann::json;

namespace {

json entry(qint64 at, const char *source, const char *type, const std::string &description,
           const char *user = "admin") {
    return {
        {"created_at", at}, {"source", source}, {"type", type}, {"description", description}, {"user", user}};
}

qint64 today(int hours, int minutes = 0) {
    return QDateTime(QDate::currentDate(), QTime(hours, minutes)).toMSecsSinceEpoch();
}

} // namespace

/// The log page as a user meets it, on the log of a service that is not there otherwise.
class TestLogWindow : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_log = std::make_unique<LogCapture>();
        m_service = std::make_unique<FakeService>();
    }
    void cleanup() {
        m_window.reset();
        QVERIFY(NetTask::waitForAll(10000));
        m_service.reset();
        m_log.reset();
    }

    void readsTheDayWhenShown() {
        m_service->setLog({entry(today(1), "Device", "Alarm", "one")});
        m_window = std::make_unique<LogWindow>();
        QCOMPARE(text("pageLabel"), QStringLiteral("0 of 0"));
        show();
        QCOMPARE(text("countLabel"), QStringLiteral("Searching..."));
        QCOMPARE(page(), QStringLiteral("loadingPage"));
        QTRY_COMPARE(text("countLabel"), QStringLiteral("1 Log Found"));
        QCOMPARE(text("pageLabel"), QStringLiteral("1 from 1"));
        const json sent = m_service->sentTo("/v1/logs/list").at(0);
        QCOMPARE(sent.at("start_time").get<std::string>(), std::to_string(today(0)));
        QCOMPARE(sent.at("end_time").get<std::string>(), std::to_string(today(0) + 24 * 3600000 - 1));
        m_service->setLog({});
        find<QPushButton>("searchButton")->click();
        QTRY_COMPARE(text("countLabel"), QStringLiteral("0 Logs Found"));
        QCOMPARE(page(), QStringLiteral("emptyPage"));
        QCOMPARE(text("pageLabel"), QStringLiteral("0 of 0"));
    }

    void frameIsTypedAndJudged() {
        open({});
        auto *end = find<QDateEdit>("endDateEdit");
        end->setDate(QDate(2026, 3, 1));
        find<QDateEdit>("startDateEdit")->setDate(QDate(2026, 3, 2));
        QVERIFY(!find<QToolButton>("todayButton")->isChecked());
        QTest::keyClick(find<QPushButton>("searchButton"), Qt::Key_Space);
        QVERIFY(find<QLabel>("frameProblemLabel")->isVisible());
        QCOMPARE(m_service->sentTo("/v1/logs/list").size(), std::size_t{1});
        end->setFocus();
        end->setDate(QDate(2026, 3, 2));
        QVERIFY(!find<QLabel>("frameProblemLabel")->isVisible());
        auto *time = find<QTimeEdit>("endTimeEdit");
        time->setFocus();
        QTest::keyClicks(time, "1430");
        QTest::keyClick(find<QPushButton>("searchButton"), Qt::Key_Space);
        QTRY_COMPARE(m_service->sentTo("/v1/logs/list").size(), std::size_t{2});
        // The whole of the minute that is shown.
        const qint64 to = QDateTime(QDate(2026, 3, 2), QTime(14, 30, 59, 999)).toMSecsSinceEpoch();
        QCOMPARE(m_service->sentTo("/v1/logs/list").back().at("end_time").get<std::string>(),
                 std::to_string(to));
    }

    void quickFramesSearchAtOnce() {
        open({});
        const auto sentFrame = [this](std::size_t count) {
            const json sent = m_service->sentTo("/v1/logs/list").at(count - 1);
            return std::stoll(sent.at("end_time").get<std::string>()) -
                   std::stoll(sent.at("start_time").get<std::string>());
        };
        find<QToolButton>("lastHourButton")->click();
        QTRY_COMPARE(m_service->sentTo("/v1/logs/list").size(), std::size_t{2});
        QVERIFY(sentFrame(2) >= 3600000 && sentFrame(2) <= 3660000);
        QTRY_VERIFY(find<QToolButton>("sevenDaysButton")->isEnabled());
        find<QToolButton>("sevenDaysButton")->click();
        QTRY_COMPARE(m_service->sentTo("/v1/logs/list").size(), std::size_t{3});
        QVERIFY(sentFrame(3) > 6 * 86400000ll && sentFrame(3) < 8 * 86400000ll);
    }

    void filtersSearchesAndClears() {
        open({entry(today(3), "Device", "Alarm", "gate lost"),
              entry(today(2), "System", "Event", "task ended"),
              entry(today(1), "System", "Audit", "gate renamed")});
        find<QComboBox>("sourceComboBox")->setCurrentText("System");
        QCOMPARE(text("countLabel"), QStringLiteral("2 Logs Found"));
        QTest::keyClicks(find<QLineEdit>("logSearchEdit"), "GATE");
        QCOMPARE(text("countLabel"), QStringLiteral("1 Log Found"));
        QCOMPARE(cell(0, LogColumn::Description), QStringLiteral("gate renamed"));
        find<QComboBox>("typeComboBox")->setCurrentText("Alarm");
        QCOMPARE(page(), QStringLiteral("noMatchPage"));
        // A new search keeps what was filtered by.
        find<QPushButton>("searchButton")->click();
        QTRY_COMPARE(text("countLabel"), QStringLiteral("0 Logs Found"));
        find<QPushButton>("clearFiltersButton")->click();
        QCOMPARE(text("countLabel"), QStringLiteral("3 Logs Found"));
        QCOMPARE(find<QLineEdit>("logSearchEdit")->text(), QString());
        const auto *cross = find<QLineEdit>("logSearchEdit")->findChild<QToolButton *>();
        QTRY_VERIFY2(!cross->isVisible() || !cross->isEnabled(), "there is nothing left to clear");
    }

    void sortsTheWholeResultAndTurnsPages() {
        std::vector<json> items;
        for (int i = 0; i < 120; ++i)
            items.push_back(
                entry(today(0) + 1000 * ((i * 7) % 120), "Device", "Alarm", "n" + std::to_string(i)));
        open(items);
        const auto time = [](int second) { return logTimeText(today(0) + 1000 * second); };
        QCOMPARE(cell(0, LogColumn::Time), time(119));
        QCOMPARE(table()->rowCount(), 25);
        QVERIFY(!find<QToolButton>("firstPageButton")->isEnabled());
        QTest::mouseClick(find<QToolButton>("lastPageButton"), Qt::LeftButton);
        QCOMPARE(text("pageLabel"), QStringLiteral("5 from 5"));
        QCOMPARE(cell(19, LogColumn::Time), time(0));
        QCOMPARE(table()->rowCount(), 20);
        QVERIFY(!find<QToolButton>("nextPageButton")->isEnabled());
        auto *header = table()->horizontalHeader();
        QTest::mouseClick(header->viewport(), Qt::LeftButton, {}, QPoint(20, header->height() / 2));
        QCOMPARE(text("pageLabel"), QStringLiteral("1 from 5"));
        QCOMPARE(cell(0, LogColumn::Time), time(0));
        QTest::keyClick(find<QToolButton>("nextPageButton"), Qt::Key_Space);
        QTest::keyClick(find<QToolButton>("nextPageButton"), Qt::Key_Space);
        QCOMPARE(cell(0, LogColumn::Time), time(50));
        // The page that has the row that was the first one.
        find<QComboBox>("limitDropdown")->setCurrentText("50");
        QCOMPARE(cell(0, LogColumn::Time), time(50));
        QCOMPARE(text("pageLabel"), QStringLiteral("2 from 3"));
        m_window->updateLimit("100");
        QCOMPARE(table()->rowCount(), 100);
        QCOMPARE(text("pageLabel"), QStringLiteral("1 from 2"));
    }

    void detailShowsTheWholeDescription() {
        const std::string description = "<b>line</b>\n" + std::string(3000, 'x');
        open({entry(today(2), "Device", "Alarm", description),
              entry(today(1), "Device", "Alarm", "short", "")});
        auto *detail = find<QPlainTextEdit>("logDetail");
        QVERIFY(detail->toPlainText().isEmpty());
        table()->setFocus();
        QTest::keyClick(table(), Qt::Key_Down);
        QTest::keyClick(table(), Qt::Key_Down);
        QCOMPARE(detail->toPlainText(), QStringLiteral("short"));
        QCOMPARE(cell(1, LogColumn::User), QStringLiteral("--"));
        QTest::keyClick(table(), Qt::Key_Up);
        QCOMPARE(detail->toPlainText(), QString::fromStdString(description));
        find<QLineEdit>("logSearchEdit")->setText("short");
        QVERIFY(detail->toPlainText().isEmpty());
    }

    void selectedEntryStaysInView() {
        std::vector<json> items;
        for (int i = 0; i < 120; ++i)
            items.push_back(entry(today(0) + 1000 * i, "Device", "Alarm", "n" + std::to_string(i)));
        open(items);
        const auto *detail = find<QPlainTextEdit>("logDetail");
        const auto selected = [this] {
            QStringList texts;
            for (const QModelIndex &index : table()->selectionModel()->selectedRows())
                texts += cell(index.row(), LogColumn::Description);
            return texts.join(' ');
        };
        table()->selectRow(1);
        QTest::keyClick(table(), Qt::Key_Down, Qt::ShiftModifier);
        QCOMPARE(detail->toPlainText(), QStringLiteral("n117"));
        auto *header = table()->horizontalHeader();
        QTest::mouseClick(header->viewport(), Qt::LeftButton, {}, QPoint(20, header->height() / 2));
        QCOMPARE(text("pageLabel"), QStringLiteral("5 from 5"));
        QCOMPARE(detail->toPlainText(), QStringLiteral("n117"));
        QCOMPARE(selected(), QStringLiteral("n117 n118"));
        find<QComboBox>("limitDropdown")->setCurrentText("100");
        QCOMPARE(text("pageLabel"), QStringLiteral("2 from 2"));
        QCOMPARE(detail->toPlainText(), QStringLiteral("n117"));
        QVERIFY(table()->viewport()->rect().intersects(table()->visualItemRect(table()->currentItem())));
        find<QPushButton>("searchButton")->click();
        QTRY_VERIFY(detail->toPlainText().isEmpty());
        QCOMPARE(selected(), QString());
    }

    void digitsAreTakenAfterAClick() {
        open({});
        auto *time = find<QTimeEdit>("startTimeEdit");
        auto *edit = time->findChild<QLineEdit *>();
        QTest::mouseClick(edit, Qt::LeftButton, {}, QPoint(edit->width() - 2, edit->height() / 2));
        QTest::keyClicks(time, "45");
        QCOMPARE(time->time(), QTime(0, 45));
        QTest::mouseClick(edit, Qt::LeftButton, {}, QPoint(2, edit->height() / 2));
        QTest::keyClicks(time, "1030");
        QCOMPARE(time->time(), QTime(10, 30));
    }

    void chartNarrowsTheFrame() {
        open({entry(today(3, 30), "Device", "Alarm", "three"), entry(today(5), "System", "Event", "five"),
              entry(today(9), "System", "Audit", "nine")});
        auto *chart = find<LogChart>("logChart");
        const auto at = [chart](int bin) { return chart->binRect(bin).center().toPoint(); };
        QTest::mousePress(chart, Qt::LeftButton, {}, at(5));
        QTest::mouseMove(chart, at(3));
        QTest::mouseRelease(chart, Qt::LeftButton, {}, at(3));
        QCOMPARE(text("countLabel"), QStringLiteral("2 Logs Found"));
        QCOMPARE(find<QTimeEdit>("startTimeEdit")->time(), QTime(3, 0));
        QCOMPARE(find<QTimeEdit>("endTimeEdit")->time(), QTime(5, 59, 59, 999));
        chart->setFocus();
        QTest::keyClick(chart, Qt::Key_Escape);
        QCOMPARE(text("countLabel"), QStringLiteral("3 Logs Found"));
        QCOMPARE(find<QTimeEdit>("startTimeEdit")->time(), QTime(0, 0));

        for (const Qt::Key key : {Qt::Key_Home, Qt::Key_Right, Qt::Key_Right, Qt::Key_Right})
            QTest::keyClick(chart, key);
        QVERIFY2(chart->accessibleDescription().contains("Alarm: 1"),
                 qPrintable(chart->accessibleDescription()));
        QTest::keyClick(chart, Qt::Key_Right, Qt::ShiftModifier);
        QTest::keyClick(chart, Qt::Key_Return);
        QCOMPARE(cell(0, LogColumn::Description), QStringLiteral("three"));
        QCOMPARE(table()->rowCount(), 1);
        find<QToolButton>("wholeFrameButton")->click();
        QCOMPARE(table()->rowCount(), 3);
    }

    void failureIsToldAndTriedAgain_data() {
        QTest::addColumn<int>("code");
        QTest::addColumn<QByteArray>("item");
        QTest::newRow("refused") << 5 << QByteArray("{}");
        QTest::newRow("an entry without a member")
            << 0 << QByteArray(R"({"created_at":1,"source":"Device","type":"Alarm","user":""})");
    }
    void failureIsToldAndTriedAgain() {
        QFETCH(int, code);
        QFETCH(QByteArray, item);
        m_service->refuse("/v1/logs/list", code);
        m_service->setLog({json::parse(item.toStdString())});
        m_window = std::make_unique<LogWindow>();
        show();
        QTRY_COMPARE(page(), QStringLiteral("failedPage"));
        QVERIFY(!text("failureLabel").isEmpty());
        QCOMPARE(m_log->count("Handling task status removing occurs error: "), 1);
        QVERIFY(!find<QPushButton>("exportButton")->isEnabled());
        m_service->refuse("/v1/logs/list", 0);
        m_service->setLog({entry(today(1), "Device", "Alarm", "back")});
        find<QPushButton>("retryButton")->click();
        QTRY_COMPARE(text("countLabel"), QStringLiteral("1 Log Found"));
    }

    void exportWritesWhatIsShown() {
        open({entry(today(2), "Device", "Alarm", "plain"),
              entry(today(1), "System", "Audit", "a, \"b\"\r\nc", "x@y"),
              entry(today(0), "System", "Event", "other")});
        find<QLineEdit>("logSearchEdit")->setText("a");
        find<QComboBox>("typeComboBox")->setCurrentText("Audit");
        QCOMPARE(exported("log.csv"), "Date/Time,Source,Type,Description,User,\n" +
                                          logTimeText(today(1)).toUtf8() +
                                          ",System,Audit,\"a, \"\"b\"\" c\",x@y,\n");
        find<QLineEdit>("logSearchEdit")->setText("nothing");
        QCOMPARE(exported("empty.csv"), QByteArray("Date/Time,Source,Type,Description,User,\n"));
        QCOMPARE(LastFolder::path(), m_root.path());
        QSignalSpy ended(m_window.get(), &LogWindow::export_file_generated);
        QCOMPARE(exported("no such folder/log.csv"), QByteArray("no beginning"));
        QCOMPARE(ended.count(), 1);
        QCOMPARE(ended.at(0).at(0).toString(), QStringLiteral("Failed to export."));
        QVERIFY(!ended.at(0).at(1).toBool());
    }

    void logOffForgetsAndTheNextSessionReads() {
        open({entry(today(1), "Device", "Alarm", "secret")});
        find<QLineEdit>("logSearchEdit")->setText("secret");
        m_window->hide();
        m_window->reset();
        QCOMPARE(table()->rowCount(), 0);
        QCOMPARE(find<QLineEdit>("logSearchEdit")->text(), QString());
        show();
        QTRY_COMPARE(text("countLabel"), QStringLiteral("1 Log Found"));
    }

    void everythingIsReachedByTab() {
        open({entry(today(1), "Device", "Alarm", "one")});
        QStringList names{"lastHourButton"};
        find<QWidget>("lastHourButton")->setFocus();
        // In a date, Tab goes from part to part first.
        for (int i = 0; i < 40 && m_window->focusWidget()->objectName() != "limitDropdown"; ++i) {
            QTest::keyClick(m_window->focusWidget(), Qt::Key_Tab);
            if (names.last() != m_window->focusWidget()->objectName())
                names += m_window->focusWidget()->objectName();
        }
        QCOMPARE(names.join(' '),
                 QStringLiteral("lastHourButton todayButton sevenDaysButton startDateEdit startTimeEdit "
                                "endDateEdit endTimeEdit sourceComboBox typeComboBox searchButton "
                                "logSearchEdit exportButton logChart logTable logDetail limitDropdown"));
    }

private:
    void show() {
        m_window->resize(1000, 660);
        m_window->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
        m_window->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
    }
    void open(const std::vector<json> &items) {
        m_service->setLog(items);
        m_window = std::make_unique<LogWindow>();
        show();
        QTRY_VERIFY(text("countLabel").contains("Found"));
    }
    QByteArray exported(const QString &name) {
        m_window->setAskSavePath([this, name](const auto &chosen) { chosen(m_root.filePath(name)); });
        QSignalSpy begun(m_window.get(), &LogWindow::export_button_clicked);
        QSignalSpy ended(m_window.get(), &LogWindow::export_file_generated);
        find<QPushButton>("exportButton")->click();
        if (ended.isEmpty() && !ended.wait())
            return "no export";
        if (begun.size() != 1)
            return "no beginning";
        return m_root.read(name);
    }
    template <typename T>
    T *find(const char *name) const {
        return m_window->findChild<T *>(QLatin1String(name));
    }
    QString text(const char *name) const { return find<QLabel>(name)->text(); }
    QString page() const {
        const QWidget *splitter = table()->parentWidget();
        return static_cast<QStackedWidget *>(splitter->parentWidget())->currentWidget()->objectName();
    }
    LogTable *table() const { return find<LogTable>("logTable"); }
    QString cell(int row, LogColumn column) const {
        return table()->item(row, static_cast<int>(column))->text();
    }

    IsolatedRoot m_root;
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<FakeService> m_service;
    std::unique_ptr<LogWindow> m_window;
};

NVLDM_TEST(TestLogWindow)
#include "tst_logwindow.moc"
