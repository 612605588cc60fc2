#include "devices/sites/sitedelegate.h"

#include "devices/sites/sitetree.h"
#include "widgets/style/theme.h"

#include <QFocusEvent>
#include <QLineEdit>
#include <QPainter>

namespace {

constexpr int rowPadding = 14;
constexpr int captionHeight = 34;
constexpr int siteHeight = 32;
constexpr QSize iconSize{14, 14};

bool isCaption(const QModelIndex &index) {
    return index.data(SiteTree::siteIdRole).isNull();
}

QFont countFont(QFont font) {
    font.setPixelSize(11);
    return font;
}

} // namespace

SiteDelegate::SiteDelegate(QTreeWidget *tree, Edited edited)
    : QStyledItemDelegate(tree), m_tree(tree), m_edited(std::move(edited)) {}

// The one column is as wide as the tree, so no text needs to be measured.
QSize SiteDelegate::sizeHint(const QStyleOptionViewItem &, const QModelIndex &index) const {
    return {1, isCaption(index) ? captionHeight : siteHeight};
}

QWidget *SiteDelegate::createEditor(QWidget *parent, const QStyleOptionViewItem &,
                                    const QModelIndex &) const {
    auto *editor = new QLineEdit(parent);
    editor->setObjectName(QStringLiteral("siteNameEditor"));
    editor->setAccessibleName(SiteTree::tr("Site name"));
    return editor;
}

void SiteDelegate::updateEditorGeometry(QWidget *editor, const QStyleOptionViewItem &option,
                                        const QModelIndex &) const {
    QRect place = option.rect.adjusted(iconSize.width() + 4, 0, 0, 0);
    place.setRight(m_tree->viewport()->width() - 6);
    editor->setGeometry(place);
}

void SiteDelegate::setModelData(QWidget *editor, QAbstractItemModel *, const QModelIndex &index) const {
    m_edited(index.data(SiteTree::siteIdRole).toString(), static_cast<QLineEdit *>(editor)->text());
}

bool SiteDelegate::eventFilter(QObject *editor, QEvent *event) {
    // Another window has come up, maybe unasked: the focus comes back to what is being typed.
    if (event->type() == QEvent::FocusOut &&
        static_cast<QFocusEvent *>(event)->reason() == Qt::ActiveWindowFocusReason)
        return false;
    return QStyledItemDelegate::eventFilter(editor, event);
}

void SiteDelegate::paint(QPainter *painter, const QStyleOptionViewItem &option,
                         const QModelIndex &index) const {
    if (isCaption(index))
        paintCaption(painter, option, index);
    else
        paintSite(painter, option, index);
}

void SiteDelegate::paintSite(QPainter *painter, const QStyleOptionViewItem &option,
                             const QModelIndex &index) const {
    const QRect row(0, option.rect.top(), m_tree->viewport()->width(), option.rect.height());
    paintRowState(painter, option, row);
    QRect rest = option.rect.adjusted(2, 0, -rowPadding, 0);
    const QString count = index.data(SiteTree::countRole).toString();
    painter->setFont(countFont(option.font));
    painter->setPen(Theme::textQuiet);
    painter->drawText(rest, Qt::AlignRight | Qt::AlignVCenter, count);
    rest.setRight(rest.right() - QFontMetrics(painter->font()).horizontalAdvance(count) - 8);
    const QIcon icon = index.data(Qt::DecorationRole).value<QIcon>();
    icon.paint(painter, QRect(QPoint(rest.left(), rest.center().y() - iconSize.height() / 2 + 1), iconSize));
    rest.setLeft(rest.left() + iconSize.width() + 8);
    painter->setFont(option.font);
    painter->setPen(option.state & QStyle::State_Selected ? Theme::text : Theme::textStrong);
    QString name = index.data(Qt::DisplayRole).toString().left(200).simplified();
    if (name.isEmpty())
        name = SiteTree::tr("(no name)");
    painter->drawText(rest, Qt::AlignVCenter | Qt::TextSingleLine,
                      option.fontMetrics.elidedText(name, Qt::ElideRight, rest.width()));
}

void SiteDelegate::paintCaption(QPainter *painter, const QStyleOptionViewItem &option,
                                const QModelIndex &index) const {
    QFont font = option.font;
    font.setPixelSize(11);
    font.setLetterSpacing(QFont::AbsoluteSpacing, 0.6);
    painter->setFont(font);
    painter->setPen(Theme::textQuiet);
    const QRect place(16, option.rect.top() + 8, m_tree->viewport()->width() - 16, option.rect.height() - 8);
    painter->drawText(place, Qt::AlignVCenter, index.data(Qt::DisplayRole).toString());
}

void SiteDelegate::paintRowState(QPainter *painter, const QStyleOptionViewItem &option,
                                 const QRect &row) const {
    if (option.state & QStyle::State_Selected) {
        painter->fillRect(row, Theme::selectedRow);
        painter->fillRect(QRect(row.left(), row.top(), 2, row.height()), Theme::accent);
        if (option.state & QStyle::State_HasFocus && m_tree->hasFocus()) {
            painter->setPen(Theme::accent);
            painter->drawRect(row.adjusted(0, 0, -1, -1));
        }
    } else if (option.state & QStyle::State_MouseOver) {
        painter->fillRect(row, Theme::hoverTint);
    }
}
