// The log page with a hundred thousand entries: what the user-interface thread does at each step, and beside
// it the sorting of a plain table widget of the same rows.
//   bench_logs [ENTRIES]

#include "pages/log/logexport.h"
#include "pages/log/loglist.h"
#include "pages/log/logtable.h"
#include "pages/log/logwindow.h"
#include "widgets/style/theme.h"

#include <QApplication>
#include <QComboBox>
#include <QElapsedTimer>
#include <QHeaderView>
#include <QLineEdit>
#include <QTableWidget>
#include <QTemporaryDir>
#include <QToolButton>

#include <nlohmann/json.hpp>

#include <cstdio>
#include <functional>

namespace {

constexpr qint64 spanMs = 7ll * 86400000;
constexpr const char *types[] = {"Alarm", "Event", "Audit"};

double milliseconds(const std::function<void()> &work) {
    QElapsedTimer timer;
    timer.start();
    work();
    return static_cast<double>(timer.nsecsElapsed()) / 1e6;
}

JSON makeTable(int entries, const TimeRange &frame) {
    JSON table = JSON::array();
    for (int i = 0; i < entries; ++i) {
        const std::string number = std::to_string(static_cast<unsigned>(i) * 2654435761u % 50000u);
        table.push_back({{"Date/Time", frame.to - spanMs / entries * i},
                         {"Source", i % 3 ? "Device" : "System"},
                         {"Type", types[i % 3]},
                         {"User", "user" + std::to_string(i % 7) + "@example.net"},
                         {"Description", "Lost connection to gate-" + number + ".building.example"}});
    }
    return table;
}

double sortPlainWidget(const LogList &list) {
    QTableWidget table(list.size(), logColumnCount);
    for (int row = 0; row < list.size(); ++row) {
        for (int column = 0; column < logColumnCount; ++column)
            table.setItem(row, column,
                          new QTableWidgetItem(list.at(row).text(static_cast<LogColumn>(column))));
    }
    return milliseconds([&] { table.sortItems(static_cast<int>(LogColumn::Description)); });
}

void measureUse(LogWindow &window, double reference) {
    auto *table = window.findChild<LogTable *>();
    const auto step = [&](const QString &what, const std::function<void()> &work, const char *note = "") {
        const double time = milliseconds([&] {
            work();
            window.repaint();
        });
        std::printf("%-32s %9.2f ms   at most 50 ms %s\n", qPrintable(what), time, note);
    };
    auto *search = window.findChild<QLineEdit *>(QStringLiteral("logSearchEdit"));
    for (const char *text : {"g", "gate-4", "gate-49 user3", "2026", "no such thing"})
        step(QStringLiteral("search \"%1\"").arg(QLatin1String(text)),
             [&] { search->setText(QLatin1String(text)); });
    step(QStringLiteral("clear search"), [&] { search->clear(); });
    auto *type = window.findChild<QComboBox *>(QStringLiteral("typeComboBox"));
    step(QStringLiteral("filter by type"), [&] { type->setCurrentIndex(1); });
    step(QStringLiteral("filter by none"), [&] { type->setCurrentIndex(0); });
    QHeaderView *header = table->horizontalHeader();
    for (const Qt::SortOrder order : {Qt::AscendingOrder, Qt::DescendingOrder})
        step(QStringLiteral("sort by description"),
             [&] { header->setSortIndicator(static_cast<int>(LogColumn::Description), order); });
    std::printf("%-32s %9.2f ms   of a plain table widget\n", "  beside it, sortItems", reference);
    step(QStringLiteral("100 rows on a page"), [&] { window.updateLimit(QStringLiteral("100")); });
    step(QStringLiteral("next page"),
         [&] { window.findChild<QToolButton *>(QStringLiteral("nextPageButton"))->click(); });
    step(QStringLiteral("last page"),
         [&] { window.findChild<QToolButton *>(QStringLiteral("lastPageButton"))->click(); });
}

} // namespace

int main(int argc, char *argv[]) {
    QApplication application(argc, argv);
    QApplication::setStyle(QStringLiteral("Fusion"));
    Theme::installFonts();
    application.setStyleSheet(Theme::styleSheet());
    const int entries = argc > 1 ? std::max(std::atoi(argv[1]), 1) : 100000;
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    const TimeRange frame{now - spanMs, now};
    const JSON table = makeTable(entries, frame);
    LogListPtr list;
    const double parsed = milliseconds([&] { list = LogList::parse(table); });
    std::printf("%-32s %9.2f ms   on a runner\n", "read and put into all orders", parsed);
    LogWindow window;
    window.resize(1224, 670);
    window.show();
    QApplication::processEvents();
    const double shown = milliseconds([&] {
        window.showResult(frame, list);
        window.repaint();
    });
    std::printf("%-32s %9.2f ms   at most 50 ms\n", "show the result", shown);
    measureUse(window, sortPlainWidget(*list));
    const QTemporaryDir folder;
    const double exported = milliseconds([&] {
        LogExport::write(folder.filePath(QStringLiteral("log.csv")), *list,
                         list->order(LogColumn::Time, Qt::DescendingOrder));
    });
    std::printf("%-32s %9.2f ms   on a runner\n", "export", exported);
}
