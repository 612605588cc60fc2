#pragma once

#include "devices/page/devicewindow.h"
#include "devices/page/mainconsoletable.h"
#include "devices/sites/sitetree.h"
#include "signedinservice.h"

#include <QPushButton>
#include <QStackedWidget>
#include <QTabWidget>
#include <QTest>
#include <QTreeWidgetItemIterator>

#include <memory>

/// A device window on a service of its own, for the tests of what it shows and does.
class ConsoleFixture {
protected:
    /// The monitor's slowest beat is six seconds.
    static constexpr int patienceMs = 12000;

    void open() {
        m_window = std::make_unique<DeviceWindow>();
        m_window->resize(1280, 720);
        m_window->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
    }

    void close() {
        if (m_window)
            m_window->stopWork();
        CLocalStore::instance().clearLoginInfo();
        m_window.reset();
        QVERIFY(NetTask::waitForAll(patienceMs));
        QCoreApplication::processEvents();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        m_service.process().kill();
    }

    static void onService(const std::function<unsigned(CApiClient &)> &call) { SignedInService::call(call); }
    void tell(const QString &command) { m_service.tell(command); }
    /// A window at work on a service with so many devices.
    void workOn(int devices) {
        m_service.start({"--devices", QString::number(devices)});
        m_window->startWork();
        QTRY_COMPARE(rowsOfAllTables(), devices);
    }
    QPushButton *visibleButton(const char *name) const {
        for (auto *button : m_window->findChildren<QPushButton *>(name)) {
            if (button->isVisible())
                return button;
        }
        return nullptr;
    }
    int rowsOfAllTables() const {
        int rows = 0;
        for (const MainConsoleTable *table : m_window->findChildren<MainConsoleTable *>())
            rows += table->rowCount();
        return rows;
    }

    QString shownPage() const {
        const auto *tabs = m_window->findChild<QTabWidget *>("deviceTabs");
        return qobject_cast<QStackedWidget *>(tabs->currentWidget())->currentWidget()->objectName();
    }

    MainConsoleTable *table(const char *name) const { return m_window->findChild<MainConsoleTable *>(name); }
    void clickSite(const QString &id) {
        auto *tree = m_window->findChild<SiteTree *>();
        for (QTreeWidgetItemIterator it(tree); *it; ++it) {
            if ((*it)->data(0, SiteTree::siteIdRole).toString() != id)
                continue;
            tree->scrollToItem(*it);
            QTest::mouseClick(tree->viewport(), Qt::LeftButton, {}, tree->visualItemRect(*it).center());
        }
        QCOMPARE(tree->currentSite(), id);
    }

    template <typename Dialog>
    Dialog *visible() const {
        auto *dialog = m_window->findChild<Dialog *>();
        return dialog && dialog->isVisible() ? dialog : nullptr;
    }

    SignedInService m_service;
    std::unique_ptr<DeviceWindow> m_window;
};
