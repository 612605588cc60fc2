#pragma once

#include "widgets/dialogs/framelessdialog.h"

#include <QPointer>

#include <memory>

namespace Ui {
class RefreshDeviceDialog;
}

/// Keeps the window while the states of the devices are read anew. It asks for that when it opens and closes
/// when it is told the end. The keyboard, which it takes meanwhile, goes back to the window that had it.
class RefreshDeviceDialog : public FramelessDialog {
    Q_OBJECT

public:
    explicit RefreshDeviceDialog(QWidget *parent = nullptr);
    ~RefreshDeviceDialog() override;

    void setVisible(bool visible) override;

public slots:
    /// The refresh has ended, well or not.
    void finish();

signals:
    /// The states are to be read now.
    void refresh();
    void refreshDone();

protected:
    void showEvent(QShowEvent *event) override;

private:
    std::unique_ptr<Ui::RefreshDeviceDialog> m_ui;
    QPointer<QWidget> m_activeBefore;
    bool m_asked = false;
};
