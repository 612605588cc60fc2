#pragma once

#include "api/session/nettask.h"
#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/warningline.h"

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

    static unsigned apply(const Change &change);

    std::unique_ptr<Ui::AccountManagementDialog> m_ui;
    WarningLine m_warning;
    NetTask::Owner m_runner;
};
