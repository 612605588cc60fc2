#include "devices/page/reconnectingdialog.h"
#include "devices/page/refreshdevicedialog.h"
#include "devices/sites/sitetree.h"
#include "support/testmain.h"
#include "widgets/dialogs/framelessdialog.h"

#include <QLineEdit>
#include <QPushButton>
#include <QSignalSpy>
#include <QTest>
#include <QToolButton>
#include <QVBoxLayout>
#include <QWindow>

/// Dialogs that come up unasked, under a window manager, while the user does something else.
class TestOutageDialogs : public QObject {
    Q_OBJECT

private slots:
    void init() {
        m_frame = std::make_unique<QWidget>();
        m_frame->setGeometry(100, 80, 900, 600);
        m_tree = new SiteTree(m_frame.get());
        m_tree->resize(250, 500);
        m_frame->show();
        m_frame->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(m_frame.get()));
        m_tree->setSites({{"SR1", Sites::rootId, "Campus", {}}});
        m_reconnecting = new ReconnectingDialog(m_frame.get());
    }
    void cleanup() { m_frame.reset(); }

    void typedNameSurvives() {
        m_tree->select("SR1");
        m_tree->setFocus();
        QTest::keyClick(m_tree, Qt::Key_F2);
        type("Building");
        m_reconnecting->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_reconnecting));
        QTest::qWait(200);
        QVERIFY(m_frame->isActiveWindow());
        // With a native window of its own, the tree would be painted no more.
        QVERIFY(!m_tree->testAttribute(Qt::WA_NativeWindow));
        type(" numb");
        m_reconnecting->close();
        for (int opening = 0; opening < 5; ++opening) {
            RefreshDeviceDialog refresh(m_frame.get());
            refresh.open();
            QVERIFY(QTest::qWaitForWindowActive(&refresh));
            refresh.finish();
            QTRY_VERIFY(m_frame->isActiveWindow() && qobject_cast<QLineEdit *>(QApplication::focusWidget()));
        }
        QVERIFY(m_tree->isTyping());
        type("er 7");
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Return);
        QTRY_COMPARE(m_tree->edits().nameOf("SR1"), QStringLiteral("Building number 7"));
    }

    void reconnectingWorksBesideAModalDialog_data() {
        QTest::addColumn<bool>("dialogFirst");
        QTest::newRow("over a dialog") << true;
        QTest::newRow("before a dialog opens") << false;
    }
    void reconnectingWorksBesideAModalDialog() {
        QFETCH(const bool, dialogFirst);
        auto question = makeQuestion();
        if (dialogFirst)
            openActive(question.get());
        m_reconnecting->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_reconnecting));
        if (!dialogFirst)
            openActive(question.get());
        QSignalSpy disconnects(m_reconnecting, &ReconnectingDialog::disconnectBtnClicked);
        const auto press = [this](const char *button) { clickThroughWindow(m_reconnecting, button); };
        QTRY_VERIFY(m_reconnecting->windowHandle()->transientParent() == question->windowHandle());
        QVERIFY(QTest::qWaitForWindowExposed(m_reconnecting));
        press("disconnectButton");
        QCOMPARE(disconnects.size(), 1);
        QVERIFY(!m_reconnecting->geometry().intersects(question->geometry()));
        QTRY_VERIFY(question->isActiveWindow());
        type("typed");
        QCOMPARE(question->findChild<QLineEdit *>()->text(), QStringLiteral("typed"));
        // It outlives the dialog that it stood on.
        question.reset();
        QTRY_VERIFY(m_reconnecting->windowHandle()->transientParent() == m_frame->windowHandle());
        QVERIFY(QTest::qWaitForWindowExposed(m_reconnecting));
        press("disconnectButton");
        QCOMPARE(disconnects.size(), 2);
        press("dialogCloseButton");
        QVERIFY(!m_reconnecting->isVisible());
    }

    void refreshGivesTheKeyboardBack() {
        const auto question = makeQuestion();
        openActive(question.get());
        for (int opening = 0; opening < 10; ++opening) {
            RefreshDeviceDialog refresh(opening % 2 ? question.get() : m_frame.get());
            refresh.open();
            QVERIFY(QTest::qWaitForWindowActive(&refresh));
            refresh.finish();
            QTRY_VERIFY2(question->isActiveWindow(), qPrintable(QString::number(opening)));
            QVERIFY(question->findChild<QLineEdit *>()->hasFocus());
        }
    }

private:
    static void type(const QString &text) {
        QVERIFY(QApplication::focusWidget());
        QTest::keyClicks(QApplication::focusWidget(), text);
    }
    std::unique_ptr<FramelessDialog> makeQuestion() const {
        auto dialog = std::make_unique<FramelessDialog>(m_frame.get());
        auto *layout = new QVBoxLayout(dialog->content());
        layout->addWidget(new QLineEdit(dialog->content()));
        return dialog;
    }
    static void openActive(QDialog *dialog) {
        dialog->open();
        QVERIFY(QTest::qWaitForWindowActive(dialog));
    }
    /// As the window system brings it, so that modal dialogs block it.
    static void clickThroughWindow(const QWidget *window, const char *name) {
        const auto *button = window->findChild<QWidget *>(name);
        QVERIFY(button);
        QTest::mouseClick(window->windowHandle(), Qt::LeftButton, {},
                          button->mapTo(window, button->rect().center()));
    }

    std::unique_ptr<QWidget> m_frame;
    SiteTree *m_tree = nullptr;
    ReconnectingDialog *m_reconnecting = nullptr;
};

NVLDM_TEST(TestOutageDialogs)
#include "tst_outagedialogs.moc"
