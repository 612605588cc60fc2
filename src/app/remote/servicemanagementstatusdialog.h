#pragma once

#include "app/login/accountpermission.h"
#include "app/remote/servicedialog.h"
#include "widgets/dialogs/warningline.h"

#include <functional>
#include <memory>

class ServiceSession;
struct OrbServiceStatus;

namespace Ui {
class ServiceManagementStatusDialog;
}

/// Shows the service's link with the remote-access service, lets support in or shuts it out, and ends the
/// link. Accepted when the link was ended.
class ServiceManagementStatusDialog : public ServiceDialog {
    Q_OBJECT

public:
    explicit ServiceManagementStatusDialog(AccountPermission permission, QWidget *parent = nullptr);
    ~ServiceManagementStatusDialog() override;

public slots:
    void enableRemoteAccess(bool on);
    void displayServiceDisconnectDialog(bool checked);

private:
    struct Answer;
    using Request = std::function<Answer(ServiceSession &)>;

    void readStatus();
    void showStatus(const Answer &answer);
    void onToggled(const Answer &answer);
    void showNotSet();
    void fail(const QString &text);
    void disconnectService();
    void onDisconnected(const Answer &answer);
    void run(const char *purpose, Request request,
             void (ServiceManagementStatusDialog::*handle)(const Answer &));
    void setBusy(bool busy);

    std::unique_ptr<Ui::ServiceManagementStatusDialog> m_ui;
    WarningLine m_error;
    bool m_mayChange;
    bool m_known = false; ///< whether support may come in is known
    bool m_allowed = false;
    bool m_busy = false;
};
