#pragma once

#include "widgets/dialogs/framelessdialog.h"

#include <memory>

namespace Ui {
class AboutDialog;
}

/// Name and version of the program, the key of the server that it is connected to, and whose work it is built
/// on.
class AboutDialog : public FramelessDialog {
    Q_OBJECT

public:
    explicit AboutDialog(QWidget *parent = nullptr);
    ~AboutDialog() override;

private:
    void fillParts();
    void showServerKey();

    std::unique_ptr<Ui::AboutDialog> m_ui;
};
