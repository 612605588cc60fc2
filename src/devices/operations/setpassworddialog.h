#pragma once

#include "api/session/nettask.h"
#include "devices/inventory/passwordpolicy.h"
#include "devices/operations/operationdialog.h"
#include "platform/json.h"

class DeviceActions;
class PasswordEdit;
class PasswordChecklist;
class QComboBox;

/// Asks for the new password of an account on devices, and shows the policy that they hold it to.
class SetPasswordDialog : public OperationDialog {
    Q_OBJECT

public:
    /// actions: carry out what the dialog does to the policy; they outlive the dialog.
    SetPasswordDialog(OperationTargets::List targets, DeviceActions *actions, QWidget *parent = nullptr);
    ~SetPasswordDialog() override;

signals:
    /// devices: array of ids.
    void setPassword(JSON &devices, const QString &name, const QString &password);

protected:
    void apply() override;

private slots:
    void on_policyEditLabel_linkActivated(const QString &link);
    void onApplyPolicy(int length, int type);

private:
    void buildPasswordHead();
    void buildPolicyHead();
    void generate();
    void onTextChanged();
    void showPolicy();
    bool areFieldsGood();
    PasswordPolicy policyOf(int target) const;
    PasswordPolicy policyInForce() const;
    std::vector<TargetWarning> policyWarnings() const;

    DeviceActions *m_actions;
    NetTask::Owner m_netTask;
    QComboBox *m_name;
    QLabel *m_nameWarning;
    PasswordEdit *m_password;
    QLabel *m_passwordWarning;
    QLabel *m_strength;
    PasswordEdit *m_confirm;
    QLabel *m_confirmWarning;
    QLabel *m_policyEdit;
    PasswordChecklist *m_policyView;
    std::vector<PasswordPolicy> m_policies; ///< one a target
};
