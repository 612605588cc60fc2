#include "devices/sites/sitetree.h"

#include "devices/sites/dragtip.h"
#include "devices/sites/sitedelegate.h"
#include "widgets/controls/popupmenu.h"
#include "widgets/dialogs/confirmdialog.h"
#include "widgets/style/icons.h"
#include "widgets/style/plaintext.h"

#include <QContextMenuEvent>
#include <QDateTime>
#include <QDebug>
#include <QDrag>
#include <QHeaderView>
#include <QLineEdit>
#include <QLocale>
#include <QMimeData>
#include <QScrollBar>
#include <QSignalBlocker>
#include <QToolButton>
#include <QTreeWidgetItemIterator>

#include <nlohmann/json.hpp>

#include <functional>

namespace {

constexpr QSize siteIconSize{14, 14};
constexpr QSize menuIconSize{16, 16};
constexpr int addButtonDistance = 8;
constexpr int maxPlainNameLength = 24;
constexpr int expandDelayMs = 700;
/// What the tree drags: the id of a site.
constexpr auto siteMimeType = "application/x-nvldm-site";

bool showSame(const Sites::List &a, const Sites::List &b) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end(), [](const Sites::Site &x, const Sites::Site &y) {
        return x.id == y.id && x.parentId == y.parentId && x.name == y.name;
    });
}

QString siteIdOf(const QTreeWidgetItem *item) {
    return item ? item->data(0, SiteTree::siteIdRole).toString() : QString();
}

bool isSite(const QTreeWidgetItem *item) {
    const QString id = siteIdOf(item);
    return !id.isEmpty() && id != Sites::overviewId;
}

int depthOf(const QTreeWidgetItem *item) {
    int depth = 0;
    while ((item = item->parent()))
        ++depth;
    return depth;
}

QString siteToolTip(const QString &name) {
    return name.size() > maxPlainNameLength ? PlainText::toolTip(name) : QString();
}

QIcon menuIcon(const char *name) {
    return Icons::plainIcon(QStringLiteral(":/images/%1.svg").arg(QLatin1String(name)), menuIconSize);
}

QString deviceTip(bool copies, qsizetype count) {
    if (copies)
        return (count < 2 ? SiteTree::tr("Copy %1 device") : SiteTree::tr("Copy %1 devices")).arg(count);
    return (count < 2 ? SiteTree::tr("Move %1 device") : SiteTree::tr("Move %1 devices")).arg(count);
}

} // namespace

struct SiteTree::DropPlan {
    QString targetId;
    Qt::DropAction action;
    QString problem; ///< why there can be no drop
    QString tip;
};

SiteTree::SiteTree(QWidget *parent) : QTreeWidget(parent), m_tip(new DragTip(this)) {
    setObjectName(QStringLiteral("siteTree"));
    setColumnCount(1);
    setHeaderHidden(true);
    setItemDelegate(new SiteDelegate(
        this, [this](const QString &siteId, const QString &name) { finishEditing(siteId, name); }));
    setIndentation(18);
    setRootIsDecorated(true);
    setExpandsOnDoubleClick(true);
    setEditTriggers(QAbstractItemView::EditKeyPressed);
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setMouseTracking(true);
    setDragDropMode(QAbstractItemView::DragDrop);
    setAutoExpandDelay(expandDelayMs);
    setAccessibleName(tr("Sites"));
    m_addTop = new QToolButton(viewport());
    m_addTop->setObjectName(QStringLiteral("addTopSiteButton"));
    m_addTop->setProperty("role", QStringLiteral("filter"));
    m_addTop->setIcon(menuIcon("icon_general_plus_line"));
    m_addTop->setIconSize(siteIconSize);
    m_addTop->setFocusPolicy(Qt::TabFocus);
    m_addTop->setToolTip(tr("Add a site"));
    m_addTop->setAccessibleName(tr("Add a site"));
    connect(m_addTop, &QToolButton::clicked, this, [this] { addSite(Sites::rootId); });
    setSites({});
    connect(this, &QTreeWidget::currentItemChanged, this, [this] { emit currentSiteChanged(currentSite()); });
}

void SiteTree::setSites(const Sites::List &sites) {
    if (m_built && sites == m_edits.reading()) {
        qDebug("site list has't changed");
        return;
    }
    const bool wasDirty = m_edits.isDirty();
    const QStringList dropped = m_edits.takeReading(sites);
    refresh();
    if (!dropped.isEmpty())
        emit editsDropped(dropped);
    if (wasDirty != m_edits.isDirty())
        emit sitesEdited();
}

void SiteTree::forgetSites() {
    const bool wasDirty = m_edits.isDirty();
    m_edits = SiteEdits();
    m_counts.clear();
    endDrag();
    rebuild();
    if (wasDirty)
        emit sitesEdited();
}

void SiteTree::discardEdits() {
    m_edits.discard();
    refresh();
    emit sitesEdited();
}

JSON SiteTree::beginCommit() {
    return m_edits.beginCommit();
}

void SiteTree::endCommit(bool success) {
    if (!m_edits.isCommitting())
        return;
    if (success)
        m_edits.commitSucceeded();
    else
        m_edits.commitFailed();
    refresh();
    emit sitesEdited();
}

/// Shows what the edits say now, or as soon as nobody types any more.
void SiteTree::refresh() {
    m_rebuildWanted = state() == EditingState;
    if (!m_rebuildWanted && !(m_built && showSame(m_shown, m_edits.merged())))
        rebuild();
}

void SiteTree::rebuild() {
    const QString selected = currentSite();
    const QSet<QString> collapsed = collapsedSites();
    const int scrolled = verticalScrollBar()->value();
    m_rebuildWanted = false;
    m_built = true;
    {
        const QSignalBlocker blocker(this);
        // Scrolling to the current row would open the sites above it that the user has closed.
        setAutoScroll(false);
        build();
        expandAllBut(collapsed);
        select(selected);
        executeDelayedItemsLayout();
        verticalScrollBar()->setValue(scrolled);
        setAutoScroll(true);
    }
    if (currentSite() != selected)
        emit currentSiteChanged(currentSite());
}

void SiteTree::build() {
    clear();
    m_items.clear();
    addCaption(tr("DEVICE"));
    m_items.insert(Sites::overviewId, addOverview());
    addCaption(tr("SITE MANAGEMENT"));
    buildSites();
    const QString none = m_counts.isEmpty() ? QString() : QLocale().toString(0);
    const QSignalBlocker blocker(model());
    for (auto it = m_items.cbegin(); it != m_items.cend(); ++it)
        it.value()->setData(0, countRole, m_counts.value(it.key(), none));
}

void SiteTree::buildSites() {
    m_shown = m_edits.merged();
    const QIcon icon = Icons::icon(QStringLiteral(":/images/icon_general_location_solid.svg"), siteIconSize);
    QList<QTreeWidgetItem *> top;
    for (const Sites::Site &site : m_shown) {
        auto *item = new QTreeWidgetItem({site.name});
        item->setData(0, siteIdRole, site.id);
        item->setToolTip(0, siteToolTip(site.name));
        item->setIcon(0, icon);
        item->setFlags(item->flags() | Qt::ItemIsEditable);
        // Parents stand in front of their children, so a missing one means top level.
        if (QTreeWidgetItem *parent = m_items.value(site.parentId))
            parent->addChild(item);
        else
            top.append(item);
        m_items.insert(site.id, item);
    }
    addTopLevelItems(top);
}

void SiteTree::expandAllBut(const QSet<QString> &collapsed) {
    // With a layout to come, expanding a row is a mark and no layout of its own.
    scheduleDelayedItemsLayout();
    for (auto it = m_items.cbegin(); it != m_items.cend(); ++it) {
        if (it.value()->childCount() > 0 && !collapsed.contains(it.key()))
            it.value()->setExpanded(true);
    }
}

QSet<QString> SiteTree::collapsedSites() const {
    QSet<QString> collapsed;
    for (auto it = m_items.cbegin(); it != m_items.cend(); ++it) {
        if (it.value()->childCount() > 0 && !it.value()->isExpanded())
            collapsed.insert(it.key());
    }
    return collapsed;
}

void SiteTree::addCaption(const QString &text) {
    auto *item = new QTreeWidgetItem({text});
    item->setFlags(Qt::NoItemFlags);
    addTopLevelItem(item);
}

QTreeWidgetItem *SiteTree::addOverview() {
    auto *item = new QTreeWidgetItem({tr("Device Overview")});
    item->setData(0, siteIdRole, Sites::overviewId);
    item->setIcon(0, Icons::icon(QStringLiteral(":/images/icon_general_group_solid.svg"), siteIconSize));
    item->setFlags(item->flags() & ~Qt::ItemIsDragEnabled);
    addTopLevelItem(item);
    return item;
}

void SiteTree::select(const QString &siteId) {
    setCurrentItem(m_items.value(siteId, m_items.value(Sites::overviewId)));
}

void SiteTree::setCounts(const DeviceSnapshot &devices) {
    const QLocale locale;
    {
        // A change that each row announces is looked up linearly; one repaint does for all.
        const QSignalBlocker blocker(model());
        for (auto it = m_items.cbegin(); it != m_items.cend(); ++it) {
            const QString count = locale.toString(devices.siteCount(it.key()));
            m_counts.insert(it.key(), count);
            it.value()->setData(0, countRole, count);
        }
    }
    viewport()->update();
}

QString SiteTree::currentSite() const {
    const QString id = siteIdOf(currentItem());
    return id.isEmpty() ? Sites::overviewId : id;
}

QString SiteTree::currentSiteName() const {
    return currentItem() ? currentItem()->text(0) : QString();
}

void SiteTree::updateGeometries() {
    QTreeWidget::updateGeometries();
    placeAddButton();
}

void SiteTree::scrollContentsBy(int dx, int dy) {
    QTreeWidget::scrollContentsBy(dx, dy);
    placeAddButton();
}

void SiteTree::placeAddButton() {
    const QTreeWidgetItem *caption = topLevelItem(2);
    if (!m_addTop || !caption)
        return;
    const QRect row = visualItemRect(caption);
    const QSize size = m_addTop->sizeHint();
    m_addTop->setGeometry(viewport()->width() - size.width() - addButtonDistance,
                          row.bottom() + 1 - size.height(), size.width(), size.height());
}

void SiteTree::contextMenuEvent(QContextMenuEvent *event) {
    const bool byKey = event->reason() == QContextMenuEvent::Keyboard;
    const QTreeWidgetItem *item = byKey ? currentItem() : itemAt(event->pos());
    if (!isSite(item))
        return;
    const QPoint place = byKey ? visualItemRect(item).center() : event->pos();
    menuOf(item)->popup(viewport()->mapToGlobal(place));
}

PopupMenu *SiteTree::menuOf(const QTreeWidgetItem *item) {
    const int depth = depthOf(item);
    qDebug("depth: %d", depth);
    const bool mayAdd = depth + 1 < SiteEdits::maxDepth;
    const bool mayDelete = depth > 0;
    auto *menu = new PopupMenu(this);
    menu->setObjectName(QStringLiteral("siteMenu"));
    menu->setAttribute(Qt::WA_DeleteOnClose);
    const auto addEntry = [this, menu, id = siteIdOf(item)](const char *icon, const QString &text,
                                                            bool enabled,
                                                            void (SiteTree::*work)(const QString &)) {
        QAction *entry = menu->addAction(menuIcon(icon), text);
        entry->setEnabled(enabled);
        // By id, since the rows may be built anew while the menu is open; and when the menu is gone, since an
        // editor that opens under it loses the focus, and closes, as the menu does.
        connect(
            entry, &QAction::triggered, this, [this, id, work] { (this->*work)(id); }, Qt::QueuedConnection);
    };
    addEntry(mayAdd ? "icon_general_plus_line" : "icon_general_plus_line_disabled", tr("Add Site"), mayAdd,
             &SiteTree::addSite);
    addEntry("icon_general_edit_line", tr("Edit Site"), true, &SiteTree::editSite);
    addEntry(mayDelete ? "icon_general_delete_line_red" : "icon_general_delete_line_red_disabled",
             tr("Delete Site"), mayDelete, &SiteTree::askToDelete);
    return menu;
}

void SiteTree::addSite(const QString &parentId) {
    // A name that is still being typed is finished first.
    if (state() == EditingState)
        setFocus();
    const QString id = m_edits.add(parentId, QDateTime::currentMSecsSinceEpoch());
    if (id.isEmpty())
        return;
    refresh();
    emit sitesEdited();
    if (QTreeWidgetItem *parent = m_items.value(parentId))
        expandItem(parent);
    // The site that is shown stays: devices may be selected there to be put into the new one.
    openEditor(id);
}

void SiteTree::editSite(const QString &siteId) {
    QTreeWidgetItem *item = m_items.value(siteId);
    if (!item)
        return;
    setCurrentItem(item);
    openEditor(siteId);
}

void SiteTree::openEditor(const QString &siteId) {
    QTreeWidgetItem *item = m_items.value(siteId);
    if (!item)
        return;
    scrollToItem(item);
    editItem(item);
}

void SiteTree::finishEditing(const QString &siteId, const QString &text) {
    const QString before = m_edits.nameOf(siteId);
    const QString problem = m_edits.rename(siteId, text);
    const QString name = m_edits.nameOf(siteId);
    if (name != before) {
        m_items.value(siteId)->setText(0, name);
        m_items.value(siteId)->setToolTip(0, siteToolTip(name));
        if (!m_rebuildWanted)
            m_shown = m_edits.merged();
        emit sitesEdited();
    }
    if (!problem.isEmpty())
        emit editRefused(problem);
}

void SiteTree::closeEditor(QWidget *editor, QAbstractItemDelegate::EndEditHint) {
    // Tab ends the editing and does not open the next site's editor.
    QTreeWidget::closeEditor(editor, QAbstractItemDelegate::NoHint);
    if (m_rebuildWanted)
        QMetaObject::invokeMethod(this, &SiteTree::refresh, Qt::QueuedConnection);
}

void SiteTree::askToDelete(const QString &siteId) {
    auto *confirm = new ConfirmDialog(ConfirmDialog::Kind::DeleteSite, this);
    confirm->setAttribute(Qt::WA_DeleteOnClose);
    connect(confirm, &QDialog::accepted, this, [this, siteId] { deleteSite(siteId); });
    confirm->open();
}

void SiteTree::deleteSite(const QString &siteId) {
    const QTreeWidgetItem *item = m_items.value(siteId);
    if (!item || !m_edits.contains(siteId))
        return;
    const QString parentId = siteIdOf(item->parent());
    m_edits.remove(siteId);
    if (currentSite() != Sites::overviewId && !m_edits.contains(currentSite()))
        select(parentId);
    refresh();
    emit sitesEdited();
}

// Nothing looks at how the drag ends: the drop has built the rows anew, and Qt would delete one.
void SiteTree::startDrag(Qt::DropActions) {
    const QList<QTreeWidgetItem *> items = selectedItems();
    QMimeData *mime = mimeData(items);
    if (!mime)
        return;
    auto *drag = new QDrag(this);
    drag->setMimeData(mime);
    drag->setPixmap(viewport()->grab(visualItemRect(items.front())));
    drag->exec(Qt::MoveAction);
}

QStringList SiteTree::mimeTypes() const {
    return {QLatin1String(siteMimeType), SiteMembership::mimeType};
}

QMimeData *SiteTree::mimeData(const QList<QTreeWidgetItem *> &items) const {
    if (items.size() != 1 || !isSite(items.front()))
        return nullptr;
    auto *mime = new QMimeData;
    mime->setData(QLatin1String(siteMimeType), siteIdOf(items.front()).toUtf8());
    return mime;
}

Qt::DropActions SiteTree::supportedDropActions() const {
    return Qt::CopyAction | Qt::MoveAction;
}

/// Reads the data of a drag once: it may name a whole fleet, and every move of the cursor asks for it.
void SiteTree::rememberDrag(const QMimeData *mime) {
    if (!m_draggedSite.isEmpty() || m_draggedDevices || !mime)
        return;
    m_draggedSite = QString::fromUtf8(mime->data(QLatin1String(siteMimeType)));
    if (m_draggedSite.isEmpty() && mime->hasFormat(SiteMembership::mimeType))
        m_draggedDevices = SiteMembership::decode(mime->data(SiteMembership::mimeType));
    // Devices go into a site, never between two.
    setDragDropOverwriteMode(m_draggedDevices.has_value());
}

/// The site that a drop goes into, or nothing on captions, the overview and empty space. Between two rows it
/// is what the row under the cursor is in.
QString SiteTree::siteAt(const QPoint &position, bool mayBeBetween) const {
    const QTreeWidgetItem *item = itemAt(position);
    if (!isSite(item))
        return {};
    const QRect row = visualItemRect(item);
    // As much of the row as Qt takes to show the line between two.
    const int margin = mayBeBetween ? qBound(2, qRound(row.height() / 5.5), 12) : 0;
    if (position.y() - row.top() >= margin && row.bottom() - position.y() >= margin)
        return siteIdOf(item);
    return item->parent() ? siteIdOf(item->parent()) : Sites::rootId;
}

SiteTree::DropPlan SiteTree::planOf(const QDropEvent *event) const {
    const QPoint position = event->position().toPoint();
    if (!m_draggedDevices) {
        DropPlan plan{siteAt(position, true), Qt::MoveAction, {}, {}};
        plan.problem = plan.targetId.isEmpty() ? tr("A site can only be dropped on a site or between sites.")
                                               : m_edits.moveProblem(m_draggedSite, plan.targetId);
        plan.tip = plan.problem;
        return plan;
    }
    const bool copies = m_draggedDevices->sourceSiteId == Sites::overviewId ||
                        event->modifiers().testFlag(Qt::ControlModifier);
    DropPlan plan{siteAt(position, false), copies ? Qt::CopyAction : Qt::MoveAction, {}, {}};
    if (plan.targetId.isEmpty())
        plan.problem = tr("Devices can only be dropped on a site.");
    plan.tip = deviceTip(copies, m_draggedDevices->deviceIds.size());
    // Drops are sent at once, and the service would not know what its devices are in.
    if (plan.problem.isEmpty() && !m_edits.isCommitted(plan.targetId))
        plan.tip = plan.problem = tr("Apply the site changes first.");
    return plan;
}

void SiteTree::dragEnterEvent(QDragEnterEvent *event) {
    endDrag();
    rememberDrag(event->mimeData());
    QTreeWidget::dragEnterEvent(event);
    event->setAccepted(!m_draggedSite.isEmpty() || m_draggedDevices);
}

void SiteTree::dragMoveEvent(QDragMoveEvent *event) {
    rememberDrag(event->mimeData());
    if (m_draggedSite.isEmpty() && !m_draggedDevices)
        return event->ignore();
    const DropPlan plan = planOf(event);
    // Qt opens rows, scrolls at the edges and marks the place; the rest is decided here.
    setDropIndicatorShown(plan.problem.isEmpty());
    QTreeWidget::dragMoveEvent(event);
    if (plan.tip.isEmpty())
        m_tip->hide();
    else
        m_tip->showAt(viewport()->mapToGlobal(event->position().toPoint()), plan.tip);
    event->setDropAction(plan.problem.isEmpty() ? plan.action : Qt::IgnoreAction);
    event->setAccepted(plan.problem.isEmpty());
}

void SiteTree::dragLeaveEvent(QDragLeaveEvent *event) {
    endDrag();
    event->accept();
}

void SiteTree::dropEvent(QDropEvent *event) {
    rememberDrag(event->mimeData());
    const QString siteId = m_draggedSite;
    const std::optional<SiteMembership::DraggedDevices> devices = m_draggedDevices;
    const DropPlan plan = planOf(event);
    endDrag();
    const bool isKnown = devices || !siteId.isEmpty();
    const bool isDone = isKnown && plan.problem.isEmpty();
    event->setDropAction(isDone ? plan.action : Qt::IgnoreAction);
    event->setAccepted(isDone);
    if (!isKnown)
        return;
    qDebug(devices ? "external dropEvent!" : "internal dropEvent!");
    if (!isDone) {
        emit dropRefused(plan.problem);
    } else if (devices) {
        emit devicesDropped(plan.targetId, devices->deviceIds, plan.action, devices->sourceSiteId);
    } else {
        m_edits.move(siteId, plan.targetId);
        refresh();
        if (QTreeWidgetItem *target = m_items.value(plan.targetId))
            expandItem(target);
        emit sitesEdited();
    }
}

void SiteTree::hideEvent(QHideEvent *event) {
    endDrag();
    QTreeWidget::hideEvent(event);
}

void SiteTree::endDrag() {
    m_tip->hide();
    m_draggedSite.clear();
    m_draggedDevices.reset();
    setDropIndicatorShown(true);
    if (state() != DraggingState)
        return;
    // Qt's own end of a drag: no more scrolling and no mark.
    QDragLeaveEvent leave;
    QTreeWidget::dragLeaveEvent(&leave);
}
