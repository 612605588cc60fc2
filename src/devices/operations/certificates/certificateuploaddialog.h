#pragma once

#include "devices/operations/certificates/certificatebox.h"
#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/warningline.h"

class QComboBox;
class UploadTaskMgr;

/// What the dialogs that give certificates to devices share: the choice of a method and its fields, below
/// them the devices with their files, then the buttons. Files can be dropped anywhere on it.
class CertificateUploadDialog : public FramelessDialog {
    Q_OBJECT

public:
    ~CertificateUploadDialog() override;

signals:
    /// A device was chosen among the certificates in use.
    void deviceChosen(const QString &deviceId);

protected:
    /// managed: all devices of the service, whose certificates can be looked at.
    CertificateUploadDialog(const QString &title, OperationTargets::List targets, DeviceSnapshotPtr managed,
                            QWidget *parent);

    /// Puts the parts together, the devices below the fields.
    void finish(QComboBox *method, QWidget *fields);

    QWidget *body() const { return m_body; }
    CertificateBox *box() const { return m_box; }
    /// Says what is wrong and leads the keyboard there; false for the convenience of callers.
    bool complain(QWidget *field, const QString &problem);
    void clearComplaint() { m_complaint.setText({}); }

    virtual bool areFieldsGood() = 0;
    /// What hands the upload over to its queue; called on a runner.
    virtual std::function<bool(UploadTaskMgr &)> insertion() = 0;
    /// Takes files that were dropped at a place of the dialog.
    virtual void takeDropped(const QStringList &paths, const QPoint &place);
    virtual bool takesFiles() const { return m_box->needs() != CertificateNeeds::Nothing; }
    /// Something is read that has to be known first.
    virtual bool isReading() const { return m_box->isReading(); }
    void updateAccept();

    void dragEnterEvent(QDragEnterEvent *event) override;
    void dropEvent(QDropEvent *event) override;

private:
    QWidget *buildFooter();
    QWidget *buildComplaint();
    void openCertificates();
    void onApply();

    OperationTargets::List m_given; ///< until the box has them
    DeviceSnapshotPtr m_managed;
    QWidget *m_body;
    CertificateBox *m_box = nullptr;
    QLabel *m_complaintIcon;
    QLabel *m_complaintText;
    WarningLine m_complaint;
    QLabel *m_total = nullptr;
    QPushButton *m_apply = nullptr;
};
