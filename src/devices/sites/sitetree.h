#pragma once

#include "devices/inventory/deviceinventory.h"
#include "devices/sites/siteedits.h"
#include "devices/sites/sitemembership.h"

#include <QHash>
#include <QSet>
#include <QTreeWidget>

class DragTip;
class PopupMenu;
class QToolButton;

/// The navigation pane of the console: the device overview and the hierarchy of sites, with device counts.
///
/// The user edits the sites here and drops devices on them. Edits of sites stay here until they are
/// committed; drops of devices are only told. The rows are always built from the records: Qt moves
/// none.
class SiteTree : public QTreeWidget {
    Q_OBJECT

public:
    /// Role of a row's site id, the overview's id included; captions have none.
    static constexpr int siteIdRole = Qt::UserRole;
    /// Role of the number of devices that stands at a row's end.
    static constexpr int countRole = Qt::UserRole + 1;

    explicit SiteTree(QWidget *parent = nullptr);

    /// Shows a new reading of the service's sites with the user's edits on top. What is selected, collapsed
    /// and in view stays so; when the selected site is gone, the overview is selected. An open editor stays
    /// open.
    void setSites(const Sites::List &sites);
    /// Forgets sites and edits, as at the end of a session.
    void forgetSites();
    /// Forgets the edits that were not sent.
    void discardEdits();
    /// Shows how many devices each site has.
    void setCounts(const DeviceSnapshot &devices);

    /// The id of the selected row.
    QString currentSite() const;
    QString currentSiteName() const;

    /// Selects a site, or the overview where there is no such site.
    void select(const QString &siteId);

    /// True while a name is being typed.
    bool isTyping() const { return state() == EditingState; }
    const SiteEdits &edits() const { return m_edits; }
    /// The records to commit; exactly one endCommit follows. Edits may go on meanwhile.
    JSON beginCommit();
    void endCommit(bool success);

signals:
    void currentSiteChanged(const QString &siteId);
    /// There are other edits than before, or none any more: see edits().
    void sitesEdited();
    /// Edits that a new reading has made pointless, as texts for the user.
    void editsDropped(const QStringList &reasons);
    /// A name that was typed cannot be taken.
    void editRefused(const QString &reason);
    /// The source is the site whose devices the table showed: they leave it when the action is a move.
    void devicesDropped(const QString &siteId, const QStringList &deviceIds, Qt::DropAction action,
                        const QString &sourceSiteId);
    void dropRefused(const QString &reason);

protected:
    void contextMenuEvent(QContextMenuEvent *event) override;
    void closeEditor(QWidget *editor, QAbstractItemDelegate::EndEditHint hint) override;
    void startDrag(Qt::DropActions supportedActions) override;
    void dragEnterEvent(QDragEnterEvent *event) override;
    void dragMoveEvent(QDragMoveEvent *event) override;
    void dragLeaveEvent(QDragLeaveEvent *event) override;
    void dropEvent(QDropEvent *event) override;
    void hideEvent(QHideEvent *event) override;
    void updateGeometries() override;
    void scrollContentsBy(int dx, int dy) override;
    QStringList mimeTypes() const override;
    QMimeData *mimeData(const QList<QTreeWidgetItem *> &items) const override;
    Qt::DropActions supportedDropActions() const override;

private:
    struct DropPlan; // what a drop at the present position would do

    void refresh();
    void rebuild();
    void build();
    void buildSites();
    void expandAllBut(const QSet<QString> &collapsed);
    QSet<QString> collapsedSites() const;
    void addCaption(const QString &text);
    QTreeWidgetItem *addOverview();
    void placeAddButton();

    PopupMenu *menuOf(const QTreeWidgetItem *item);
    void addSite(const QString &parentId);
    void editSite(const QString &siteId);
    void openEditor(const QString &siteId);
    void askToDelete(const QString &siteId);
    void deleteSite(const QString &siteId);
    void finishEditing(const QString &siteId, const QString &text);

    void rememberDrag(const QMimeData *data);
    QString siteAt(const QPoint &position, bool mayBeBetween) const;
    DropPlan planOf(const QDropEvent *event) const;
    void endDrag();

    SiteEdits m_edits;
    Sites::List m_shown;
    QHash<QString, QTreeWidgetItem *> m_items; ///< by site id, the overview's included
    QHash<QString, QString> m_counts;
    bool m_built = false;
    bool m_rebuildWanted = false; ///< as soon as the open editor is closed

    QString m_draggedSite;
    std::optional<SiteMembership::DraggedDevices> m_draggedDevices;
    DragTip *m_tip;
    QToolButton *m_addTop = nullptr;
};
