#pragma once

#include "store/serverkeys.h"
#include "widgets/dialogs/framelessdialog.h"

#include <memory>

namespace Ui {
class ServerKeyDialog;
}

/// Asks whether the key that a server shows is to be trusted in place of the remembered one. Only its button
/// accepts it; nothing is changed here.
class ServerKeyDialog : public FramelessDialog {
    Q_OBJECT

public:
    /// server: as ServerKeys names it. newKey: the fingerprint that it shows now.
    ServerKeyDialog(const QString &server, const ServerKey &remembered, const QString &newKey,
                    QWidget *parent = nullptr);
    ~ServerKeyDialog() override;

    /// What to tell where a request to this computer's service ended with ApiKeyChanged.
    static QString localKeyChangedText();

private:
    std::unique_ptr<Ui::ServerKeyDialog> m_ui;
};
