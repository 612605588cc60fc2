#include "devices/operations/certificates/certificatepaths.h"

#include "store/lastfolder.h"
#include "widgets/dialogs/filedialogs.h"

#include <QCoreApplication>

namespace CertificatePaths {

namespace {

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(CertificatePaths)
};

QString filters() {
    return Texts::tr("Certificates and keys") + QStringLiteral(" (*.pem *.crt *.cer *.der *.key);;") +
           Texts::tr("All files") + QStringLiteral(" (*)");
}

} // namespace

void ask(QWidget *parent, const QString &title, Count count,
         const std::function<void(const QStringList &)> &chosen) {
    const auto take = [chosen](const QStringList &paths) {
        if (paths.isEmpty())
            return;
        LastFolder::rememberFile(paths.first());
        chosen(paths);
    };
    if (count == Count::Many)
        FileDialogs::askOpenPaths(parent, title, LastFolder::path(), filters(), take);
    else
        FileDialogs::askOpenPath(parent, title, LastFolder::path(), filters(),
                                 [take](const QString &path) { take({path}); });
}

} // namespace CertificatePaths
