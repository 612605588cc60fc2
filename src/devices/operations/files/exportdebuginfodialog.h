#pragma once

#include "devices/operations/operationdialog.h"

class FileField;

/// Asks for the folder of this computer that the debug information of devices is to be put into.
class ExportDebugInfoDialog : public OperationDialog {
    Q_OBJECT

public:
    explicit ExportDebugInfoDialog(OperationTargets::List targets, QWidget *parent = nullptr);

    FileField *folderField() const { return m_folder; }

protected:
    void apply() override;
    bool isComplete() const override;

private:
    FileField *m_folder;
};
