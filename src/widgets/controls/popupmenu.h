#pragma once

#include <QMenu>

/// A drop-down menu in the program's look.
class PopupMenu : public QMenu {
    Q_OBJECT

public:
    explicit PopupMenu(QWidget *parent = nullptr);
};
