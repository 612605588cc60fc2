#pragma once

#include "framelessdialog.h"
#include "nettask.h"
#include "warningline.h"

#include <memory>

namespace Ui {
class AccountManagementDialog;
}

/// Changes the password of an account of the service on this computer.
class AccountManagementDialog : public FramelessDialog {
    Q_OBJECT

public:
    explicit AccountManagementDialog(QWidget *parent = nullptr);
    ~AccountManagementDialog() override;

private:
    struct Change;

    void offerKnownAccount();
    void onApply();
    void startChange(const Change &change);
    void setBusy(bool busy);

    static unsigned carryOut(const Change &change);

    std::unique_ptr<Ui::AccountManagementDialog> m_ui;
    WarningLine m_warning;
    NetTask::Owner m_runner;
};
