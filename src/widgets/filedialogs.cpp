#include "filedialogs.h"

#include <QFileDialog>

namespace FileDialogs {

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

} // namespace FileDialogs
