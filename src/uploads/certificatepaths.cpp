#include "certificatepaths.h"

#include "localstore.h"
#include "storewriter.h"

#include <QCoreApplication>
#include <QFileDialog>
#include <QFileInfo>

namespace CertificatePaths {

namespace {

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(CertificatePaths)
};

QString filters() {
    return Texts::tr("Certificates and keys") + QStringLiteral(" (*.pem *.crt *.cer *.der *.key);;") +
           Texts::tr("All files") + QStringLiteral(" (*)");
}

void rememberFolder(const QString &path) {
    StoreWriter::post([path] { CLocalStore::instance().setDefaultFilePath(QFileInfo(path).absolutePath()); });
}

} // namespace

void ask(QWidget *parent, const QString &title, Count count,
         const std::function<void(const QStringList &)> &chosen) {
    auto *dialog = new QFileDialog(parent, title, CLocalStore::instance().defaultFilePath(), filters());
    dialog->setObjectName(QStringLiteral("openFileDialog"));
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    dialog->setFileMode(count == Count::Many ? QFileDialog::ExistingFiles : QFileDialog::ExistingFile);
    QObject::connect(dialog, &QFileDialog::filesSelected, parent, [chosen](const QStringList &paths) {
        if (paths.isEmpty())
            return;
        rememberFolder(paths.first());
        chosen(paths);
    });
    dialog->open();
}

} // namespace CertificatePaths
