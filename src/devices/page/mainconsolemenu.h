#pragma once

#include "widgets/controls/popupmenu.h"

#include <vector>

class QCheckBox;
class QHeaderView;

/// The column menu of a device table: a check box for each column and one for all. It stays open while
/// columns are chosen.
class MainConsoleMenu : public PopupMenu {
    Q_OBJECT

public:
    /// The header must outlive the menu.
    explicit MainConsoleMenu(QHeaderView *header, QWidget *parent = nullptr);

signals:
    void resetRequested();

private:
    QCheckBox *addBox(const QString &text, const QString &name);
    void showState();
    void setAllVisible(bool visible);

    QHeaderView *m_header;
    QCheckBox *m_all;
    std::vector<QCheckBox *> m_boxes;
};
