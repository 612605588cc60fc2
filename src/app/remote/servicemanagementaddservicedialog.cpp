#include "app/remote/servicemanagementaddservicedialog.h"

#include "api/session/servicerequest.h"
#include "app/remote/orbtexts.h"
#include "ui_servicemanagementaddservicedialog.h"
#include "widgets/dialogs/transientmessage.h"
#include "widgets/style/plaintext.h"

#include <QStyle>

#include <nlohmann/json.hpp>

#include <algorithm>

struct ServiceManagementAddServiceDialog::SignIn {
    unsigned result = ApiException;
    unsigned listed = ApiException;
    std::vector<OrbOrganization> organizations;
};

namespace {

void addChoice(QComboBox *combo, const QString &name) {
    combo->addItem(name);
    combo->setItemData(combo->count() - 1, PlainText::toolTip(name), Qt::ToolTipRole);
}

/// Sets a property that the style sheet asks for.
void mark(QWidget *widget, const char *property, bool on) {
    widget->setProperty(property, on);
    widget->style()->unpolish(widget);
    widget->style()->polish(widget);
}

} // namespace

ServiceManagementAddServiceDialog::ServiceManagementAddServiceDialog(QWidget *parent)
    : ServiceDialog(parent),
      m_ui(formIn<Ui::ServiceManagementAddServiceDialog>(content())),
      m_error(m_ui->errMsgIcon, m_ui->errMsg) {
    setObjectName(QStringLiteral("ServiceManagementAddServiceDialog"));
    setWindowTitle(tr("Norvell Service Management"));
    m_ui->serviceComboBox->addItem(tr("Orb"));
    m_ui->serviceComboBox->setCurrentIndex(-1);
    m_ui->noteLabel->setTextFormat(Qt::RichText);
    m_ui->noteLabel->setText(tr("Accounts, organizations and sites are managed in the %1.")
                                 .arg(OrbTexts::portalLink(tr("Norvell Partner Desk"))));
    m_ui->noteLabel->setTextInteractionFlags(Qt::LinksAccessibleByMouse | Qt::LinksAccessibleByKeyboard);
    connectParts();
    showStep(Step::Service);
}

ServiceManagementAddServiceDialog::~ServiceManagementAddServiceDialog() = default;

void ServiceManagementAddServiceDialog::connectParts() {
    OrbTexts::openLinksOf(m_ui->noteLabel);
    OrbTexts::openLinksOf(m_ui->errMsg);
    connect(m_ui->nextButton, &QPushButton::clicked, this, &ServiceManagementAddServiceDialog::onNext);
    connect(m_ui->backButton, &QPushButton::clicked, this, [this] { showStep(Step::Service); });
    connect(m_ui->applyButton, &QPushButton::clicked, this, &ServiceManagementAddServiceDialog::onApply);
    for (QComboBox *combo : {m_ui->serviceComboBox, m_ui->organizationComboBox, m_ui->siteComboBox}) {
        mark(combo, "unchosen", true);
        connect(combo, &QComboBox::currentIndexChanged, this,
                [combo](int index) { mark(combo, "unchosen", index < 0); });
    }
    connect(m_ui->organizationComboBox, &QComboBox::currentIndexChanged, this,
            &ServiceManagementAddServiceDialog::offerSites);
    connect(m_ui->siteComboBox, &QComboBox::currentIndexChanged, this,
            &ServiceManagementAddServiceDialog::updateApply);
}

void ServiceManagementAddServiceDialog::showStep(Step step) {
    const bool first = step == Step::Service;
    m_error.setText({});
    m_ui->stepStack->setCurrentWidget(first ? m_ui->servicePage : m_ui->locationPage);
    mark(m_ui->stepOneLabel, "current", first);
    mark(m_ui->stepTwoLabel, "current", !first);
    m_ui->backButton->setVisible(!first);
    m_ui->applyButton->setVisible(!first);
    m_ui->nextButton->setVisible(first);
    (first ? m_ui->nextButton : m_ui->applyButton)->setDefault(true);
    (first ? m_ui->serviceComboBox : m_ui->organizationComboBox)->setFocus();
}

void ServiceManagementAddServiceDialog::onNext() {
    const QString email = m_ui->emailInput->text().trimmed();
    const QString password = m_ui->passwordInput->text();
    if (m_ui->serviceComboBox->currentIndex() < 0 || email.isEmpty() || password.isEmpty())
        m_error.setText(tr("The field can't be empty."));
    else if (!m_busy)
        signIn(email, password);
}

void ServiceManagementAddServiceDialog::signIn(const QString &email, const QString &password) {
    m_error.setText({});
    setBusy(true);
    const auto work = [email, password](ServiceSession &session) {
        SignIn outcome;
        outcome.result = loggedResult("authenticateWithOrb", session.callWithSignIn([&](CApiClient &client) {
            return client.authenticateWithOrb(email.toUtf8().constData(), password.toUtf8().constData());
        }));
        JSON organizations;
        if (outcome.result == ApiOk)
            outcome.listed = loggedResult("browseOrbOrgs", session.callWithSignIn([&](CApiClient &client) {
                return client.browseOrbOrgs(organizations);
            }));
        if (outcome.listed == ApiOk && !organizations.is_array())
            outcome.listed = ApiMissingData;
        outcome.organizations = readOrganizations(organizations);
        return outcome;
    };
    const bool started = ServiceRequest::post(
        NetJob::createRunner("authenticateWithOrb in ServiceManagementAddServiceDialog"), this, work,
        [this](const SignIn &outcome) {
            setBusy(false);
            onSignedIn(outcome);
        },
        [this](JobOutcome end) {
            setBusy(false);
            if (end != JobOutcome::Delivered)
                m_error.setText(OrbTexts::unknownError());
        });
    if (!started) {
        setBusy(false);
        m_error.setText(OrbTexts::unknownError());
    }
}

void ServiceManagementAddServiceDialog::onSignedIn(const SignIn &outcome) {
    if (outcome.result != ApiOk) {
        const OrbTexts::SignInFailure failure = OrbTexts::signInFailure(outcome.result);
        failure.linked ? m_error.setLinkedText(failure.text) : m_error.setText(failure.text);
        return m_ui->passwordInput->setFocus();
    }
    showStep(Step::Location);
    offerOrganizations(outcome.organizations);
    if (outcome.listed == ApiCode105)
        m_error.setText(tr("Session expired. Click 'Back' to go to the previous step and try again."));
    else if (outcome.listed != ApiOk)
        m_error.setText(OrbTexts::failure(outcome.listed));
}

void ServiceManagementAddServiceDialog::offerOrganizations(std::vector<OrbOrganization> organizations) {
    m_organizations = std::move(organizations);
    m_ui->organizationComboBox->clear();
    for (const OrbOrganization &organization : m_organizations)
        addChoice(m_ui->organizationComboBox, organization.name);
    m_ui->organizationComboBox->setCurrentIndex(-1);
    offerSites();
    const auto has = [this](auto matches) {
        return std::any_of(m_organizations.begin(), m_organizations.end(), matches);
    };
    if (!has([](const OrbOrganization &organization) { return !organization.sites.empty(); }))
        m_error.setText(tr("No organization or site exist. Create an organization first or site."));
    else if (has([](const OrbOrganization &organization) { return !organization.remoteAccess; }))
        m_error.setText(tr("One or more customers do not have remote access permission."));
}

void ServiceManagementAddServiceDialog::offerSites() {
    const int index = m_ui->organizationComboBox->currentIndex();
    m_ui->siteComboBox->clear();
    m_error.setText({});
    if (index >= 0) {
        const OrbOrganization &organization = m_organizations[static_cast<std::size_t>(index)];
        for (const OrbOrganization::Site &site : organization.sites)
            addChoice(m_ui->siteComboBox, site.name);
        if (organization.sites.empty())
            m_error.setText(tr("No organization or site exist. Create an organization first or site."));
        else if (!organization.remoteAccess)
            m_error.setText(tr("One or more customers do not have remote access permission."));
    }
    m_ui->siteComboBox->setCurrentIndex(-1);
    updateApply();
}

void ServiceManagementAddServiceDialog::updateApply() {
    m_ui->siteComboBox->setEnabled(m_ui->siteComboBox->count() > 0);
    m_ui->applyButton->setEnabled(!m_busy && m_ui->siteComboBox->currentIndex() >= 0);
}

void ServiceManagementAddServiceDialog::onApply() {
    if (m_busy)
        return;
    const OrbOrganization &organization =
        m_organizations[static_cast<std::size_t>(m_ui->organizationComboBox->currentIndex())];
    const QString site = organization.sites[static_cast<std::size_t>(m_ui->siteComboBox->currentIndex())].id;
    m_error.setText({});
    setBusy(true);
    beginChange(tr("Applying..."));
    const bool started = ServiceRequest::post(
        NetJob::createRunner("addService in ServiceManagementAddServiceDialog"), this,
        [organizationId = organization.id, site](ServiceSession &session) {
            return loggedResult("addService", session.callWithSignIn([&](CApiClient &client) {
                return client.addService(organizationId.toUtf8().constData(), site.toUtf8().constData());
            }));
        },
        [this](unsigned result) {
            setBusy(false);
            onApplied(result);
        },
        [this](JobOutcome end) {
            // With its session the dialog goes as well, and nobody is to be told.
            if (end == JobOutcome::Delivered || end == JobOutcome::SessionGone)
                return;
            setBusy(false);
            onApplied(ApiException);
        });
    if (!started) {
        setBusy(false);
        onApplied(ApiException);
    }
}

void ServiceManagementAddServiceDialog::onApplied(unsigned result) {
    endChange();
    switch (result) {
    case ApiOk:
        TransientMessage::show(parentWidget() ? parentWidget() : this, tr("Applied successfully"),
                               TransientMessage::Kind::Success);
        emit statusChanged(true);
        if (!isClosed())
            accept();
        return;
    case ApiCode105:
        return failToApply(tr("Session expired. Click 'Back' to go to the previous step and try again."));
    case ApiTransportError:
        return failToApply(OrbTexts::unableToConnect());
    default:
        tell(OrbTexts::unknownError(), TransientMessage::Kind::Error);
    }
}

void ServiceManagementAddServiceDialog::failToApply(const QString &text) {
    isClosed() ? tell(text, TransientMessage::Kind::Error) : m_error.setText(text);
}

void ServiceManagementAddServiceDialog::setBusy(bool busy) {
    m_busy = busy;
    m_ui->stepStack->setEnabled(!busy);
    m_ui->backButton->setEnabled(!busy);
    m_ui->nextButton->setEnabled(!busy);
    m_ui->nextButton->setText(busy ? tr("Signing in...") : tr("Next"));
    updateApply();
}
