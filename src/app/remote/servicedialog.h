#pragma once

#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/transientmessage.h"

/// What the dialogs about the remote-access service share: a change of the link, one at a time.
///
/// A dialog that is closed while its change is under way waits out of sight for the outcome, tells it over
/// its parent's window, and is gone then.
class ServiceDialog : public FramelessDialog {
    Q_OBJECT

public:
    explicit ServiceDialog(QWidget *parent = nullptr) : FramelessDialog(parent) {}

    bool isChanging() const { return !m_change.isEmpty(); }
    /// Shows the dialog again that was closed while its change is under way.
    void comeBack();
    void reject() override;

signals:
    /// Whether the service is linked.
    void statusChanged(bool connected);

protected:
    /// A change is under way, which the text says until endChange.
    void beginChange(const QString &text);
    void endChange();

    bool isClosed() const { return isHidden() && parentWidget(); }
    /// Shows a message over the dialog, or over the parent's window where the dialog was closed.
    void tell(const QString &text, TransientMessage::Kind kind);

private:
    void showChange();

    QString m_change; ///< empty while none is under way
};
