#pragma once

#include <QTableView>

/// The table of devices that could be added. A check mark leads each row; a click on it or on the text beside
/// it turns it, and so does the space bar in the current row.
class DiscoveredTable : public QTableView {
    Q_OBJECT

public:
    explicit DiscoveredTable(QWidget *parent = nullptr);

    void setModel(QAbstractItemModel *model) override;
};
