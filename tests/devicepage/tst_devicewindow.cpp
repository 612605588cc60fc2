#include "api/client/apiclient.h"
#include "devices/page/devicesiteactions.h"
#include "devices/page/mainconsolemenu.h"
#include "devices/page/noticebar.h"
#include "store/storewriter.h"
#include "support/consolefixture.h"
#include "support/testmain.h"
#include "tasks/service/retryregistry.h"
#include "tasks/service/taskinfopool.h"
#include "widgets/controls/countedtabwidget.h"
#include "widgets/dialogs/confirmdialog.h"

#include <QAction>
#include <QCheckBox>
#include <QClipboard>
#include <QFileDialog>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QSignalSpy>
#include <QToolButton>

#include <nlohmann/json.hpp>

#include <algorithm>

class TestDeviceWindow : public QObject, private ConsoleFixture {
    Q_OBJECT

private slots:
    void init() { open(); }
    void cleanup() { close(); }

    void showsTheInventory() {
        QCOMPARE(shownPage(), QStringLiteral("loadingPage"));
        workOn(20);
        QCOMPARE(shownPage(), QStringLiteral("cameraTable"));
        auto *tabs = m_window->findChild<CountedTabWidget *>("deviceTabs");
        const std::pair<const char *, const char *> expected[] = {
            {"Camera", "cameraTable"}, {"NVR", "nvrTable"}, {"Others", "othersTable"}};
        for (int i = 0; i < 3; ++i) {
            QCOMPARE(tabs->tabText(i), QString::fromLatin1(expected[i].first));
            QCOMPARE(tabs->tabBar()->tabData(i).toString(),
                     QString::number(table(expected[i].second)->rowCount()));
        }
        const int cameras = table("cameraTable")->rowCount();
        QVERIFY(cameras > 1);
        QTest::mouseClick(table("cameraTable")->viewport(), Qt::LeftButton, {}, QPoint(30, 18));
        QCOMPARE(m_window->selectedDevices().size(), std::size_t(1));
        QCOMPARE(m_window->findChild<QLabel *>("selectionLabel")->text(),
                 QStringLiteral("1 of %1 device(s) selected").arg(cameras));
        QTest::keyClick(table("cameraTable"), Qt::Key_A, Qt::ControlModifier);
        QCOMPARE(m_window->selectedDevices().size(), std::size_t(cameras));
        tabs->setCurrentIndex(1);
        QCOMPARE(m_window->selectedDevices().size(), std::size_t(0));
    }

    void siteChoosesDevices() {
        workOn(60);
        auto *tree = m_window->findChild<SiteTree *>();
        QStringList sites;
        int inSites = 0;
        for (QTreeWidgetItemIterator it(tree); *it; ++it) {
            const QVariant id = (*it)->data(0, SiteTree::siteIdRole);
            if (!id.isNull() && id.toString() != Sites::overviewId)
                sites.append(id.toString());
        }
        QCOMPARE(sites.size(), 5);
        for (const QString &site : sites) {
            clickSite(site);
            QCOMPARE(QString::number(rowsOfAllTables()),
                     tree->currentItem()->data(0, SiteTree::countRole).toString());
            inSites += rowsOfAllTables();
            table("cameraTable")->selectAll();
            for (const DeviceRecordPtr &device : m_window->selectedDevices())
                QVERIFY2(device->siteIds.contains(site), qPrintable(device->id));
        }
        QVERIFY2(inSites > 0, "no device is in any site");
        clickSite(Sites::overviewId);
        QCOMPARE(rowsOfAllTables(), 60);
    }

    void emptyPageTellsWhatToDo() {
        workOn(0);
        QTRY_COMPARE(shownPage(), QStringLiteral("emptyPage"));
        const auto *page = m_window->findChild<QTabWidget *>("deviceTabs")
                               ->currentWidget()
                               ->findChild<QWidget *>("emptyPage");
        const auto *hint = page->findChild<QLabel *>("siteHintLabel");
        const QList<QLabel *> labels = page->findChildren<QLabel *>();
        QVERIFY(std::any_of(labels.begin(), labels.end(), [](const QLabel *label) {
            return label->isVisible() && label->text() == "No Device";
        }));
        QVERIFY(!hint->isVisible());
        const auto *tree = m_window->findChild<SiteTree *>();
        clickSite(
            tree->topLevelItem(tree->topLevelItemCount() - 1)->data(0, SiteTree::siteIdRole).toString());
        QCOMPARE(shownPage(), QStringLiteral("emptyPage"));
        QVERIFY(hint->isVisible());
        QCOMPARE(hint->text(), QStringLiteral("Drag devices from the \"Device Overview\""));
    }

    void selectionsInSeveralTabsFollowAShorterList() {
        workOn(60);
        auto *tabs = m_window->findChild<CountedTabWidget *>("deviceTabs");
        const auto ids = [](const MainConsoleTable *from) {
            QStringList all;
            for (int row = 0; row < from->rowCount(); ++row)
                all += from->item(row, 0)->data(MainConsoleTable::deviceIdRole).toString();
            return all;
        };
        const auto selected = [this] {
            QStringList all;
            for (const DeviceRecordPtr &device : m_window->selectedDevices())
                all += device->id;
            return all;
        };
        table("cameraTable")->selectAll();
        tabs->setCurrentIndex(1);
        table("nvrTable")->selectAll();
        const QStringList cameras = ids(table("cameraTable"));
        QVERIFY(table("nvrTable")->rowCount() > 0 && cameras.size() > 3);
        // What stands behind the devices that go has a place beyond the end of the shorter list.
        for (const QString &id : cameras.mid(1))
            tell("remove " + id);
        m_window->reload();
        QTRY_COMPARE(table("cameraTable")->rowCount(), 1);
        QCOMPARE(selected(), ids(table("nvrTable")));
        // Operations go by the rows as they are sorted now.
        for (int clicks = 0; clicks < 2; ++clicks)
            emit table("nvrTable")->horizontalHeader()->sectionClicked(3);
        QCOMPARE(selected(), ids(table("nvrTable")));
        m_window->stopWork();
        QCOMPARE(selected(), QStringList());
    }

    void restartRunsAsATaskThatCanBeRepeated() {
        workOn(20);
        tell("task-pace 50");
        QToolButton *restart = m_window->findChild<QToolButton *>("restartButton");
        QVERIFY(!restart->isEnabled());
        QTest::mouseClick(table("cameraTable")->viewport(), Qt::LeftButton, {}, QPoint(30, 18));
        const QString id = m_window->selectedDevices().at(0)->id;
        restart->click();
        QTRY_VERIFY(QApplication::activeModalWidget());
        QTest::keyClick(QApplication::activeModalWidget(), Qt::Key_Return);
        CTaskInfoPool &pool = CTaskInfoPool::instance();
        QTRY_COMPARE_WITH_TIMEOUT(pool.taskList()->records().size(), 1u, patienceMs);
        const QString tid = pool.taskList()->records()[0]->tid;
        QCOMPARE(pool.taskList()->records()[0]->type, QStringLiteral("deviceRestart"));
        QTRY_VERIFY_WITH_TIMEOUT(pool.taskList()->find(tid)->isFinal(), patienceMs);
        QVERIFY(RetryRegistry::instance().find(tid));
        RetryRegistry::instance().find(tid)->again({id});
        QTRY_COMPARE_WITH_TIMEOUT(pool.taskList()->records().size(), 2u, patienceMs);
        QCOMPARE(pool.taskList()->records()[0]->devices[0].target->id, id);
        // From now on the second one is the one to repeat.
        const QString next = pool.taskList()->records()[0]->tid;
        QTRY_VERIFY(RetryRegistry::instance().find(next));
        QVERIFY(!RetryRegistry::instance().find(tid));

        QSignalSpy message(m_window.get(), &DeviceWindow::onShowAnimatedMsgDlg);
        tell("fault code=5@/v1/task/init");
        RetryRegistry::instance().find(next)->again({id});
        QTRY_COMPARE_WITH_TIMEOUT(message.size(), 1, patienceMs);
        QCOMPARE(message[0][0].toString(),
                 QStringLiteral("Restart Device could not be started: the server refused it."));
    }

    void searchAndChipsFilterTheTables() {
        workOn(20);
        auto *search = m_window->findChild<QLineEdit *>("deviceSearchEdit");
        MainConsoleTable *cameras = table("cameraTable");
        const int all = cameras->rowCount();
        const QString ip = cameras->item(2, 3)->text();
        const QString id = cameras->item(2, 0)->data(MainConsoleTable::deviceIdRole).toString();
        m_window->setFocus();
        QTest::keySequence(m_window.get(), QKeySequence::Find);
        QVERIFY(search->hasFocus());
        QTest::keyClicks(search, ip + "/32");
        QCOMPARE(cameras->rowCount(), 1);
        QCOMPARE(cameras->item(0, 3)->text(), ip);
        QVERIFY(m_window->findChild<QLabel *>("selectionLabel")->text().contains(QString::number(all)));
        QTest::keyClicks(search, " nothing");
        QCOMPARE(shownPage(), QStringLiteral("noMatchPage"));
        QTest::mouseClick(visibleButton("clearFilterButton"), Qt::LeftButton);
        QCOMPARE(cameras->rowCount(), all);
        // A device that somebody points at is shown whatever hides it.
        QTest::keyClicks(search, "nothing");
        m_window->selectDevice(id, {});
        QCOMPARE(m_window->selectedDevices().size(), 1u);
        QCOMPARE(m_window->selectedDevices().front()->id, id);
        QCOMPARE(cameras->rowCount(), all);

        tell("drop 1");
        auto *chip = m_window->findChild<QToolButton *>("unreachableChip");
        const int away = chip->text().section(' ', 0, 0).toInt();
        QTest::mouseClick(chip, Qt::LeftButton);
        QTRY_COMPARE_WITH_TIMEOUT(cameras->rowCount() + table("nvrTable")->rowCount() +
                                      table("othersTable")->rowCount(),
                                  away + 1, patienceMs);
        const auto *selection = m_window->findChild<QLabel *>("selectionLabel");
        for (int row = 0; row < 2; ++row) {
            QVERIFY2(selection->text().contains(QStringLiteral(" of %1 ").arg(cameras->rowCount())),
                     qPrintable(selection->text()));
            const int shown = cameras->rowCount();
            tell("status " + id + (row == 0 ? " Authorized Unreachable -" : " Authorized Connected -"));
            QTRY_COMPARE_WITH_TIMEOUT(cameras->rowCount(), shown + (row == 0 ? 1 : -1), patienceMs);
        }
        QVERIFY(selection->text().contains(QStringLiteral(" of %1 ").arg(cameras->rowCount())));
        QTest::mouseClick(chip, Qt::LeftButton);
        QCOMPARE(cameras->rowCount(), all);
    }

    void searchFollowsTheNamesOfSites() {
        workOn(60);
        m_window->findChild<QLineEdit *>("deviceSearchEdit")->setText("Zebra");
        QCOMPARE(rowsOfAllTables(), 0);
        QString site;
        for (int i = 0; i < m_window->devices()->size() && site.isEmpty(); ++i) {
            for (const QString &each : m_window->devices()->at(i)->siteIds)
                site = each == Sites::overviewId ? site : each;
        }
        QVERIFY(!site.isEmpty());
        onService([&](CApiClient &client) {
            return client.commitSites(JSON::array({{{"siteid", site.toStdString()},
                                                    {"parentid", Sites::rootId.toStdString()},
                                                    {"sitename", "Zebra house"}}}),
                                      "all");
        });
        m_window->reload();
        QTRY_COMPARE(rowsOfAllTables(), m_window->devices()->siteCount(site));
    }

    void certificatesNeedNoSelection() {
        workOn(20);
        const auto entry = [this](const char *name) { return m_window->findChild<QAction *>(name); };
        QVERIFY(m_window->findChild<QToolButton *>("uploadButton")->isEnabled());
        QVERIFY(entry("certificateListAction")->isEnabled());
        QVERIFY(!entry("uploadFirmwareAction")->isEnabled() && !entry("uploadHttpsAction")->isEnabled());
        table("cameraTable")->selectRow(0);
        QVERIFY(entry("uploadFirmwareAction")->isEnabled() && entry("uploadHttpsAction")->isEnabled());
        table("cameraTable")->clearSelection();
        QVERIFY(entry("certificateListAction")->isEnabled() && !entry("uploadHttpsAction")->isEnabled());
        m_window->stopWork();
        QVERIFY(!m_window->findChild<QToolButton *>("uploadButton")->isEnabled());
    }

    void buttonsWithoutUseGiveWayFirst() {
        const auto button = [this](const char *name) { return m_window->findChild<QToolButton *>(name); };
        const std::vector<const char *> planned{"setConfigurationButton", "backupConfigurationButton",
                                                "replaceButton"};
        for (const char *name : planned)
            QVERIFY(!button(name)->toolTip().isEmpty());
        int width = 1280;
        for (; button("replaceButton")->isVisible() && width > 600; width -= 10)
            m_window->resize(width, 720);
        QVERIFY(button("deleteButton")->isVisible() && button("exportButton")->isVisible());
        for (; button("deleteButton")->isVisible() && width > 600; width -= 10)
            m_window->resize(width, 720);
        for (const char *name : planned)
            QVERIFY(!button(name)->isVisible());
        QVERIFY(button("exportButton")->isVisible());
        QMenu *more = button("moreButton")->menu();
        more->popup({});
        QCOMPARE(more->actions().size(), qsizetype(planned.size() + 1));
        QCOMPARE(more->actions().front()->toolTip(), button("replaceButton")->toolTip());
        more->close();
        const QMenu *upload = button("uploadButton")->menu();
        QCOMPARE(upload->actions().constLast()->menu()->actions().size(), 2);
    }

    void deletedDevicesAreGoneFromTheService() {
        workOn(20);
        MainConsoleTable *cameras = table("cameraTable");
        QTest::mouseClick(cameras->viewport(), Qt::LeftButton, {}, QPoint(30, 18));
        QTest::mouseClick(cameras->viewport(), Qt::LeftButton, Qt::ShiftModifier, QPoint(30, 3 * 36 - 10));
        QCOMPARE(m_window->selectedDevices().size(), 3u);
        QTest::keySequence(cameras, QKeySequence::Copy);
        const QString copied = QGuiApplication::clipboard()->text();
        QCOMPARE(copied.count('\n'), 3);
        QVERIFY(copied.startsWith("Status\tModel\t"));

        QSignalSpy message(m_window.get(), &DeviceWindow::onShowAnimatedMsgDlg);
        tell("fault code=5@/v1/dev/commit,times=1");
        for (const int rows : {20, 17}) {
            QTest::keyClick(cameras, Qt::Key_Delete);
            QTRY_VERIFY(QApplication::activeModalWidget());
            QCOMPARE(QApplication::activeModalWidget()->windowTitle(),
                     QStringLiteral("Delete Device(s) from Device Overview"));
            message.clear();
            QTest::keyClick(QApplication::activeModalWidget(), Qt::Key_Return);
            QTRY_VERIFY_WITH_TIMEOUT(!message.isEmpty(), patienceMs);
            QCOMPARE(message[0][1].value<TransientMessage::Kind>(),
                     rows == 20 ? TransientMessage::Kind::Error : TransientMessage::Kind::Success);
            QTRY_COMPARE_WITH_TIMEOUT(rowsOfAllTables(), rows, patienceMs);
        }
        QCOMPARE(message[0][0].toString(), QStringLiteral("3 device(s) deleted."));
    }

    void questionsAreAnsweredForWhatIsStillThere() {
        workOn(20);
        MainConsoleTable *cameras = table("cameraTable");
        cameras->selectRow(0);
        cameras->selectionModel()->select(cameras->model()->index(1, 0),
                                          QItemSelectionModel::Select | QItemSelectionModel::Rows);
        const auto selected = m_window->selectedDevices();
        QCOMPARE(selected.size(), 2u);
        QTest::keyClick(cameras, Qt::Key_Delete);
        QTRY_VERIFY(visible<ConfirmDialog>());
        tell("remove " + selected[0]->id);
        m_window->reload();
        QTRY_COMPARE(rowsOfAllTables(), 19);
        QSignalSpy message(m_window.get(), &DeviceWindow::onShowAnimatedMsgDlg);
        visible<ConfirmDialog>()->findChild<QPushButton *>("acceptButton")->click();
        QTRY_COMPARE_WITH_TIMEOUT(rowsOfAllTables(), 18, patienceMs);
        QCOMPARE(
            message[0][0].toString(),
            QStringLiteral("1 device(s) deleted. Left out: 1 device(s) that the server does not manage any "
                           "more."));
    }

    void whatOthersChangedIsKept() {
        workOn(20);
        QStringList sites;
        for (QTreeWidgetItemIterator it(m_window->findChild<SiteTree *>()); *it; ++it)
            sites += (*it)->data(0, SiteTree::siteIdRole).toString();
        sites = sites.filter("SR");
        QVERIFY(sites.size() > 2);
        const QString id = m_window->devices()->at(0)->id;
        const auto siteIds = [&] {
            JSON devices;
            onService([&](CApiClient &client) { return client.listDevices(0, 500, devices); });
            for (const JSON &each : devices) {
                if (stringMember(each, "id") == id)
                    return DeviceRecords::parse(each)->siteIds;
            }
            return QStringList();
        };
        const auto putByAnother = [&](const QStringList &into) {
            JSON ids = JSON::array({Sites::overviewId.toStdString()});
            for (const QString &site : into)
                ids.push_back(site.toStdString());
            onService([&](CApiClient &client) {
                return client.commitDevices(JSON::array({{{"id", id.toStdString()}, {"siteid", ids}}}),
                                            "all");
            });
        };
        QSignalSpy message(m_window.get(), &DeviceWindow::onShowAnimatedMsgDlg);
        auto *placement = m_window->findChild<DeviceSiteActions *>();
        // Right before each, so that no reading of the console has seen it.
        putByAnother({sites[0]});
        placement->drop(sites[1], {id}, Qt::CopyAction, Sites::overviewId);
        QTRY_COMPARE(message.size(), 1);
        QCOMPARE(siteIds(), (QStringList{Sites::overviewId, sites[0], sites[1]}));
        putByAnother({sites[1], sites[2]});
        placement->askToRemove({id}, sites[1]);
        QTRY_VERIFY(visible<ConfirmDialog>());
        visible<ConfirmDialog>()->findChild<QPushButton *>("acceptButton")->click();
        QTRY_COMPARE(message.size(), 2);
        QCOMPARE(siteIds(), (QStringList{Sites::overviewId, sites[2]}));
        // Nothing is sent on old records.
        tell("fault code=5@/v1/dev/list,times=1");
        placement->drop(sites[0], {id}, Qt::CopyAction, Sites::overviewId);
        QTRY_COMPARE(message.size(), 3);
        QCOMPARE(message[2][0].toString(),
                 QStringLiteral(
                     "Putting devices into the site failed: the server refused it. Nothing was changed."));
        QCOMPARE(siteIds(), (QStringList{Sites::overviewId, sites[2]}));
    }

    void exportWritesTheShownRows() {
        // The system's own dialogs take no answers from here.
        QCoreApplication::setAttribute(Qt::AA_DontUseNativeDialogs);
        workOn(20);
        MainConsoleTable *cameras = table("cameraTable");
        emit cameras->horizontalHeader()->sectionClicked(3);
        m_window->findChild<QAction *>("exportDeviceListAction")->trigger();
        auto *dialog = m_window->findChild<QFileDialog *>("saveFileDialog");
        QVERIFY(dialog);
        QCOMPARE(dialog->windowTitle(), QStringLiteral("Save as"));
        dialog->selectFile(m_service.root().filePath("list"));
        QMetaObject::invokeMethod(dialog, "accept");
        const auto lines = [this] {
            return QString::fromUtf8(m_service.root().read("list.csv")).split('\n');
        };
        QTRY_COMPARE(lines().size(), cameras->rowCount() + 2);
        QCOMPARE(lines()[1].section(',', 2, 2), cameras->item(0, 3)->text());
        QTRY_COMPARE(CLocalStore::instance().defaultFilePath(), m_service.root().path());
    }

    void siteChangesAreSentWhenApplied() {
        workOn(20);
        auto *tree = m_window->findChild<SiteTree *>();
        auto *notice = m_window->findChild<NoticeBar *>();
        QTest::mouseClick(tree->findChild<QToolButton *>("addTopSiteButton"), Qt::LeftButton);
        auto *editor = tree->findChild<QLineEdit *>();
        QVERIFY(editor);
        QTest::keyClicks(editor, "Annex");
        QTest::keyClick(editor, Qt::Key_Return);
        QVERIFY(notice->isVisible());
        QVERIFY(m_window->hasPendingEdits());
        onService([](CApiClient &client) {
            std::string id;
            return client.addSite("Of another client", nullptr, id);
        });

        QSignalSpy message(m_window.get(), &DeviceWindow::onShowAnimatedMsgDlg);
        tell("fault code=3@/v1/site/commit,times=1");
        auto *apply = notice->findChild<QPushButton *>("noticeApplyButton");
        // Not by the mouse: the first refresh may be in front of the window by now.
        apply->click();
        apply->click();
        QTRY_COMPARE_WITH_TIMEOUT(message.size(), 1, patienceMs);
        QVERIFY2(notice->isVisible(), "a refused change is still there");
        apply->click();
        QTRY_VERIFY_WITH_TIMEOUT(!notice->isVisible(), patienceMs);
        JSON sites;
        onService([&](CApiClient &client) { return client.listSites(0, 500, sites); });
        const std::string all = dumpJson(sites);
        QVERIFY(all.find("Annex") != std::string::npos);
        QVERIFY(all.find("Of another client") != std::string::npos);
        QVERIFY(QTest::qWaitFor(
            [&] { return tree->findItems("Of another client", Qt::MatchExactly).size() == 1; }, patienceMs));
    }

    void columnsAreKept() {
        workOn(20);
        const auto hidden = [this] { return table("cameraTable")->isColumnHidden(2); };
        QTest::mouseClick(m_window->findChild<QToolButton *>("columnsButton"), Qt::LeftButton);
        auto *menu = m_window->findChild<MainConsoleMenu *>();
        QVERIFY(menu->isVisible());
        QTest::mouseClick(menu->findChild<QCheckBox *>("columnCheckBox2"), Qt::LeftButton, {}, QPoint(8, 8));
        QVERIFY(hidden());
        menu->close();
        // Ended at once, the program still knows next time.
        m_window.reset();
        StoreWriter::flush();
        open();
        QVERIFY(table("cameraTable")->isColumnHidden(2));
        m_window->startWork();
        QTRY_COMPARE(rowsOfAllTables(), 20);

        QTest::mouseClick(m_window->findChild<QToolButton *>("columnsButton"), Qt::LeftButton);
        menu = m_window->findChildren<MainConsoleMenu *>().constLast();
        const QHeaderView *header = table("cameraTable")->horizontalHeader();
        for (const int left : {0, header->count()}) { // all were not shown, so they are shown first
            menu->findChild<QCheckBox *>("columnCheckBoxAll")->click();
            QCOMPARE(header->hiddenSectionCount(), left);
        }
        for (const int left : {header->count() - 1, header->count()}) {
            menu->findChild<QCheckBox *>("columnCheckBox3")->click();
            QCOMPARE(header->hiddenSectionCount(), left);
        }
        menu->close();
        m_window->selectDevice(m_window->devices()->at(3)->id, {});
        QCOMPARE(m_window->selectedDevices().size(), 1u);
        table("cameraTable")->resetColumns();
        QVERIFY(!hidden());
        QCOMPARE(header->hiddenSectionCount(), 0);
        QVERIFY(table("cameraTable")->columnWidth(0) > 20 && header->height() > 10);
    }
};

NVLDM_TEST(TestDeviceWindow)
#include "tst_devicewindow.moc"
