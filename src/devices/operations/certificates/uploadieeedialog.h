#pragma once

#include "devices/operations/certificates/certificateuploaddialog.h"

class CaFileField;
class PasswordEdit;
class QLineEdit;
class QTimer;

/// Gives devices what they log in to a network with by IEEE 802.1X: the authority's certificate, and a name
/// with a password (EAP-PEAP) or with a certificate and its private key (EAP-TLS).
class UploadIeeeDialog : public CertificateUploadDialog {
    Q_OBJECT

public:
    enum class Method { Peap, Tls };

    /// managed: all devices of the service, whose certificates can be looked at.
    UploadIeeeDialog(OperationTargets::List targets, DeviceSnapshotPtr managed, QWidget *parent = nullptr);
    ~UploadIeeeDialog() override;

    void setMethod(Method method);
    /// The method of a service task's type; the first one for a type of another dialog.
    static Method methodOf(const QString &serviceType);

    /// Forgets the passwords first.
    void accept() override;

protected:
    bool areFieldsGood() override;
    std::function<bool(UploadTaskMgr &)> insertion() override;
    void takeDropped(const QStringList &paths, const QPoint &place) override;
    bool takesFiles() const override { return true; }
    bool isReading() const override;

private:
    QWidget *buildFields();
    Method method() const;
    void onMethodChanged();

    QComboBox *m_method;
    QLineEdit *m_identity;
    PasswordEdit *m_password;
    PasswordEdit *m_keyPassword;
    CaFileField *m_ca;
    QTimer *m_typed; ///< runs out when nothing more of a key password is typed
    QWidget *m_passwordPart = nullptr;
    QWidget *m_keyPasswordPart = nullptr;
};
