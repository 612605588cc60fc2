// A device table against a plain table widget filled item by item, and against a view on a bare array model.
//   bench_tables [DEVICES…]

#include "devices/inventory/deviceexport.h"
#include "devices/inventory/deviceinventory.h"
#include "devices/page/mainconsoletable.h"
#include "devices/sites/sitetree.h"
#include "widgets/style/theme.h"

#include <QAbstractTableModel>
#include <QApplication>
#include <QElapsedTimer>
#include <QHeaderView>
#include <QTableView>
#include <QTableWidget>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <cstdio>
#include <functional>

namespace {

constexpr int rounds = 5;

double milliseconds(const std::function<void()> &work) {
    QElapsedTimer timer;
    timer.start();
    work();
    return static_cast<double>(timer.nsecsElapsed()) / 1e6;
}

/// The median, so that one interruption does not count.
double median(const std::function<double()> &measure) {
    std::vector<double> times;
    for (int i = 0; i < rounds; ++i)
        times.push_back(measure());
    std::sort(times.begin(), times.end());
    return times[rounds / 2];
}

std::vector<DeviceRecordPtr> makeRecords(int count) {
    std::vector<DeviceRecordPtr> records;
    for (int i = 0; i < count; ++i) {
        // A multiplicative shuffle: neighbours in the list are no neighbours by address.
        const unsigned n = static_cast<unsigned>(i) * 2654435761u;
        char id[24];
        char mac[24];
        char ip[24];
        std::snprintf(id, sizeof id, "DV%012d", i);
        std::snprintf(mac, sizeof mac, "00:1A:07:%02X:%02X:%02X", (n >> 16) & 255, (n >> 8) & 255, n & 255);
        std::snprintf(ip, sizeof ip, "10.%u.%u.%u", (n >> 24) & 255, (n >> 16) & 255, (n >> 8) & 255);
        records.push_back(DeviceRecords::parse({{"id", id},
                                                {"d_mac", mac},
                                                {"d_ip", ip},
                                                {"d_model", "NC-4210"},
                                                {"d_hostname", "gate-" + std::to_string(i)},
                                                {"d_svrtype", "Camera"},
                                                {"d_fw", "2.4.1"},
                                                {"d_http", 80},
                                                {"d_https", 443},
                                                {"https_enable", true},
                                                {"ieee8021x_enable", false},
                                                {"d_sdstatus", "ready"},
                                                {"d_sdusage", i % 100},
                                                {"d_dtime", "2026/11/21 10:00:00"},
                                                {"d_powerfreq", 50},
                                                {"d_audio", "mute"},
                                                {"siteid", {"DO000000000000", i % 3 == 0 ? "SR1" : "SR2"}}}));
    }
    return records;
}

/// The reference (b): an array of texts, and nothing between it and the view.
class ArrayModel : public QAbstractTableModel {
public:
    void fill(const std::vector<DeviceRecordPtr> &records) {
        beginResetModel();
        m_rows = records;
        m_codes.assign(records.size(), 0);
        endResetModel();
    }
    void sortByIp() {
        emit layoutAboutToBeChanged();
        std::sort(m_rows.begin(), m_rows.end(), [](const DeviceRecordPtr &a, const DeviceRecordPtr &b) {
            return a->sortKey(DeviceColumn::Ip) < b->sortKey(DeviceColumn::Ip);
        });
        emit layoutChanged();
    }
    void poll(int step, int code) {
        for (std::size_t i = 0; i < m_codes.size(); i += static_cast<std::size_t>(step))
            m_codes[i] = code;
        emit dataChanged(index(0, 0), index(rowCount({}) - 1, 0));
    }
    int rowCount(const QModelIndex &) const override { return static_cast<int>(m_rows.size()); }
    int columnCount(const QModelIndex &) const override { return deviceColumnCount; }
    QVariant data(const QModelIndex &index, int role) const override {
        const auto row = static_cast<std::size_t>(index.row());
        if (role != Qt::DisplayRole)
            return {};
        if (index.column() == 0)
            return m_codes[row];
        return m_rows[row]->texts[static_cast<std::size_t>(index.column())];
    }

private:
    std::vector<DeviceRecordPtr> m_rows;
    std::vector<int> m_codes;
};

void prepare(QTableView &view) {
    view.resize(1280, 720);
    view.verticalHeader()->hide();
    view.verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    view.show();
    QApplication::processEvents();
}

/// Times filling a table. Painting is left out for all alike: what is seen of a table does not grow with it.
double fillTime(QTableView &view, const std::function<void()> &fill) {
    view.setUpdatesEnabled(false);
    const double time = milliseconds(fill);
    view.setUpdatesEnabled(true);
    QApplication::processEvents();
    return time;
}

double fillPlainWidget(const std::vector<DeviceRecordPtr> &records) {
    QTableWidget table;
    table.setColumnCount(deviceColumnCount);
    prepare(table);
    return fillTime(table, [&] {
        table.setRowCount(static_cast<int>(records.size()));
        for (int row = 0; row < table.rowCount(); ++row) {
            for (int column = 0; column < deviceColumnCount; ++column)
                table.setItem(
                    row, column,
                    new QTableWidgetItem(
                        records[static_cast<std::size_t>(row)]->texts[static_cast<std::size_t>(column)]));
        }
    });
}

/// Lets the event loop run until the items of the view are there, and notes the longest turn of it.
void finishFill(MainConsoleTable &table, double &maxTurn) {
    while (table.rowCount() > 0 && !table.item(0, 0))
        maxTurn = std::max(maxTurn, milliseconds([] { QApplication::processEvents(); }));
}

struct Times {
    double fill = 0;
    double maxTurn = 0;
    double sort = 0;
    double poll = 0;
};

Times measureDeviceTable(const std::vector<DeviceRecordPtr> &records) {
    DeviceInventory inventory;
    MainConsoleTable table(DeviceClass::Camera);
    prepare(table);
    table.setInventory(&inventory);
    Times times;
    const auto snapshot = std::make_shared<const DeviceSnapshot>(records);
    times.fill = fillTime(table, [&] {
        times.maxTurn = milliseconds([&] {
            inventory.replace(snapshot, {});
            table.refill();
        });
        finishFill(table, times.maxTurn);
    });
    times.sort = milliseconds([&] {
        emit table.horizontalHeader()->sectionClicked(static_cast<int>(DeviceColumn::Ip));
        table.viewport()->repaint();
    });
    DeviceStatusUpdate update{snapshot, {}, {}};
    for (int i = 0; i < snapshot->size(); i += 10)
        update.changes.emplace_back(i, DeviceStatusCode::Unreachable);
    times.poll = milliseconds([&] {
        inventory.apply(update);
        table.refreshStatus();
        table.viewport()->repaint();
    });
    return times;
}

Times measureArrayModel(const std::vector<DeviceRecordPtr> &records) {
    ArrayModel model;
    QTableView view;
    view.setModel(&model);
    prepare(view);
    Times times;
    times.fill = fillTime(view, [&] { model.fill(records); });
    times.sort = milliseconds([&] {
        model.sortByIp();
        view.viewport()->repaint();
    });
    times.poll = milliseconds([&] {
        model.poll(10, 3);
        view.viewport()->repaint();
    });
    return times;
}

void row(const char *what, int devices, double ours, const char *reference, double theirs,
         const char *limit) {
    std::printf("%-22s %7d  %9.2f ms   %-24s %9.2f ms   ratio %6.2f   %s\n", what, devices, ours, reference,
                theirs, ours / theirs, limit);
}

/// What a user does with a full table, each step until it is painted.
void measureUse(const std::vector<DeviceRecordPtr> &records) {
    DeviceInventory inventory;
    MainConsoleTable table(DeviceClass::Camera);
    prepare(table);
    table.setInventory(&inventory);
    const auto snapshot = std::make_shared<const DeviceSnapshot>(records);
    inventory.replace(snapshot, {});
    table.refill();
    double turn = 0;
    finishFill(table, turn);
    const auto step = [&](const char *what, const char *limit, const std::function<void()> &work) {
        const double time = milliseconds([&] {
            work();
            table.viewport()->repaint();
        });
        std::printf("%-22s %7d  %9.2f ms   %s\n", what, snapshot->size(), time, limit);
    };
    for (const char *text : {"g", "gate-4", "gate-49 10.0.0.0/8", "1A07"})
        step(qPrintable(QStringLiteral("search \"%1\"").arg(text)), "at most 50 ms", [&] {
            table.setSearch(DeviceSearch(QString::fromLatin1(text), {{"SR1", "Hall"}}));
        });
    step("clear search", "at most 50 ms", [&] { table.setSearch({}); });
    step("site switch", "at most 100 ms", [&] { table.setSite(QStringLiteral("SR1")); });
    step("site switch back", "at most 100 ms", [&] { table.setSite(Sites::overviewId); });
    step("select all", "at most 50 ms", [&] { table.selectAll(); });
    QByteArray lines;
    const double exported =
        milliseconds([&] { lines = DeviceExport::text(*snapshot, table.shownDevices()); });
    std::printf("%-22s %7d  %9.2f ms   at most 1000 ms, on a runner\n", "export", snapshot->size(), exported);
}

void measureSites() {
    JSON records = JSON::array();
    for (int i = 0; i < 2000; ++i)
        records.push_back({{"siteid", "SR" + std::to_string(i)},
                           {"parentid", i % 5 == 0 ? "SR000000000000" : "SR" + std::to_string(i - 1)},
                           {"sitename", "Site " + std::to_string(i)}});
    SiteTree tree;
    tree.resize(250, 700);
    tree.show();
    QApplication::processEvents();
    Sites::List sites;
    const double parsed = milliseconds([&] { sites = Sites::parse(records); });
    const double shown = milliseconds([&] {
        tree.setSites(sites);
        tree.viewport()->repaint();
    });
    std::printf("%-22s %7zu  %9.2f ms   at most 200 ms (read on a runner in %.2f ms)\n", "sites",
                sites.size(), shown, parsed);
}

void measure(int devices) {
    const std::vector<DeviceRecordPtr> records = makeRecords(devices);
    const double plainFill = median([&] { return fillPlainWidget(records); });
    std::vector<Times> ours;
    std::vector<Times> bare;
    for (int i = 0; i < rounds; ++i) {
        ours.push_back(measureDeviceTable(records));
        bare.push_back(measureArrayModel(records));
    }
    const auto middle = [](const std::vector<Times> &all, double Times::*member) {
        std::vector<double> values;
        for (const Times &times : all)
            values.push_back(times.*member);
        std::sort(values.begin(), values.end());
        return values[values.size() / 2];
    };
    row("fill", devices, middle(ours, &Times::fill), "(a) setItem", plainFill, "at most 0.7");
    row("IP sort", devices, middle(ours, &Times::sort), "(b) array model", middle(bare, &Times::sort),
        "at most 4");
    row("poll, a tenth changes", devices, middle(ours, &Times::poll), "(b) array model",
        middle(bare, &Times::poll), "at most 3, and 16 ms");
    std::printf("%-22s %7d  %9.2f ms   of the event loop while filling\n", "longest turn", devices,
                middle(ours, &Times::maxTurn));
    measureUse(records);
}

} // namespace

int main(int argc, char *argv[]) {
    QApplication application(argc, argv);
    QApplication::setStyle(QStringLiteral("Fusion"));
    Theme::installFonts();
    application.setStyleSheet(Theme::styleSheet());
    QStringList sizes = QCoreApplication::arguments().mid(1);
    if (sizes.isEmpty())
        sizes = {QStringLiteral("1000"), QStringLiteral("10000"), QStringLiteral("50000")};
    for (const QString &size : sizes)
        measure(size.toInt());
    measureSites();
}
