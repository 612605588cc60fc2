#include "devices/page/uploaddialogs.h"

#include "devices/operations/certificates/certificatesdialog.h"
#include "devices/operations/certificates/uploadhttpsdialog.h"
#include "devices/operations/certificates/uploadieeedialog.h"
#include "devices/operations/files/exportdebuginfodialog.h"
#include "devices/operations/files/uploadconfigurationdialog.h"
#include "devices/operations/files/uploadpackagedialog.h"
#include "devices/operations/firmware/uploadfirmwaredialog.h"
#include "devices/operations/quicksetup/quicksetupdialog.h"
#include "devices/page/devicewindow.h"
#include "tasks/queue/uploadtaskmgr.h"

UploadDialogs::UploadDialogs(DeviceWindow *console) : QObject(console), m_console(console) {
    connect(console, &DeviceWindow::uploadWanted, this,
            [this](UploadKind kind, const OperationTargets::List &targets) { open(kind, targets); });
    connect(&UploadTaskMgr::instance(), &TaskQueue::dialogNeeded, this, &UploadDialogs::openAgain);
}

void UploadDialogs::open(UploadKind kind, const OperationTargets::List &targets, const QString &serviceType) {
    dialogFor(kind, targets, serviceType)->open();
}

/// A device that was chosen among the certificates is shown in the tables.
template <typename Dialog>
void UploadDialogs::connectChosen(Dialog *dialog) {
    connect(dialog, &Dialog::deviceChosen, m_console,
            [this](const QString &id) { m_console->selectDevice(id, {}); });
}

QDialog *UploadDialogs::dialogFor(UploadKind kind, const OperationTargets::List &targets,
                                  const QString &serviceType) {
    switch (kind) {
    case UploadKind::Firmware:
        return new UploadFirmwareDialog(targets, m_console);
    case UploadKind::Package:
        return new UploadPackageDialog(targets, m_console);
    case UploadKind::Configuration:
        return new UploadConfigurationDialog(targets, m_console);
    case UploadKind::HttpsCertificate: {
        auto *dialog = new UploadHttpsDialog(targets, m_console->devices(), m_console);
        dialog->setMethod(UploadHttpsDialog::methodOf(serviceType));
        connectChosen(dialog);
        return dialog;
    }
    case UploadKind::IeeeCertificate: {
        auto *dialog = new UploadIeeeDialog(targets, m_console->devices(), m_console);
        dialog->setMethod(UploadIeeeDialog::methodOf(serviceType));
        connectChosen(dialog);
        return dialog;
    }
    case UploadKind::CertificateList: {
        auto *dialog = new CertificatesDialog(m_console->devices(), m_console);
        connectChosen(dialog);
        return dialog;
    }
    case UploadKind::DebugInfo:
        return new ExportDebugInfoDialog(targets, m_console);
    case UploadKind::QuickSetup:
        break;
    }
    return new QuickSetupDialog(targets, m_console);
}

void UploadDialogs::openAgain(const QString &serviceType, const QStringList &deviceIds) {
    const OperationTargets::List targets = m_console->targetsWith(deviceIds);
    if (targets.empty())
        return m_console->showError(tr("The devices are not managed any more."));
    const bool isIeee = serviceType.contains(QLatin1String("IEEE"));
    open(isIeee ? UploadKind::IeeeCertificate : UploadKind::HttpsCertificate, targets, serviceType);
}
