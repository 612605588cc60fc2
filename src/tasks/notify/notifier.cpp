#include "tasks/notify/notifier.h"

#include "platform/toast/toast.h"

#include <QDebug>

namespace {

constexpr int openAction = 0;

/// A click on a message, or on its first button, leads to the panel of its kind.
template <Notifier::NOTIFICATION_TYPE type>
class NotificationHandler : public ToastHandler {
public:
    void toastActivated() override { emit Notifier::instance().notificationClicked(type); }
    void toastActivated(int actionIndex) override {
        if (actionIndex == openAction)
            toastActivated();
    }
    void toastDismissed() override {}
    void toastFailed() override {}
};

using AlarmNotificationHandler = NotificationHandler<Notifier::Alarm>;
using TaskNotificationHandler = NotificationHandler<Notifier::Task>;

} // namespace

Notifier &Notifier::instance() {
    // Never destroyed: the desktop may answer until the program ends.
    static auto *const notifier = new Notifier;
    return *notifier;
}

Notifier::Notifier() {
    setPresenter(ToastPresenter::create());
}

Notifier::~Notifier() = default;

void Notifier::setPresenter(std::unique_ptr<ToastPresenter> presenter) {
    static constexpr auto logIncompatible = [] {
        qWarning("Notifier initialize faild when Notifier::Notifier, system is not compatible!");
    };
    m_presenter = std::move(presenter);
    connect(m_presenter.get(), &ToastPresenter::incompatible, this, logIncompatible);
    connect(m_presenter.get(), &ToastPresenter::launchFailed, this,
            [] { qWarning("Could not launch toast notification!"); });
    if (!m_presenter->initialize(QStringLiteral("Norvell Device Manager/Norvell Device Manager"),
                                 QStringLiteral("Norvell INC..Norvell Device Manager")))
        logIncompatible();
}

void Notifier::setEnabled(bool alarms, bool tasks) {
    m_alarmsEnabled = alarms;
    m_tasksEnabled = tasks;
}

void Notifier::ShowMessage(const QString &text, int type, const QString &subject) {
    const Toast toast{text, {tr("Open"), tr("Dismiss")}, subject};
    if (type == Alarm) {
        if (m_alarmsEnabled)
            m_presenter->showToast(toast, std::make_unique<AlarmNotificationHandler>());
    } else if (type == Task) {
        if (m_tasksEnabled)
            m_presenter->showToast(toast, std::make_unique<TaskNotificationHandler>());
    } else {
        qWarning("Unsupported notification type when Notifier::ShowMessage");
    }
}
