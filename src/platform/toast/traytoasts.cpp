#include "platform/toast/toast.h"
#include "platform/toast/toasttext.h"

#include <QApplication>
#include <QStyle>
#include <QSystemTrayIcon>

#include <utility>

namespace {

/// Messages of an icon in the tray. There is one at a time, without buttons; that it has gone shows with the
/// next one only.
class TrayToasts : public ToastPresenter {
public:
    bool initialize(const QString &applicationName, const QString &) override {
        if (!QSystemTrayIcon::isSystemTrayAvailable() || !QSystemTrayIcon::supportsMessages())
            return false;
        connect(&m_icon, &QSystemTrayIcon::messageClicked, this, [this] {
            if (const std::unique_ptr<ToastHandler> handler = std::move(m_handler))
                handler->toastActivated();
        });
        m_icon.setToolTip(shortApplicationName(applicationName));
        // Without a picture the tray takes neither icon nor messages.
        const QIcon program = QApplication::windowIcon();
        m_icon.setIcon(program.isNull()
                           ? QApplication::style()->standardIcon(QStyle::SP_MessageBoxInformation)
                           : program);
        m_icon.show();
        return true;
    }

    void showToast(const Toast &toast, std::unique_ptr<ToastHandler> handler) override {
        if (!m_icon.isVisible()) {
            emit launchFailed();
            return;
        }
        const std::unique_ptr<ToastHandler> replaced = std::exchange(m_handler, std::move(handler));
        m_icon.showMessage(m_icon.toolTip(), toastLine(toast.text));
        if (replaced)
            replaced->toastDismissed();
    }

private:
    QSystemTrayIcon m_icon;
    std::unique_ptr<ToastHandler> m_handler;
};

} // namespace

std::unique_ptr<ToastPresenter> ToastPresenter::create() {
    return std::make_unique<TrayToasts>();
}
