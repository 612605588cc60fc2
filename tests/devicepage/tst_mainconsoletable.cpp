#include "devices/page/mainconsoletable.h"
#include "support/devicemaker.h"
#include "support/testmain.h"

#include <QHeaderView>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTest>

#include <algorithm>

namespace {

constexpr int rows = 200;
constexpr auto ipColumn = static_cast<int>(DeviceColumn::Ip);
constexpr auto hostColumn = static_cast<int>(DeviceColumn::HostName);

QString idAt(const MainConsoleTable &table, int row) {
    return table.cellData(row, 0, MainConsoleTable::deviceIdRole).toString();
}

int rowOf(const MainConsoleTable &table, const QString &id) {
    for (int row = 0; row < table.rowCount(); ++row) {
        if (idAt(table, row) == id)
            return row;
    }
    return -1;
}

void clickHeader(const QTableWidget &table, int column) {
    const QHeaderView *header = table.horizontalHeader();
    QTest::mouseClick(header->viewport(), Qt::LeftButton, {},
                      QPoint(header->sectionViewportPosition(column) + 12, header->height() / 2));
}

} // namespace

class TestMainConsoleTable : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_inventory = std::make_unique<DeviceInventory>();
        m_table = std::make_unique<MainConsoleTable>(DeviceClass::Camera);
        m_table->setInventory(m_inventory.get());
        m_table->resize(900, 400);
        m_table->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_table.get()));
    }

    void cleanup() {
        m_table.reset();
        m_inventory.reset();
    }

    void cellsShowTheRecord() {
        m_inventory->replace(DeviceMaker::snapshot({DeviceMaker::camera(7), DeviceMaker::record(8)}),
                             {DeviceStatusCode::Authorized, static_cast<DeviceStatusCode>(99)});
        m_table->refill();
        QTRY_VERIFY(m_table->item(1, deviceColumnCount - 1));
        QCOMPARE(m_table->item(0, 0)->text(), QStringLiteral("  Authorized"));
        QVERIFY(!m_table->item(0, 0)->icon().isNull());
        QCOMPARE(m_table->item(0, ipColumn)->text(), QStringLiteral("10.0.0.7"));
        QCOMPARE(m_table->item(0, hostColumn)->text(), QStringLiteral("host-99992"));
        QVERIFY(m_table->item(0, ipColumn)->icon().isNull());
        QCOMPARE(m_table->item(1, 0)->text(), QStringLiteral("  "));
        QVERIFY(m_table->item(1, 0)->icon().isNull());
        for (int column = 1; column < deviceColumnCount; ++column)
            QCOMPARE(m_table->item(1, column)->text(), QStringLiteral("--"));
        QCOMPARE(idAt(*m_table, 1), QStringLiteral("DV8"));
    }

    void headerClickSorts() {
        show({DeviceMaker::record(0, {{"d_ip", "10.0.0.10"}}), DeviceMaker::record(1),
              DeviceMaker::record(2, {{"d_ip", "9.255.255.255"}}),
              DeviceMaker::record(3, {{"d_ip", "10.0.0.9"}})});
        const auto shown = [this] {
            QStringList ids;
            for (int row = 0; row < m_table->rowCount(); ++row)
                ids.append(idAt(*m_table, row));
            return ids.join(u' ');
        };
        QCOMPARE(shown(), QStringLiteral("DV0 DV1 DV2 DV3"));
        clickHeader(*m_table, ipColumn);
        QCOMPARE(shown(), QStringLiteral("DV2 DV3 DV0 DV1"));
        QVERIFY(m_table->horizontalHeader()->isSortIndicatorShown());
        QCOMPARE(m_table->horizontalHeader()->sortIndicatorSection(), ipColumn);
        clickHeader(*m_table, ipColumn);
        QCOMPARE(shown(), QStringLiteral("DV0 DV3 DV2 DV1"));
        QCOMPARE(m_table->horizontalHeader()->sortIndicatorOrder(), Qt::DescendingOrder);
        // A new reading comes in the order that was asked for.
        show({DeviceMaker::record(4, {{"d_ip", "9.0.0.1"}}), DeviceMaker::record(5, {{"d_ip", "11.0.0.1"}})});
        QCOMPARE(shown(), QStringLiteral("DV5 DV4"));
    }

    void placeSurvives_data() {
        QTest::addColumn<int>("topRow");
        QTest::addColumn<QString>("change");
        for (const int topRow : {35, rows - 12}) {
            for (const char *change :
                 {"nothing", "other order", "rows removed in front", "rows added in front",
                  "many rows added in front", "rows added behind", "sorted", "states"})
                QTest::addRow("row %d on top, %s", topRow, change) << topRow << QString::fromLatin1(change);
        }
    }
    void placeSurvives() {
        QFETCH(int, topRow);
        QFETCH(QString, change);
        show(DeviceMaker::cameras(1000, 1000 + rows));
        m_table->setCurrentCell(topRow + 3, hostColumn);
        const QStringList chosen = {"DV1020", "DV1150", idAt(*m_table, topRow + 3),
                                    idAt(*m_table, topRow + 4)};
        select(chosen);
        m_table->verticalScrollBar()->setValue(topRow * m_table->rowHeight(0) + 10);
        const QStringList selected = selectedIds();
        const QString current = idAt(*m_table, m_table->currentRow());
        const QString top = idAt(*m_table, m_table->rowAt(0));
        const int offset = topOffset();
        QCOMPARE(selected.size(), chosen.size());
        QCOMPARE(offset, -10);
        QSignalSpy changed(m_table.get(), &MainConsoleTable::selectedDevicesChanged);

        std::vector<JSON> records = DeviceMaker::cameras(1000, 1000 + rows);
        if (change == QLatin1String("other order"))
            std::rotate(records.begin(), records.begin() + 15, records.end());
        else if (change == QLatin1String("rows removed in front"))
            records.erase(records.begin(), records.begin() + 10);
        else if (change == QLatin1String("rows added in front"))
            records = DeviceMaker::cameras(995, 1000 + rows);
        else if (change == QLatin1String("many rows added in front"))
            records = DeviceMaker::cameras(500, 1000 + rows);
        else if (change == QLatin1String("rows added behind"))
            records = DeviceMaker::cameras(1000, 1400);
        if (change == QLatin1String("sorted")) {
            clickHeader(*m_table, hostColumn);
            QCOMPARE(idAt(*m_table, 0), QStringLiteral("DV1199"));
        } else if (change == QLatin1String("states")) {
            m_inventory->apply({m_inventory->snapshot(), {{topRow, DeviceStatusCode::Unreachable}}, {}});
            m_table->refreshStatus();
        } else {
            show(records);
        }
        QCOMPARE(selectedIds(), selected);
        QCOMPARE(changed.size(), 0);
        QCOMPARE(idAt(*m_table, m_table->currentRow()), current);
        QCOMPARE(m_table->currentColumn(), hostColumn);
        // At the ends of the table there is no room to scroll as far.
        if (rowOf(*m_table, top) + 11 < m_table->rowCount()) {
            QCOMPARE(idAt(*m_table, m_table->rowAt(0)), top);
            QCOMPARE(topOffset(), offset);
        }
    }

    void vanishedDeviceLeavesTheSelection() {
        show(DeviceMaker::cameras(0, 10));
        m_table->setCurrentCell(4, 0);
        select({"DV4", "DV7"});
        QSignalSpy changed(m_table.get(), &MainConsoleTable::selectedDevicesChanged);
        std::vector<JSON> records = DeviceMaker::cameras(0, 10);
        records.erase(records.begin() + 4);
        show(records);
        QCOMPARE(selectedIds(), QStringList{"DV7"});
        QCOMPARE(changed.size(), 1);
        QCOMPARE(idAt(*m_table, m_table->currentRow()), QString());
        show({});
        QCOMPARE(selectedIds(), QStringList());
        QCOMPARE(changed.size(), 2);
        QCOMPARE(m_table->rowCount(), 0);
    }

    void stateChangeShowsAndSorts() {
        show(DeviceMaker::cameras(0, 3));
        const QTableWidgetItem *item = m_table->item(1, 0);
        m_inventory->apply({m_inventory->snapshot(), {{1, DeviceStatusCode::Maintaining}}, {}});
        m_table->refreshStatus();
        QCOMPARE(item->text(), QStringLiteral("  Maintaining..."));
        QCOMPARE(m_table->item(0, 0)->text(), QStringLiteral("  Unauthorized"));
        clickHeader(*m_table, 0);
        select({"DV0"});
        m_inventory->apply({m_inventory->snapshot(), {{0, DeviceStatusCode::AccountBlocked}}, {}});
        m_table->refreshStatus();
        QCOMPARE(idAt(*m_table, 2), QStringLiteral("DV0"));
        QCOMPARE(m_table->item(2, 0)->text(), QStringLiteral("  Account Blocked"));
        QCOMPARE(selectedIds(), QStringList{"DV0"});
    }

    void itemsAreThereForTheRowsInViewAndForAScreenReader() {
        show(DeviceMaker::cameras(0, 5000));
        const auto itemCount = [this] {
            int count = 0;
            for (int row = 0; row < m_table->rowCount(); ++row) {
                for (int column = 0; column < deviceColumnCount; ++column)
                    count += m_table->item(row, column) ? 1 : 0;
            }
            return count;
        };
        QVERIFY(itemCount() < 300 * deviceColumnCount);
        for (const int top : {4900, 0, 2500}) {
            m_table->verticalScrollBar()->setValue(top * m_table->rowHeight(0));
            QTRY_VERIFY(m_table->item(m_table->rowAt(0), ipColumn));
            const int last = m_table->rowAt(m_table->viewport()->height() - 1);
            QCOMPARE(m_table->item(last, hostColumn)->text(), QStringLiteral("host-%1").arg(99999 - last));
            QVERIFY(itemCount() < 300 * deviceColumnCount);
        }
        // Typed letters find rows without items as well.
        m_table->setCurrentCell(10, hostColumn);
        m_table->keyboardSearch(QStringLiteral("HOST-95"));
        QCOMPARE(idAt(*m_table, m_table->currentRow()), QStringLiteral("DV4000"));
        QAccessible::setActive(true);
        QTRY_COMPARE(itemCount(), 5000 * deviceColumnCount);
        QCOMPARE(m_table->model()->index(4999, ipColumn).data().toString(), QStringLiteral("10.0.19.249"));
        // Less and more again: the items that stayed answer for their new devices.
        show(DeviceMaker::cameras(100, 200));
        show(DeviceMaker::cameras(0, 1000));
        QTRY_COMPARE(itemCount(), 1000 * deviceColumnCount);
        QCOMPARE(m_table->item(999, 0)->data(MainConsoleTable::deviceIdRole).toString(),
                 QStringLiteral("DV999"));
        QAccessible::setActive(false);
    }

private:
    void show(const std::vector<JSON> &records) {
        m_inventory->replace(DeviceMaker::snapshot(records), {});
        m_table->refill();
        QTRY_VERIFY(m_table->rowCount() == 0 ||
                    m_table->item(std::max(0, m_table->rowAt(0)), deviceColumnCount - 1));
    }

    void select(const QStringList &ids) {
        m_table->clearSelection();
        for (const QString &id : ids)
            m_table->selectionModel()->select(m_table->model()->index(rowOf(*m_table, id), 0),
                                              QItemSelectionModel::Select | QItemSelectionModel::Rows);
    }

    QStringList selectedIds() const {
        QStringList ids;
        for (const int device : m_table->selectedDevices())
            ids.append(m_inventory->record(device).id);
        QStringList shown;
        for (const QModelIndex &index : m_table->selectionModel()->selectedRows())
            shown.append(idAt(*m_table, index.row()));
        std::sort(ids.begin(), ids.end());
        std::sort(shown.begin(), shown.end());
        return ids == shown ? ids : QStringList{"the rows and the devices differ"};
    }

    int topOffset() const { return m_table->rowViewportPosition(m_table->rowAt(0)); }

    std::unique_ptr<DeviceInventory> m_inventory;
    std::unique_ptr<MainConsoleTable> m_table;
};

NVLDM_TEST(TestMainConsoleTable)
#include "tst_mainconsoletable.moc"
