#pragma once

#include "app/remote/orborganization.h"
#include "app/remote/servicedialog.h"
#include "widgets/dialogs/warningline.h"

#include <memory>

namespace Ui {
class ServiceManagementAddServiceDialog;
}

/// Links the service with a site of the remote-access service: the user signs in there, then chooses where.
/// Accepted when the service was linked.
class ServiceManagementAddServiceDialog : public ServiceDialog {
    Q_OBJECT

public:
    explicit ServiceManagementAddServiceDialog(QWidget *parent = nullptr);
    ~ServiceManagementAddServiceDialog() override;

private:
    enum class Step { Service, Location };
    struct SignIn;

    void connectParts();
    void showStep(Step step);
    void onNext();
    void signIn(const QString &email, const QString &password);
    void onSignedIn(const SignIn &outcome);
    void offerOrganizations(std::vector<OrbOrganization> organizations);
    void offerSites();
    void updateApply();
    void onApply();
    void onApplied(unsigned result);
    void failToApply(const QString &text);
    void setBusy(bool busy);

    std::unique_ptr<Ui::ServiceManagementAddServiceDialog> m_ui;
    WarningLine m_error;
    std::vector<OrbOrganization> m_organizations;
    bool m_busy = false;
};
