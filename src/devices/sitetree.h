#pragma once

#include "deviceinventory.h"
#include "sitelist.h"

#include <QTreeWidget>

/// The navigation pane of the console: the device overview and the hierarchy of sites, with device counts.
class SiteTree : public QTreeWidget {
    Q_OBJECT

public:
    /// Role of a row's site id, the overview's id included; captions have none.
    static constexpr int siteIdRole = Qt::UserRole;
    /// Role of the number of devices that stands at a row's end.
    static constexpr int countRole = Qt::UserRole + 1;

    explicit SiteTree(QWidget *parent = nullptr);

    /// Builds the tree anew unless the sites are those that it shows. The selected site stays selected when
    /// it is still there, else it is the overview.
    void setSites(const Sites::List &sites);
    /// Shows how many devices each site has.
    void setCounts(const DeviceSnapshot &devices);

    /// The id of the selected row.
    QString currentSite() const;
    QString currentSiteName() const;

    /// Selects a site, or the overview where there is no such site.
    void select(const QString &siteId);

signals:
    void currentSiteChanged(const QString &siteId);

private:
    void build();
    void addCaption(const QString &text);
    QTreeWidgetItem *addOverview();

    Sites::List m_sites;
    bool m_built = false;
};
