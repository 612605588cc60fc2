#include "platform/toast/toast.h"
#include "platform/toast/toasttext.h"

#include <QCoreApplication>
#include <QHash>

#include <wintoastlib.h>

#include <functional>

using namespace WinToastLib;

namespace {

/// Windows calls from threads of its own and lets go of this in any of them; the handler is called, once,
/// and deleted in the user-interface thread.
class HandlerInOtherThreads : public IWinToastHandler {
public:
    explicit HandlerInOtherThreads(std::unique_ptr<ToastHandler> handler)
        : m_handler(std::make_shared<std::unique_ptr<ToastHandler>>(std::move(handler))) {}
    ~HandlerInOtherThreads() override {
        finish([](auto &) {});
    }

    void toastActivated() const override {
        finish([](auto &handler) { handler.toastActivated(); });
    }
    void toastActivated(int index) const override {
        finish([index](auto &handler) { handler.toastActivated(index); });
    }
    /// Of toasts with a field for text, which these are not. Not every version asks for it.
    void toastActivated(std::wstring) const {}
    void toastDismissed(WinToastDismissalReason) const override {
        finish([](auto &handler) { handler.toastDismissed(); });
    }
    void toastFailed() const override {
        finish([](auto &handler) { handler.toastFailed(); });
    }

private:
    void finish(const std::function<void(ToastHandler &)> &tell) const {
        const auto inUserInterface = [held = m_handler, tell] {
            if (const std::unique_ptr<ToastHandler> handler = std::move(*held))
                tell(*handler);
        };
        QMetaObject::invokeMethod(QCoreApplication::instance(), inUserInterface, Qt::QueuedConnection);
    }

    std::shared_ptr<std::unique_ptr<ToastHandler>> m_handler;
};

class WinToasts : public ToastPresenter {
public:
    bool initialize(const QString &applicationName, const QString &applicationUserModelId) override {
        if (!WinToast::isCompatible())
            return false;
        WinToast::instance()->setAppName(shortApplicationName(applicationName).toStdWString());
        WinToast::instance()->setAppUserModelId(applicationUserModelId.toStdWString());
        return WinToast::instance()->initialize();
    }

    void showToast(const Toast &toast, std::unique_ptr<ToastHandler> handler) override {
        WinToastTemplate content(WinToastTemplate::Text01);
        content.setTextField(toastLine(toast.text).toStdWString(), WinToastTemplate::FirstLine);
        for (const QString &action : toast.actions)
            content.addAction(toastLine(action).toStdWString());
        if (m_numbers.contains(toast.subject))
            WinToast::instance()->hideToast(m_numbers.take(toast.subject));
        const auto number =
            WinToast::instance()->showToast(content, new HandlerInOtherThreads(std::move(handler)));
        if (number < 0)
            emit launchFailed();
        else if (!toast.subject.isEmpty())
            m_numbers.insert(toast.subject, number);
    }

private:
    QHash<QString, qint64> m_numbers; ///< of the latest toast of each subject
};

} // namespace

std::unique_ptr<ToastPresenter> ToastPresenter::create() {
    return std::make_unique<WinToasts>();
}
