#pragma once

#include "widgets/dialogs/windowdragger.h"

/// The title area of a frameless dialog: moves the dialog, ignores double clicks.
class DialogDragger : public WindowDragger {
    Q_OBJECT

public:
    using WindowDragger::WindowDragger;

protected:
    void mouseDoubleClickEvent(QMouseEvent *event) override;
};
