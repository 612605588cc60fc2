#include "devices/sites/dragtip.h"
#include "devices/sites/sitetree.h"
#include "support/devicemaker.h"
#include "support/testmain.h"
#include "widgets/dialogs/confirmdialog.h"

#include <QAction>
#include <QContextMenuEvent>
#include <QDropEvent>
#include <QLineEdit>
#include <QMenu>
#include <QMimeData>
#include <QPushButton>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTest>
#include <QToolButton>

namespace {

Sites::List sites(const QStringList &words) {
    JSON records = JSON::array();
    for (const QString &word : words)
        records.push_back({{"siteid", word.section(u'<', 0, 0).toStdString()},
                           {"parentid", word.section(u'<', 1).toStdString()},
                           {"sitename", "site " + word.section(u'<', 0, 0).toStdString()}});
    return Sites::parse(records);
}

const QStringList chain{"a<", "b<a", "c<b", "d<c", "e<d", "f<"};

} // namespace

class TestSiteTree : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_tree = std::make_unique<SiteTree>();
        m_tree->setSites(sites(chain));
        m_tree->resize(260, 420);
        m_tree->show();
        m_tree->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(m_tree.get()));
        m_tree->setFocus();
    }
    void cleanup() { m_tree.reset(); }

    void menuFollowsTheDepth_data() {
        QTest::addColumn<QString>("id");
        QTest::addColumn<QString>("enabled");
        QTest::newRow("top level") << "a"
                                   << "Add Site, Edit Site, -";
        QTest::newRow("between") << "d"
                                 << "Add Site, Edit Site, Delete Site";
        QTest::newRow("last level") << "e"
                                    << "-, Edit Site, Delete Site";
        QTest::newRow("overview") << Sites::overviewId << "no menu";
        QTest::newRow("nothing") << ""
                                 << "no menu";
    }
    void menuFollowsTheDepth() {
        QFETCH(QString, id);
        const QMenu *menu = openMenu(id.isEmpty() ? QPoint(100, 400) : place(id));
        QStringList entries;
        for (const QAction *action : menu ? menu->actions() : QList<QAction *>()) {
            QVERIFY(!action->icon().isNull());
            entries.append(action->isEnabled() ? action->text() : QString("-"));
        }
        QTEST(menu ? entries.join(", ") : QString("no menu"), "enabled");
    }

    void addedSiteIsNamedAtOnce() {
        QSignalSpy edited(m_tree.get(), &SiteTree::sitesEdited);
        choose("b", "Add Site");
        QVERIFY(editor());
        QCOMPARE(editor()->text(), QStringLiteral("Site"));
        QTest::keyClicks(editor(), "  Hall 7 ");
        QTest::keyClick(editor(), Qt::Key_Return);
        QTRY_VERIFY(!editor());
        // What is shown stays, with the devices that are selected there.
        QCOMPARE(m_tree->currentSite(), Sites::overviewId);
        QTreeWidgetItem *added = item("b")->child(item("b")->childCount() - 1);
        QCOMPARE(added->text(0), QStringLiteral("Hall 7"));
        QCOMPARE(edited.size(), 2);
        m_tree->setCurrentItem(added);
        m_tree->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(m_tree.get()));
        // F2 opens the editor again; Escape leaves the name as it was, and so does an empty text.
        QSignalSpy refused(m_tree.get(), &SiteTree::editRefused);
        for (const auto &[text, key] : {std::pair{"x", Qt::Key_Escape}, std::pair{" ", Qt::Key_Return}}) {
            QTest::keyClick(m_tree.get(), Qt::Key_F2);
            QTRY_VERIFY(editor());
            QTest::keyClicks(editor(), text);
            QTest::keyClick(editor(), key);
            QTRY_VERIFY(!editor());
            QCOMPARE(m_tree->currentItem()->text(0), QStringLiteral("Hall 7"));
        }
        QCOMPARE(refused.size(), 1);
        QCOMPARE(edited.size(), 2);
    }

    void buttonAddsTopLevelSites() {
        auto *button = m_tree->findChild<QToolButton *>("addTopSiteButton");
        QVERIFY(m_tree->viewport()->rect().contains(button->geometry()));
        QTest::mouseClick(button, Qt::LeftButton);
        QTRY_VERIFY(editor());
        QTest::keyClicks(editor(), "One");
        QTest::mouseClick(button, Qt::LeftButton);
        QCOMPARE(m_tree->topLevelItemCount(), 3 + 4);
        QCOMPARE(m_tree->topLevelItem(5)->text(0), QStringLiteral("One"));
        QCOMPARE(m_tree->topLevelItem(6)->text(0), QStringLiteral("Site"));
    }

    void openEditorSurvivesAReading() {
        m_tree->select("f");
        QTest::keyClick(m_tree.get(), Qt::Key_F2);
        QTRY_VERIFY(editor());
        QTest::keyClicks(editor(), "half a na");
        m_tree->setSites(sites(chain + QStringList{"g<"}));
        QCoreApplication::processEvents();
        QVERIFY(editor());
        QTest::keyClicks(editor(), "me");
        QTest::keyClick(editor(), Qt::Key_Return);
        QTRY_VERIFY(item("g"));
        QCOMPARE(item("f")->text(0), QStringLiteral("half a name"));
        QCOMPARE(m_tree->currentSite(), QStringLiteral("f"));
    }

    void deletionIsConfirmed() {
        m_tree->select("d");
        for (const bool confirmed : {false, true}) {
            choose("c", "Delete Site");
            auto *dialog = m_tree->findChild<ConfirmDialog *>();
            QVERIFY(dialog);
            QCOMPARE(dialog->windowTitle(), QStringLiteral("Delete Site"));
            QTest::mouseClick(dialog->findChild<QPushButton *>(confirmed ? "acceptButton" : "cancelButton"),
                              Qt::LeftButton);
            QTRY_VERIFY(!m_tree->findChild<ConfirmDialog *>());
            QCOMPARE(item("c") != nullptr, !confirmed);
        }
        QVERIFY(!item("d"));
        QCOMPARE(m_tree->currentSite(), QStringLiteral("b"));
        QCOMPARE(m_tree->beginCommit().back().dump(), std::string(R"({"deleted":true,"siteid":"e"})"));
        m_tree->endCommit(true);
        QVERIFY(!m_tree->edits().isDirty());
    }

    void siteMovesByDrag_data() {
        QTest::addColumn<QString>("moved");
        QTest::addColumn<QString>("target");
        QTest::addColumn<int>("offset");     // from the middle of the target's row
        QTest::addColumn<QString>("parent"); // empty when refused
        QTest::newRow("into another") << "d"
                                      << "f" << 0 << "f";
        QTest::newRow("between top-level sites") << "d"
                                                 << "f" << -14 << Sites::rootId;
        QTest::newRow("into its own branch") << "b"
                                             << "d" << 0 << "";
        QTest::newRow("too deep") << "f"
                                  << "e" << 0 << "";
        QTest::newRow("overview") << "d" << Sites::overviewId << 0 << "";
        QTest::newRow("caption") << "d"
                                 << "caption" << 0 << "";
        QTest::newRow("unknown site") << "gone"
                                      << "f" << 0 << "";
    }
    void siteMovesByDrag() {
        QFETCH(QString, target);
        QFETCH(QString, moved);
        QFETCH(int, offset);
        QFETCH(QString, parent);
        QMimeData data;
        data.setData("application/x-nvldm-site", moved.toUtf8());
        QSignalSpy refused(m_tree.get(), &SiteTree::dropRefused);
        const QPoint at = place(target) + QPoint(0, offset);
        QCOMPARE(drag(data, at, {}), parent.isEmpty() ? Qt::IgnoreAction : Qt::MoveAction);
        QCOMPARE(tip()->isVisible(), parent.isEmpty());
        const QString reason = tip()->text();
        QCOMPARE(drop(data, at, {}), parent.isEmpty() ? Qt::IgnoreAction : Qt::MoveAction);
        QVERIFY(!tip()->isVisible());
        QCOMPARE(m_tree->edits().isDirty(), !parent.isEmpty());
        if (parent.isEmpty()) {
            QCOMPARE(refused.size(), 1);
            QCOMPARE(refused[0][0].toString(), reason);
        } else {
            const QTreeWidgetItem *now = item(moved)->parent();
            QCOMPARE(now ? now->data(0, SiteTree::siteIdRole).toString() : Sites::rootId, parent);
        }
        // Whatever happened, all sites are still there, each once.
        QCOMPARE(m_tree->edits().merged().size(), std::size_t(6));
        QCOMPARE(m_tree->findItems("site ", Qt::MatchStartsWith | Qt::MatchRecursive | Qt::MatchCaseSensitive)
                     .size(),
                 6);
    }

    void devicesAreDropped_data() {
        QTest::addColumn<QString>("source");
        QTest::addColumn<QString>("target");
        QTest::addColumn<QStringList>("devices");
        QTest::addColumn<bool>("control");
        QTest::addColumn<QString>("tip");
        QTest::addColumn<int>("action");
        const QString all = Sites::overviewId;
        QTest::newRow("one from the overview")
            << all << "b" << QStringList{"1"} << false << "Copy 1 device" << 1;
        QTest::newRow("three of a site")
            << "a"
            << "b" << QStringList{"1", "2", "3"} << false << "Move 3 devices" << 2;
        QTest::newRow("copied on demand") << "a"
                                          << "b" << QStringList{"1"} << true << "Copy 1 device" << 1;
        QTest::newRow("onto the overview") << "a" << all << QStringList{"1"} << false << "Move 1 device" << 0;
        QTest::newRow("onto a caption") << "a"
                                        << "caption" << QStringList{"1"} << false << "Move 1 device" << 0;
        QTest::newRow("onto nothing") << "a"
                                      << "" << QStringList{"1"} << false << "Move 1 device" << 0;
    }
    void devicesAreDropped() {
        QFETCH(QString, source);
        QFETCH(QString, target);
        QFETCH(QStringList, devices);
        QFETCH(bool, control);
        QFETCH(int, action);
        QMimeData data;
        data.setData(SiteMembership::mimeType, SiteMembership::encode({source, devices}));
        const Qt::KeyboardModifiers modifiers = control ? Qt::ControlModifier : Qt::NoModifier;
        const QPoint at = target.isEmpty() ? QPoint(100, 400) : place(target);
        QSignalSpy dropped(m_tree.get(), &SiteTree::devicesDropped);
        QCOMPARE(static_cast<int>(drag(data, at, modifiers)), action);
        QTEST(tip()->text(), "tip");
        QVERIFY(tip()->isVisible());
        QCOMPARE(tip()->grab().toImage().pixelColor(1, 1), QColor("#2986ff"));
        QDragLeaveEvent leave;
        QCoreApplication::sendEvent(m_tree->viewport(), &leave);
        QVERIFY(!tip()->isVisible());
        drag(data, at, modifiers);
        QCOMPARE(static_cast<int>(drop(data, at, modifiers)), action);
        QCOMPARE(dropped.size(), action == 0 ? 0 : 1);
        if (action)
            QCOMPARE(dropped[0],
                     (QVariantList{target, devices, QVariant::fromValue(Qt::DropAction(action)), source}));
        QVERIFY(!m_tree->edits().isDirty());
    }

    void devicesNeedACommittedSite() {
        choose("b", "Add Site");
        QTRY_VERIFY(editor());
        QTest::keyClick(editor(), Qt::Key_Return);
        const QString site =
            item("b")->child(item("b")->childCount() - 1)->data(0, SiteTree::siteIdRole).toString();
        QVERIFY(site.startsWith("SR"));
        QMimeData data;
        data.setData(SiteMembership::mimeType, SiteMembership::encode({Sites::overviewId, {"1"}}));
        QSignalSpy dropped(m_tree.get(), &SiteTree::devicesDropped);
        QSignalSpy refused(m_tree.get(), &SiteTree::dropRefused);
        QCOMPARE(drag(data, place(site), {}), Qt::IgnoreAction);
        QCOMPARE(tip()->text(), QStringLiteral("Apply the site changes first."));
        QCOMPARE(drop(data, place(site), {}), Qt::IgnoreAction);
        QCOMPARE(refused.size(), 1);
        QCOMPARE(dropped.size(), 0);
        m_tree->beginCommit();
        m_tree->endCommit(true);
        QCOMPARE(drag(data, place(site), {}), Qt::CopyAction);
        QCOMPARE(drop(data, place(site), {}), Qt::CopyAction);
        QCOMPARE(dropped.size(), 1);
    }

    void maxChainIsShown() {
        JSON records = JSON::array();
        for (int i = 1; i <= 28000; ++i)
            records.push_back({{"siteid", "s" + std::to_string(i)},
                               {"parentid", "s" + std::to_string(i - 1)},
                               {"sitename", "s"}});
        m_tree->setSites(Sites::parse(records));
        QVERIFY(item("s1") && item("s28000"));
        m_tree->expandAll();
        m_tree->setSites({});
    }

    void placeSurvivesAReading() {
        QStringList words = chain;
        for (int i = 0; i < 1994; ++i)
            words.append(QString("n%1<%2").arg(i).arg(i % 5 ? QString("n%1").arg(i - 1) : QString()));
        m_tree->setSites(sites(words));
        m_tree->setCounts(*DeviceMaker::snapshot({DeviceMaker::record(1, {{"siteid", {"n50"}}})}));
        m_tree->select("n52");
        m_tree->collapseItem(item("n50"));
        m_tree->verticalScrollBar()->setValue(3333);
        QSignalSpy changed(m_tree.get(), &SiteTree::currentSiteChanged);
        m_tree->setSites(sites(words + QStringList{"z<"}));
        QVERIFY(item("z"));
        QVERIFY(!item("n50")->isExpanded());
        QVERIFY(item("n51")->isExpanded());
        QCOMPARE(m_tree->currentSite(), QStringLiteral("n52"));
        QCOMPARE(changed.size(), 0);
        QCOMPARE(m_tree->verticalScrollBar()->value(), 3333);
        QCOMPARE(item("n50")->data(0, SiteTree::countRole).toString(), QStringLiteral("1"));
    }

private:
    QTreeWidgetItem *item(const QString &id) const {
        for (QTreeWidgetItemIterator it(m_tree.get()); *it; ++it) {
            if ((*it)->data(0, SiteTree::siteIdRole).toString() == id)
                return *it;
        }
        return nullptr;
    }
    QPoint place(const QString &id) const {
        return m_tree->visualItemRect(id == "caption" ? m_tree->topLevelItem(2) : item(id)).center();
    }
    QLineEdit *editor() const { return m_tree->findChild<QLineEdit *>("siteNameEditor"); }
    DragTip *tip() const { return m_tree->findChild<DragTip *>(); }

    QMenu *openMenu(const QPoint &at) const {
        QContextMenuEvent event(QContextMenuEvent::Mouse, at, m_tree->viewport()->mapToGlobal(at));
        QCoreApplication::sendEvent(m_tree->viewport(), &event);
        return m_tree->findChild<QMenu *>("siteMenu");
    }
    void choose(const QString &id, const QString &entry) const {
        QMenu *menu = openMenu(place(id));
        QVERIFY(menu);
        for (QAction *action : menu->actions()) {
            if (action->text() == entry)
                QTest::mouseClick(menu, Qt::LeftButton, {}, menu->actionGeometry(action).center());
        }
        // The entry's work alone: this platform takes the activation away with the menu, and the editor with
        // it.
        QCoreApplication::sendPostedEvents(m_tree.get(), QEvent::MetaCall);
    }

    Qt::DropAction drag(const QMimeData &data, const QPoint &at, Qt::KeyboardModifiers modifiers) const {
        const Qt::DropActions actions = Qt::CopyAction | Qt::MoveAction;
        QDragEnterEvent enter(at, actions, &data, Qt::LeftButton, modifiers);
        QCoreApplication::sendEvent(m_tree->viewport(), &enter);
        QDragMoveEvent move(at, actions, &data, Qt::LeftButton, modifiers);
        QCoreApplication::sendEvent(m_tree->viewport(), &move);
        return move.isAccepted() ? move.dropAction() : Qt::IgnoreAction;
    }
    Qt::DropAction drop(const QMimeData &data, const QPoint &at, Qt::KeyboardModifiers modifiers) const {
        QDropEvent event(at, Qt::CopyAction | Qt::MoveAction, &data, Qt::LeftButton, modifiers);
        QCoreApplication::sendEvent(m_tree->viewport(), &event);
        return event.isAccepted() ? event.dropAction() : Qt::IgnoreAction;
    }

    std::unique_ptr<SiteTree> m_tree;
};

NVLDM_TEST(TestSiteTree)
#include "tst_sitetree.moc"
