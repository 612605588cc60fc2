#pragma once

#include "devices/operations/operationdialog.h"

class FileField;
class QCheckBox;

/// Asks for the application package that devices are to get, and whether it goes to their memory cards.
class UploadPackageDialog : public OperationDialog {
    Q_OBJECT

public:
    explicit UploadPackageDialog(OperationTargets::List targets, QWidget *parent = nullptr);

    FileField *fileField() const { return m_file; }

protected:
    void apply() override;
    bool isComplete() const override;

private:
    void showCardWarnings();

    FileField *m_file;
    QCheckBox *m_card;
};
