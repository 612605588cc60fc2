#pragma once

#include "widgets/dialogs/framelessdialog.h"

class QCheckBox;
class TargetModel;

/// The devices that an operation is meant for, to be searched and unticked. What is ticked counts at once.
class TargetListDialog : public FramelessDialog {
    Q_OBJECT

public:
    /// The model must outlive the dialog.
    explicit TargetListDialog(TargetModel *model, QWidget *parent = nullptr);

private:
    QWidget *buildList();
    QWidget *buildFooter();
    void showTicked();

    TargetModel *m_model;
    QCheckBox *m_all = nullptr;
};
