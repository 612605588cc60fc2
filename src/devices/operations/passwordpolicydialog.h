#pragma once

#include "devices/inventory/passwordpolicy.h"
#include "widgets/dialogs/framelessdialog.h"

#include <memory>

namespace Ui {
class PasswordPolicyDialog;
}

/// Asks for the rules that devices are to hold passwords to.
class PasswordPolicyDialog : public FramelessDialog {
    Q_OBJECT

public:
    explicit PasswordPolicyDialog(const PasswordPolicy &policy, QWidget *parent = nullptr);
    ~PasswordPolicyDialog() override;

signals:
    /// type: the mask of the rules.
    void applyPolicy(int length, int type);

private:
    void onApply();

    std::unique_ptr<Ui::PasswordPolicyDialog> m_ui;
};
