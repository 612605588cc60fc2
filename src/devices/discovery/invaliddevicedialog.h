#pragma once

#include "widgets/dialogs/framelessdialog.h"

#include <memory>
#include <vector>

namespace Ui {
class InvalidDeviceDialog;
}

/// Lists devices that could not be added, with the reason for each.
class InvalidDeviceDialog : public FramelessDialog {
    Q_OBJECT

public:
    struct Entry {
        QString device; ///< or the row of a file where there is no device yet
        QString reason;
    };

    /// message: what the list is about, a sentence.
    InvalidDeviceDialog(const QString &message, const std::vector<Entry> &entries, QWidget *parent = nullptr);
    ~InvalidDeviceDialog() override;

private:
    void fitWidth();

    std::unique_ptr<Ui::InvalidDeviceDialog> m_ui;
};
