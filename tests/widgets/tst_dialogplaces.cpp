#include "support/testmain.h"
#include "widgets/dialogs/framelessdialog.h"

#include <QAbstractItemView>
#include <QComboBox>
#include <QLabel>
#include <QTest>
#include <QVBoxLayout>

namespace {

/// A list, and a warning that may come up.
class SmallDialog : public FramelessDialog {
public:
    explicit SmallDialog(QWidget *parent) : FramelessDialog(parent) {
        m_combo->addItems({"one", "two", "three"});
        m_warning->setFixedHeight(60);
        m_warning->hide();
        auto *layout = new QVBoxLayout(content());
        layout->addWidget(m_combo);
        layout->addWidget(m_warning);
    }

    QComboBox *m_combo = new QComboBox(content());
    QLabel *m_warning = new QLabel(content());
};

} // namespace

/// Dialogs under a window manager, which decides where windows are and tells it when it likes.
class TestDialogPlaces : public QObject {
    Q_OBJECT

private slots:
    void knowsWhereItIs_data() {
        QTest::addColumn<bool>("anew");
        QTest::newRow("a dialog for each opening") << true;
        QTest::newRow("one dialog that is shown again") << false;
    }
    void knowsWhereItIs() {
        QFETCH(const bool, anew);
        QWidget frame(nullptr, Qt::Window | Qt::FramelessWindowHint);
        frame.setGeometry(300, 200, 600, 400);
        frame.show();
        frame.activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(&frame));
        std::unique_ptr<SmallDialog> dialog;
        for (int opening = 0; opening < 20; ++opening) {
            if (anew || !dialog)
                dialog = std::make_unique<SmallDialog>(&frame);
            frame.move(200 + 7 * opening, 150 + 5 * opening);
            QTest::qWait(50);
            dialog->open();
            QVERIFY(QTest::qWaitForWindowActive(dialog.get()));
            for (const bool warned : {false, true}) {
                dialog->m_warning->setVisible(warned);
                // News of the window's place comes in for a while.
                QTest::qWait(150);
                const auto off = [&] { return dialog->geometry().center() - frame.geometry().center(); };
                QTRY_VERIFY2(
                    off().manhattanLength() <= 2,
                    qPrintable(
                        QStringLiteral("opening %1: %2, %3").arg(opening).arg(off().x()).arg(off().y())));
                dialog->m_combo->showPopup();
                const QWidget *list = dialog->m_combo->view()->window();
                QTRY_VERIFY(list->isVisible());
                const QRect combo(frame.geometry().center() - dialog->rect().center() +
                                      dialog->m_combo->mapTo(dialog.get(), QPoint()),
                                  dialog->m_combo->size());
                QVERIFY2(list->geometry().intersects(combo.adjusted(0, -4, 0, 4)),
                         qPrintable(QString::number(opening)));
                dialog->m_combo->hidePopup();
            }
            dialog->m_warning->hide();
            dialog->hide();
        }
    }
};

NVLDM_TEST(TestDialogPlaces)
#include "tst_dialogplaces.moc"
