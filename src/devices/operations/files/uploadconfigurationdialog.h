#pragma once

#include "devices/operations/operationdialog.h"

class FileField;

/// Asks for the configuration file that devices are to get.
class UploadConfigurationDialog : public OperationDialog {
    Q_OBJECT

public:
    explicit UploadConfigurationDialog(OperationTargets::List targets, QWidget *parent = nullptr);

    FileField *fileField() const { return m_file; }

protected:
    void apply() override;
    bool isComplete() const override;

private:
    FileField *m_file;
};
