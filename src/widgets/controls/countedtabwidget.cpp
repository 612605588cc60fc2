#include "widgets/controls/countedtabwidget.h"

#include "widgets/style/theme.h"

#include <QLocale>
#include <QPainter>
#include <QStackedWidget>
#include <QTabBar>

namespace {

constexpr int gapBeforeCount = 7;
constexpr int gapBetweenTabs = 22;
constexpr int barHeight = 36;
constexpr int underline = 2;

class CountedTabBar : public QTabBar {
public:
    using QTabBar::QTabBar;

protected:
    QSize tabSizeHint(int index) const override {
        return {nameMetrics().horizontalAdvance(tabText(index)) + gapBeforeCount +
                    fontMetrics().horizontalAdvance(countText(index)) + gapBetweenTabs,
                barHeight};
    }

    void paintEvent(QPaintEvent *) override {
        QPainter painter(this);
        for (int i = 0; i < count(); ++i)
            paintTab(painter, i);
    }

private:
    QString countText(int index) const { return tabData(index).toString(); }

    QFont nameFont() const {
        QFont font = this->font();
        font.setWeight(QFont::DemiBold);
        return font;
    }
    // Always measured as the selected one, so that a selection moves nothing.
    QFontMetrics nameMetrics() const { return QFontMetrics(nameFont()); }

    void paintTab(QPainter &painter, int index) const {
        const bool selected = index == currentIndex();
        const bool hovered = tabRect(index).contains(mapFromGlobal(QCursor::pos()));
        QRect rest = tabRect(index).adjusted(0, 0, -gapBetweenTabs, 0);
        if (selected)
            painter.fillRect(QRect(rest.left(), rest.bottom() - underline + 1, rest.width(), underline),
                             hasFocus() ? Theme::text : Theme::accent);
        painter.setFont(selected ? nameFont() : font());
        painter.setPen(selected || hovered ? Theme::text : Theme::textQuiet);
        painter.drawText(rest, Qt::AlignVCenter, tabText(index));
        rest.setLeft(rest.left() + nameMetrics().horizontalAdvance(tabText(index)) + gapBeforeCount);
        painter.setFont(font());
        painter.setPen(Theme::textQuiet);
        painter.drawText(rest, Qt::AlignVCenter, countText(index));
    }
};

} // namespace

CountedTabWidget::CountedTabWidget(QWidget *parent) : QTabWidget(parent) {
    auto *bar = new CountedTabBar(this);
    bar->setMouseTracking(true);
    bar->setAttribute(Qt::WA_Hover);
    bar->setExpanding(false);
    bar->setDrawBase(false);
    setTabBar(bar);
    setDocumentMode(true);
}

void CountedTabWidget::setCount(int tab, int count) {
    const QString text = QLocale().toString(count);
    if (tabBar()->tabData(tab).toString() == text)
        return;
    tabBar()->setTabData(tab, text);
    // Setting the text is what makes the bar lay its tabs out anew.
    const QString name = tabText(tab);
    tabBar()->setTabText(tab, QString());
    tabBar()->setTabText(tab, name);
}

QWidget *CountedTabWidget::pageParent() const {
    return findChild<QStackedWidget *>(QString(), Qt::FindDirectChildrenOnly);
}
