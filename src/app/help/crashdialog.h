#pragma once

#include "widgets/dialogs/framelessdialog.h"

/// Shows what a crash of an earlier run has left behind.
class CrashDialog : public FramelessDialog {
    Q_OBJECT

public:
    /// The path is the text's; a long one is shown in part.
    explicit CrashDialog(const QString &path, QWidget *parent = nullptr);

private:
    QWidget *buildBody(const QString &path);
    QWidget *buildFooter(const QString &path);
};
