#include "support/testmain.h"
#include "widgets/controls/flowlayout.h"
#include "widgets/controls/wrappingcheckbox.h"

#include <QHBoxLayout>
#include <QTest>
#include <QVBoxLayout>

/// Controls whose texts are longer in one language than in another.
class TestWrapping : public QObject {
    Q_OBJECT

private slots:
    void itemsFlowIntoTheLinesTheyNeed_data() {
        QTest::addColumn<int>("width");
        QTest::addColumn<QList<QPoint>>("places");
        QTest::newRow("one line") << 320 << QList<QPoint>{{0, 0}, {110, 0}, {220, 0}};
        QTest::newRow("two lines") << 319 << QList<QPoint>{{0, 0}, {110, 0}, {0, 30}};
        QTest::newRow("one each") << 150 << QList<QPoint>{{0, 0}, {0, 30}, {0, 60}};
    }
    void itemsFlowIntoTheLinesTheyNeed() {
        QFETCH(int, width);
        QFETCH(QList<QPoint>, places);
        QWidget window;
        auto *outer = new QVBoxLayout(&window);
        outer->setContentsMargins(0, 0, 0, 0);
        auto *flow = new FlowLayout;
        flow->setSpacing(10);
        outer->addLayout(flow);
        auto *below = new QWidget;
        outer->addWidget(below, 1);
        QList<QWidget *> items;
        for (int i = 0; i < 4; ++i) {
            items += new QWidget;
            items.last()->setFixedSize(100, 20);
            flow->addWidget(items.last());
        }
        // What is hidden takes no room.
        items.takeAt(1)->hide();
        window.resize(width, 200);
        window.show();
        for (int i = 0; i < 3; ++i)
            QCOMPARE(items[i]->pos(), places[i]);
        QVERIFY(below->y() >= places.last().y() + 20);
    }

    void checkBoxGetsTheHeightOfItsText() {
        QWidget window;
        auto *layout = new QVBoxLayout(&window);
        auto *row = new QHBoxLayout;
        auto *box = new WrappingCheckBox(QStringLiteral("word ").repeated(40));
        row->addWidget(box);
        layout->addLayout(row);
        layout->addStretch();
        window.resize(400, 400);
        window.show();
        QVERIFY(box->heightForWidth(box->width()) > 3 * box->fontMetrics().height());
        QCOMPARE(box->height(), box->heightForWidth(box->width()));
    }
};

NVLDM_TEST(TestWrapping)

#include "tst_wrapping.moc"
