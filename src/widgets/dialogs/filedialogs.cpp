#include "widgets/dialogs/filedialogs.h"

#include <QFileDialog>

namespace FileDialogs {

namespace {

QFileDialog *openDialog(QWidget *parent, const QString &title, const QString &folder, const QString &filter,
                        QFileDialog::FileMode mode) {
    auto *dialog = new QFileDialog(parent, title, folder, filter);
    dialog->setObjectName(QStringLiteral("openFileDialog"));
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    dialog->setFileMode(mode);
    dialog->open();
    return dialog;
}

} // namespace

void askOpenPath(QWidget *parent, const QString &title, const QString &folder, const QString &filter,
                 const std::function<void(const QString &)> &chosen) {
    const auto *dialog = openDialog(parent, title, folder, filter, QFileDialog::ExistingFile);
    QObject::connect(dialog, &QFileDialog::fileSelected, parent, chosen);
}

void askOpenPaths(QWidget *parent, const QString &title, const QString &folder, const QString &filter,
                  const std::function<void(const QStringList &)> &chosen) {
    const auto *dialog = openDialog(parent, title, folder, filter, QFileDialog::ExistingFiles);
    QObject::connect(dialog, &QFileDialog::filesSelected, parent, chosen);
}

void askSavePath(QWidget *parent, const QString &title, const QString &suggestion, const QString &filter,
                 const QString &suffix, const std::function<void(const QString &)> &chosen) {
    auto *dialog = new QFileDialog(parent, title, suggestion, filter);
    dialog->setObjectName(QStringLiteral("saveFileDialog"));
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    dialog->setAcceptMode(QFileDialog::AcceptSave);
    dialog->setDefaultSuffix(suffix);
    QObject::connect(dialog, &QFileDialog::fileSelected, parent, chosen);
    dialog->open();
}

void askFolder(QWidget *parent, const QString &title, const QString &folder,
               const std::function<void(const QString &)> &chosen) {
    auto *dialog = new QFileDialog(parent, title, folder);
    dialog->setObjectName(QStringLiteral("folderDialog"));
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    dialog->setFileMode(QFileDialog::Directory);
    dialog->setOption(QFileDialog::ShowDirsOnly);
    QObject::connect(dialog, &QFileDialog::fileSelected, parent, chosen);
    dialog->open();
}

} // namespace FileDialogs
