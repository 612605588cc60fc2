#include "filedialogs.h"

#include <QFileDialog>

namespace FileDialogs {

void askOpenPath(QWidget *parent, const QString &title, const QString &folder, const QString &filter,
                 const std::function<void(const QString &)> &chosen) {
    auto *dialog = new QFileDialog(parent, title, folder, filter);
    dialog->setObjectName(QStringLiteral("openFileDialog"));
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    dialog->setFileMode(QFileDialog::ExistingFile);
    QObject::connect(dialog, &QFileDialog::fileSelected, parent, chosen);
    dialog->open();
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
