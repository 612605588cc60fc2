#pragma once

#include "framelessdialog.h"

#include <memory>

namespace Ui {
class ConfirmDialog;
}

/// Asks before something that cannot be taken back. The kind selects title, text and buttons.
class ConfirmDialog : public FramelessDialog {
    Q_OBJECT

public:
    enum class Kind {
        SwitchServer ///< ends the present session for one with another server
    };

    explicit ConfirmDialog(Kind kind, QWidget *parent = nullptr);
    ~ConfirmDialog() override;

private:
    std::unique_ptr<Ui::ConfirmDialog> m_ui;
};
