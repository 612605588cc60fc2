#pragma once

#include "widgets/dialogs/framelessdialog.h"

#include <QPointer>

#include <memory>

class QWindow;

namespace Ui {
class ReconnectingDialog;
}

/// Tells that the server does not answer and that the client keeps trying.
///
/// It comes up while the user does something else, so it takes no focus. It stands on its parent's window, or
/// on the modal dialog that is open there, which would block it otherwise.
class ReconnectingDialog : public FramelessDialog {
    Q_OBJECT

public:
    explicit ReconnectingDialog(QWidget *parent);
    ~ReconnectingDialog() override;

    /// Shows or hides the line that says that it is being tried.
    void setStatusVisible(bool visible);

signals:
    /// The user wants to end the session.
    void disconnectBtnClicked();

protected:
    bool event(QEvent *event) override;
    void prepareToShow() override;
    void showEvent(QShowEvent *event) override;
    QRect preferredPlace(const QSize &size) const override;

private:
    QWidget *wantedOwner() const;
    void followOwner();

    std::unique_ptr<Ui::ReconnectingDialog> m_ui;
    QPointer<QWidget> m_owner; ///< what it stands on now
    QPointer<QWindow> m_ownerWindow;
};
