#pragma once

#include <QTableWidgetItem>

/// A table item that holds an IPv4 address and sorts by its numbers; a text that is none comes last.
class SortableIpTableWidgetItem : public QTableWidgetItem {
public:
    using QTableWidgetItem::QTableWidgetItem;

    bool operator<(const QTableWidgetItem &other) const override;
};
