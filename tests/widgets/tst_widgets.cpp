#include "support/testmain.h"
#include "widgets/controls/countedtabwidget.h"
#include "widgets/controls/passwordedit.h"
#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/transientmessage.h"
#include "widgets/dialogs/warningline.h"
#include "widgets/style/icons.h"
#include "widgets/style/plaintext.h"
#include "widgets/style/theme.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFile>
#include <QLabel>
#include <QRadioButton>
#include <QRegularExpression>
#include <QSignalSpy>
#include <QSpinBox>
#include <QTabBar>
#include <QTemporaryDir>
#include <QTest>
#include <QTextDocument>
#include <QToolButton>

#include <tuple>

class TestWidgets : public QObject {
    Q_OBJECT

private slots:
    void eyeShowsAndHidesThePassword() {
        PasswordEdit edit;
        edit.resize(200, 32);
        edit.show();
        QVERIFY(QTest::qWaitForWindowExposed(&edit));
        QTest::keyClicks(&edit, "Passw0rd!");
        QCOMPARE(edit.echoMode(), QLineEdit::Password);
        QVERIFY(!edit.displayText().contains("Passw0rd!"));
        auto *eye = edit.findChild<QToolButton *>();
        const qint64 hiddenIcon = eye->icon().cacheKey();
        QTest::mouseClick(eye, Qt::LeftButton);
        QCOMPARE(edit.echoMode(), QLineEdit::Normal);
        QCOMPARE(edit.displayText(), QStringLiteral("Passw0rd!"));
        QVERIFY(eye->icon().cacheKey() != hiddenIcon);
        QTest::mouseClick(eye, Qt::LeftButton);
        QCOMPARE(edit.echoMode(), QLineEdit::Password);
        QCOMPARE(edit.text(), QStringLiteral("Passw0rd!"));
    }

    void picturesThatWereDrawnByTheBuild() {
        QTemporaryDir folder;
        const auto draw = [&](const QString &name, int side, const QColor &colour) {
            QImage image(side, side, QImage::Format_ARGB32);
            image.fill(colour);
            QVERIFY(image.save(folder.filePath(name), "PNG"));
        };
        draw("mark.svg", 10, Qt::red);
        draw("mark@1.5x.svg", 15, Qt::green);
        draw("mark@2x.svg", 20, QColor(255, 255, 255, 128));
        const auto centre = [&](int side, qreal ratio, const QColor &colour = {}) {
            const QImage image =
                Icons::pixmap(folder.filePath("mark.svg"), {side, side}, ratio, colour).toImage();
            return image.pixelColor(image.rect().center());
        };
        QCOMPARE(centre(8, 1.0), QColor(Qt::red));
        QCOMPARE(centre(10, 1.5), QColor(Qt::green));
        // The largest is enlarged, and a colour takes the place of its own but for what shows through.
        const QColor tinted = centre(30, 2.0, QColor(40, 80, 120));
        QCOMPARE(tinted.alpha(), 128);
        QVERIFY2(qAbs(tinted.red() - 40) <= 1 && qAbs(tinted.blue() - 120) <= 1, qPrintable(tinted.name()));
    }

    void dialogThatMustBeAnswered() {
        FramelessDialog dialog;
        QSignalSpy rejected(&dialog, &QDialog::rejected);
        auto *cross = dialog.findChild<QToolButton *>("dialogCloseButton");
        dialog.setClosable(false);
        dialog.show();
        QVERIFY(QTest::qWaitForWindowExposed(&dialog));
        QVERIFY(!cross->isVisible());
        QTest::keyClick(&dialog, Qt::Key_Escape);
        QVERIFY(dialog.isVisible());
        dialog.setClosable(true);
        QTest::keyClick(&dialog, Qt::Key_Escape);
        QVERIFY(!dialog.isVisible());
        dialog.show();
        QTest::mouseClick(cross, Qt::LeftButton);
        QVERIFY(!dialog.isVisible());
        QCOMPARE(rejected.size(), 2);
    }

    void toolTipShowsMarkupAsItStands() {
        QTextDocument shown;
        for (const char *text : {"Building A", "<b>NC-4210</b><img src=\"http://10.98.0.1/x.png\">",
                                 "A &amp; B", "</span><h1>x"}) {
            const QString tip = PlainText::toolTip(QString::fromLatin1(text));
            QVERIFY2(Qt::mightBeRichText(tip), text);
            shown.setHtml(tip);
            QCOMPARE(shown.toPlainText(), QString::fromLatin1(text));
        }
        shown.setHtml(PlainText::toolTip(QString(10000, u'<')));
        QVERIFY(shown.toPlainText().size() < 1000);
        QVERIFY(shown.toPlainText().startsWith(u'<') && shown.toPlainText().endsWith(QChar(0x2026)));
        QCOMPARE(PlainText::toolTip({}), QString());
    }

    void messagesTakeNoMarkup() {
        QLabel icon;
        QLabel text;
        WarningLine line(&icon, &text);
        line.setText("<i>no</i>");
        QVERIFY(!icon.pixmap().isNull());
        QCOMPARE(text.text(), QStringLiteral("<i>no</i>"));
        QCOMPARE(text.textFormat(), Qt::PlainText);
        line.setText({});
        QVERIFY(icon.pixmap().isNull());
        QCOMPARE(text.text(), QString());

        QWidget window;
        window.resize(600, 400);
        auto *inner = new QWidget(&window);
        TransientMessage::show(inner, "first");
        TransientMessage::show(inner, "<b>second</b>");
        QTRY_COMPARE(window.findChildren<TransientMessage *>().size(), 1);
        QCOMPARE(window.findChild<TransientMessage *>()->text(), QStringLiteral("<b>second</b>"));
        QCOMPARE(window.findChild<TransientMessage *>()->textFormat(), Qt::PlainText);
        QVERIFY(window.rect().contains(window.findChild<TransientMessage *>()->geometry()));
    }

    void countStaysOutOfTheTabsText() {
        CountedTabWidget tabs;
        tabs.addTab(new QWidget, "Camera");
        tabs.addTab(new QWidget, "NVR");
        tabs.setCount(0, 5);
        tabs.show();
        QVERIFY(QTest::qWaitForWindowExposed(&tabs));
        const int narrow = tabs.tabBar()->tabRect(0).width();
        tabs.setCount(0, 12345);
        QCOMPARE(tabs.tabText(0), QStringLiteral("Camera"));
        const int wide = tabs.tabBar()->tabRect(0).width();
        QVERIFY2(wide > narrow, "a longer number needs more room");
        QTest::mouseClick(tabs.tabBar(), Qt::LeftButton, {}, tabs.tabBar()->tabRect(1).center());
        QCOMPARE(tabs.currentIndex(), 1);
        QCOMPARE(tabs.tabBar()->tabRect(0).width(), wide);
    }

    /// What all widgets share gives way to the sheets of the four controls.
    void controlsHaveFontsOfTheirOwn() {
        QWidget window;
        window.setStyleSheet(Theme::styleSheet());
        const QString symbols = QStringLiteral("Segoe UI Symbol");
        const std::tuple<QWidget *, int, QString, int> controls[] = {
            {new QRadioButton(&window), 16, Theme::fontFamily(), QFont::DemiBold},
            {new QCheckBox(&window), 14, Theme::fontFamily(), QFont::Normal},
            {new QComboBox(&window), 14, symbols, QFont::Normal},
            {new QSpinBox(&window), 14, symbols, QFont::Normal},
            {new QLabel(&window), 13, Theme::fontFamily(), QFont::Normal}};
        for (const auto &[control, size, family, weight] : controls) {
            control->ensurePolished();
            QCOMPARE(control->font().pixelSize(), size);
            QCOMPARE(control->font().families(), QStringList(family));
            QCOMPARE(control->font().weight(), weight);
        }
        QCOMPARE(std::get<0>(controls[1])->palette().color(QPalette::WindowText), Theme::textDim);
    }

    void styleSheetNamesPicturesThatExist() {
        static const QRegularExpression picture("url\\(\"?([^)\"]+)\"?\\)");
        auto found = picture.globalMatch(Theme::styleSheet());
        QVERIFY(found.hasNext());
        while (found.hasNext()) {
            const QString path = found.next().captured(1);
            QVERIFY2(QFile::exists(path), qPrintable(path));
        }
    }
};

NVLDM_TEST(TestWidgets)
#include "tst_widgets.moc"
