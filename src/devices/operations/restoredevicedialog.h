#pragma once

#include "devices/operations/operationdialog.h"

#include <array>

class QCheckBox;
class QLineEdit;

/// Asks which settings devices are to restore to factory default, and for the number of the devices, since
/// nothing of it can be taken back.
class RestoreDeviceDialog : public OperationDialog {
    Q_OBJECT

public:
    explicit RestoreDeviceDialog(OperationTargets::List targets, QWidget *parent = nullptr);

    QStringList deviceIds() const;

signals:
    /// Each value is 1 where the devices keep a part of their settings and -1 where they restore it.
    void restoreDevice(int &net, int &dst, int &lang, int &nadp, int &focus, int &lens);

protected:
    void apply() override;
    bool isComplete() const override;

private:
    void buildCountField();
    void showRisk();

    std::array<QCheckBox *, 6> m_parts{};
    QLabel *m_countLabel = nullptr;
    QLineEdit *m_count = nullptr;
};
