#pragma once

#include "devices/operations/certificates/certificateuploaddialog.h"

class QSpinBox;
class SelfSignedFields;

/// Gives devices certificates for HTTPS: such as they generate themselves, such as were issued for a key of
/// theirs, or certificates together with their private keys.
class UploadHttpsDialog : public CertificateUploadDialog {
    Q_OBJECT

public:
    enum class Method { Generate, Install, Pair };

    /// managed: all devices of the service, whose certificates can be looked at.
    UploadHttpsDialog(OperationTargets::List targets, DeviceSnapshotPtr managed, QWidget *parent = nullptr);

    void setMethod(Method method);
    /// The method of a service task's type; the first one for a type of another dialog.
    static Method methodOf(const QString &serviceType);

protected:
    bool areFieldsGood() override;
    std::function<bool(UploadTaskMgr &)> insertion() override;

private:
    QWidget *buildFields();
    Method method() const;
    void onMethodChanged();
    void showDeviceWarnings();

    QComboBox *m_method;
    QComboBox *m_mode;
    QSpinBox *m_port;
    SelfSignedFields *m_selfSigned;
};
