#pragma once

#include "devices/operations/operationdialog.h"

class PasswordEdit;
class QComboBox;

/// Asks for the credentials that the service is to use for devices.
class AuthorizeDeviceDialog : public OperationDialog {
    Q_OBJECT

public:
    explicit AuthorizeDeviceDialog(OperationTargets::List targets, QWidget *parent = nullptr);

    /// The devices to authorize.
    QStringList deviceIds() const;

signals:
    void authDevices(const QString &name, const QString &password);

protected:
    void apply() override;

private:
    std::vector<TargetWarning> accountWarnings() const;

    QComboBox *m_name;
    PasswordEdit *m_password;
    QLabel *m_nameWarning;
    QLabel *m_passwordWarning;
};
