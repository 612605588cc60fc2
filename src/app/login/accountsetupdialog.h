#pragma once

#include "api/session/nettask.h"
#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/warningline.h"

#include <memory>

namespace Ui {
class AccountSetupDialog;
}

/// Creates the first account of a fresh local service.
class AccountSetupDialog : public FramelessDialog {
    Q_OBJECT

public:
    explicit AccountSetupDialog(QWidget *parent = nullptr);
    ~AccountSetupDialog() override;

signals:
    void accountCreated();

private:
    void onNext();
    void createAccount(const QString &email, const QString &password, bool remember);
    void setBusy(bool busy);

    std::unique_ptr<Ui::AccountSetupDialog> m_ui;
    WarningLine m_warning;
    NetTask::Owner m_runner;
};
