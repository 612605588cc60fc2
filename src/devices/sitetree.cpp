#include "sitetree.h"

#include "icons.h"
#include "plaintext.h"
#include "theme.h"

#include <QDebug>
#include <QHash>
#include <QHeaderView>
#include <QLocale>
#include <QPainter>
#include <QSignalBlocker>
#include <QStyledItemDelegate>
#include <QTreeWidgetItemIterator>

namespace {

constexpr int rowPadding = 14;
constexpr int captionHeight = 34;
constexpr int siteHeight = 32;
constexpr QSize pictureSize{14, 14};

/// Paints captions, the mark of the selected row, and the count at a row's end.
class SiteDelegate : public QStyledItemDelegate {
public:
    explicit SiteDelegate(QTreeWidget *tree) : QStyledItemDelegate(tree), m_tree(tree) {}

    QSize sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const override {
        return {QStyledItemDelegate::sizeHint(option, index).width(),
                isCaption(index) ? captionHeight : siteHeight};
    }

    void paint(QPainter *painter, const QStyleOptionViewItem &option,
               const QModelIndex &index) const override {
        if (isCaption(index)) {
            paintCaption(painter, option, index);
            return;
        }
        const QRect row(0, option.rect.top(), m_tree->viewport()->width(), option.rect.height());
        paintRowState(painter, option, row);
        QRect rest = option.rect.adjusted(2, 0, -rowPadding, 0);
        const QString count = index.data(SiteTree::countRole).toString();
        painter->setFont(countFont(option.font));
        painter->setPen(Theme::textQuiet);
        painter->drawText(rest, Qt::AlignRight | Qt::AlignVCenter, count);
        rest.setRight(rest.right() - QFontMetrics(painter->font()).horizontalAdvance(count) - 8);
        const QIcon icon = index.data(Qt::DecorationRole).value<QIcon>();
        icon.paint(painter,
                   QRect(QPoint(rest.left(), rest.center().y() - pictureSize.height() / 2 + 1), pictureSize));
        rest.setLeft(rest.left() + pictureSize.width() + 8);
        painter->setFont(option.font);
        painter->setPen(option.state & QStyle::State_Selected ? Theme::text : Theme::textStrong);
        const QString name = index.data(Qt::DisplayRole).toString().left(200).simplified();
        painter->drawText(rest, Qt::AlignVCenter | Qt::TextSingleLine,
                          option.fontMetrics.elidedText(name, Qt::ElideRight, rest.width()));
    }

private:
    static bool isCaption(const QModelIndex &index) { return index.data(SiteTree::siteIdRole).isNull(); }

    static QFont countFont(QFont font) {
        font.setPixelSize(11);
        return font;
    }

    void paintCaption(QPainter *painter, const QStyleOptionViewItem &option, const QModelIndex &index) const {
        QFont font = option.font;
        font.setPixelSize(11);
        font.setLetterSpacing(QFont::AbsoluteSpacing, 0.6);
        painter->setFont(font);
        painter->setPen(Theme::textQuiet);
        const QRect place(16, option.rect.top() + 8, m_tree->viewport()->width() - 16,
                          option.rect.height() - 8);
        painter->drawText(place, Qt::AlignVCenter, index.data(Qt::DisplayRole).toString());
    }

    void paintRowState(QPainter *painter, const QStyleOptionViewItem &option, const QRect &row) const {
        if (option.state & QStyle::State_Selected) {
            painter->fillRect(row, QColor(0x29, 0x86, 0xFF, 51));
            painter->fillRect(QRect(row.left(), row.top(), 2, row.height()), Theme::accent);
            if (option.state & QStyle::State_HasFocus && m_tree->hasFocus()) {
                painter->setPen(Theme::accent);
                painter->drawRect(row.adjusted(0, 0, -1, -1));
            }
        } else if (option.state & QStyle::State_MouseOver) {
            painter->fillRect(row, QColor(255, 255, 255, 13));
        }
    }

    QTreeWidget *m_tree;
};

} // namespace

SiteTree::SiteTree(QWidget *parent) : QTreeWidget(parent) {
    setObjectName(QStringLiteral("siteTree"));
    setColumnCount(1);
    setHeaderHidden(true);
    setItemDelegate(new SiteDelegate(this));
    setIndentation(18);
    setRootIsDecorated(true);
    setExpandsOnDoubleClick(true);
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setMouseTracking(true);
    setAccessibleName(tr("Sites"));
    setSites({});
    connect(this, &QTreeWidget::currentItemChanged, this, [this] { emit currentSiteChanged(currentSite()); });
}

void SiteTree::setSites(const Sites::List &sites) {
    if (m_built && sites == m_sites) {
        qDebug("site list has't changed");
        return;
    }
    const QString selected = currentSite();
    m_sites = sites;
    m_built = true;
    {
        const QSignalBlocker blocker(this);
        build();
        select(selected);
    }
    if (currentSite() != selected)
        emit currentSiteChanged(currentSite());
}

void SiteTree::build() {
    clear();
    addCaption(tr("DEVICE"));
    addOverview();
    addCaption(tr("SITE MANAGEMENT"));
    const QIcon icon = Icons::icon(QStringLiteral(":/images/icon_general_location_solid.svg"), pictureSize);
    QHash<QString, QTreeWidgetItem *> byId;
    for (const Sites::Site &site : m_sites) {
        auto *item = new QTreeWidgetItem({site.name});
        item->setData(0, siteIdRole, site.id);
        item->setToolTip(0, site.name.size() > 24 ? PlainText::toolTip(site.name) : QString());
        item->setIcon(0, icon);
        // Parents stand in front of their children, so a missing one means top level.
        if (QTreeWidgetItem *parent = byId.value(site.parentId))
            parent->addChild(item);
        else
            addTopLevelItem(item);
        byId.insert(site.id, item);
    }
    expandAll();
}

void SiteTree::addCaption(const QString &text) {
    auto *item = new QTreeWidgetItem({text});
    item->setFlags(Qt::NoItemFlags);
    addTopLevelItem(item);
}

QTreeWidgetItem *SiteTree::addOverview() {
    auto *item = new QTreeWidgetItem({tr("Device Overview")});
    item->setData(0, siteIdRole, Sites::overviewId);
    item->setIcon(0, Icons::icon(QStringLiteral(":/images/icon_general_group_solid.svg"), pictureSize));
    item->setFlags(item->flags() & ~Qt::ItemIsDragEnabled);
    addTopLevelItem(item);
    return item;
}

void SiteTree::select(const QString &siteId) {
    QTreeWidgetItem *found = topLevelItem(1);
    for (QTreeWidgetItemIterator it(this); *it; ++it) {
        if ((*it)->data(0, siteIdRole).toString() == siteId && !siteId.isEmpty())
            found = *it;
    }
    setCurrentItem(found);
}

void SiteTree::setCounts(const DeviceSnapshot &devices) {
    const QLocale locale;
    for (QTreeWidgetItemIterator it(this); *it; ++it) {
        const QVariant id = (*it)->data(0, siteIdRole);
        if (!id.isNull())
            (*it)->setData(0, countRole, locale.toString(devices.siteCount(id.toString())));
    }
}

QString SiteTree::currentSite() const {
    const QTreeWidgetItem *item = currentItem();
    return item && !item->data(0, siteIdRole).isNull() ? item->data(0, siteIdRole).toString()
                                                       : Sites::overviewId;
}

QString SiteTree::currentSiteName() const {
    return currentItem() ? currentItem()->text(0) : QString();
}
