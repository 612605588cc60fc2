#pragma once

#include "devices/operations/assignip/ipassignment.h"
#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/warningline.h"

#include <memory>

class AssignIpModel;
class QLineEdit;
class TargetWarningLines;

namespace Ui {
class AssignIpDialogII;
}

/// Asks which addresses devices are to get, and shows each device's new one before anything is sent.
class AssignIpDialogII : public FramelessDialog {
    Q_OBJECT

public:
    /// managed: all devices of the service, whose addresses are not given twice.
    AssignIpDialogII(OperationTargets::List targets, const DeviceSnapshotPtr &managed,
                     QWidget *parent = nullptr);
    ~AssignIpDialogII() override;

private:
    void initFields();
    void initTable();
    void connectParts();
    bool isManual() const;
    void onMethodChanged();
    void onFieldChanged();
    void plan();
    void showWarnings(std::vector<TargetWarning> more);
    void updateState();
    IpAssignment::Network network() const;
    bool areFieldsGood();
    bool complain(QLineEdit *field, const QString &problem);

    void onApply();
    void finishWith(bool isStarted);
    void checkAndApply();
    std::vector<quint32> checkedAddresses() const;
    void onManagedRead(const DeviceSnapshotPtr &managed, const std::vector<quint32> &shown);
    bool applyAutomatically();
    bool applyManually();

    std::unique_ptr<Ui::AssignIpDialogII> m_ui;
    WarningLine m_warning;
    DeviceSnapshotPtr m_managed; ///< as last read
    AssignIpModel *m_model;
    TargetWarningLines *m_targetWarnings;
    std::vector<TargetWarning> m_stateWarnings; ///< what the devices' states speak against
    bool m_enough = false;                      ///< addresses for all devices
    bool m_conflicts = false;
    bool m_checking = false; ///< the addresses in use are being read
};
