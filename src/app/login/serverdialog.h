#pragma once

#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/warningline.h"

#include <memory>

namespace Ui {
class ServerDialog;
}

/// What the dialogs for a saved server share: its five fields and the rule that name and information are
/// there.
class ServerDialog : public FramelessDialog {
    Q_OBJECT

public:
    ~ServerDialog() override;

protected:
    ServerDialog(const QString &title, const QString &applyText, QWidget *parent);

    void fill(const QString &remember, const QString &name, const QString &info, const QString &email,
              const QString &password);

    /// Hands the five texts over: remember ("YES" or "NO"), name, information, email, password.
    virtual void apply(const QString &remember, const QString &name, const QString &info,
                       const QString &email, const QString &password) = 0;

private:
    void onApply();
    void tellOfPassword();

    std::unique_ptr<Ui::ServerDialog> m_ui;
    WarningLine m_warning;
};

/// Asks for a server to be added to the saved list.
class AddServerDialog : public ServerDialog {
    Q_OBJECT

public:
    explicit AddServerDialog(QWidget *parent = nullptr);

signals:
    void addServer(const QString &remember, const QString &name, const QString &info, const QString &email,
                   const QString &password);

protected:
    void apply(const QString &remember, const QString &name, const QString &info, const QString &email,
               const QString &password) override;
};

/// Changes a server of the saved list.
class EditServerDialog : public ServerDialog {
    Q_OBJECT

public:
    EditServerDialog(const QString &remember, const QString &name, const QString &info, const QString &email,
                     const QString &password, QWidget *parent = nullptr);

signals:
    void editServer(const QString &remember, const QString &name, const QString &info, const QString &email,
                    const QString &password);

protected:
    void apply(const QString &remember, const QString &name, const QString &info, const QString &email,
               const QString &password) override;
};
