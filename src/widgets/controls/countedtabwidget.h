#pragma once

#include <QTabWidget>

/// Tabs with a quiet number behind each name, which stays out of the tab's text.
class CountedTabWidget : public QTabWidget {
    Q_OBJECT

public:
    explicit CountedTabWidget(QWidget *parent = nullptr);

    void setCount(int tab, int count);

    /// The parent for pages to be made with: adding one moves it there, and a move styles it all over again.
    QWidget *pageParent() const;
};
