#pragma once

#include <QObject>
#include <QStringList>

#include <memory>

/// One message of the desktop: a line of plain text and buttons below it.
struct Toast {
    QString text;
    QStringList actions;
    QString subject; ///< a toast takes the place of an earlier one of the same subject; empty for none
};

/// What is done about a toast. Made for one toast, called in the user-interface thread, deleted with it.
class ToastHandler {
public:
    virtual ~ToastHandler() = default;
    /// The body of the toast was clicked.
    virtual void toastActivated() = 0;
    /// A button was pressed; counted from 0.
    virtual void toastActivated(int actionIndex) = 0;
    /// It has gone without either.
    virtual void toastDismissed() = 0;
    virtual void toastFailed() = 0;
};

/// How toasts come to the desktop of this machine. User-interface thread; nothing here waits for the desktop.
class ToastPresenter : public QObject {
    Q_OBJECT

public:
    /// The one for this platform.
    static std::unique_ptr<ToastPresenter> create();

    using QObject::QObject;

    /// Names the program to the desktop. False when this desktop shows no toasts; where that turns out
    /// later, incompatible() tells it once.
    virtual bool initialize(const QString &applicationName, const QString &applicationUserModelId) = 0;

    /// Shows a toast; what happens to it goes to the handler. When it cannot be shown, launchFailed() tells.
    virtual void showToast(const Toast &toast, std::unique_ptr<ToastHandler> handler) = 0;

signals:
    void incompatible();
    void launchFailed();
};
