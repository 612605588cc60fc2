#pragma once

#include "framelessdialog.h"

#include <memory>

namespace Ui {
class ReconnectingDialog;
}

/// Tells that the server does not answer and that the client keeps trying.
class ReconnectingDialog : public FramelessDialog {
    Q_OBJECT

public:
    explicit ReconnectingDialog(QWidget *parent = nullptr);
    ~ReconnectingDialog() override;

    /// Shows or hides the line that says that it is being tried.
    void setStatusVisible(bool visible);

signals:
    /// The user wants to end the session.
    void disconnectBtnClicked();

private:
    std::unique_ptr<Ui::ReconnectingDialog> m_ui;
};
