#include "widgets/dialogs/confirmdialog.h"

#include "ui_confirmdialog.h"

namespace {

struct Wording {
    QString title;
    QString text;
    QString accept;
};

Wording wordingOf(ConfirmDialog::Kind kind, int count) {
    switch (kind) {
    case ConfirmDialog::Kind::SwitchServer:
        return {ConfirmDialog::tr("Remote Connection"),
                ConfirmDialog::tr(
                    "Are you sure you want to connect to another server? The present session ends."),
                ConfirmDialog::tr("Connect")};
    case ConfirmDialog::Kind::UnfinishedTask:
        return {ConfirmDialog::tr("Unfinished Task"),
                ConfirmDialog::tr("A task was requested and has not begun yet. It may fail when the session "
                                  "ends now. Are you sure you want to go on?"),
                ConfirmDialog::tr("End session")};
    case ConfirmDialog::Kind::UnsavedSites:
        return {
            ConfirmDialog::tr("Site Changes"),
            ConfirmDialog::tr("There are unsaved/unapplied changes of sites, which are lost when the session "
                              "ends now. Are you sure you want to go on?"),
            ConfirmDialog::tr("End session")};
    case ConfirmDialog::Kind::UnsavedSettings:
        return {
            ConfirmDialog::tr("Settings"),
            ConfirmDialog::tr("There are settings that were changed and not applied. The changes are lost "
                              "when the session ends now. Are you sure you want to go on?"),
            ConfirmDialog::tr("End session")};
    case ConfirmDialog::Kind::LeavePage:
        return {ConfirmDialog::tr("Unsaved Changes"),
                ConfirmDialog::tr("There are unsaved/unapplied changes on this page, which are lost when you "
                                  "leave it. Do you want to stay?"),
                ConfirmDialog::tr("Stay")};
    case ConfirmDialog::Kind::CancelTask:
        return {ConfirmDialog::tr("Cancel Task"),
                ConfirmDialog::tr("Are you sure you want to cancel %n task(s)? Devices that are done already "
                                  "stay as they are.",
                                  nullptr, count),
                ConfirmDialog::tr("Cancel task")};
    case ConfirmDialog::Kind::RemoveTasks:
        return {ConfirmDialog::tr("Remove Finished Tasks"),
                ConfirmDialog::tr("Are you sure you want to remove %n finished task(s) from the list, with "
                                  "their results? This action cannot be undone.",
                                  nullptr, count),
                ConfirmDialog::tr("Remove")};
    case ConfirmDialog::Kind::DeleteAlarms:
        return {
            ConfirmDialog::tr("Delete Alarms"),
            ConfirmDialog::tr("Are you sure you want to delete %n alarm(s)? This action cannot be undone.",
                              nullptr, count),
            ConfirmDialog::tr("Delete")};
    case ConfirmDialog::Kind::DeleteDevices:
        return {ConfirmDialog::tr("Delete Device(s) from Device Overview"),
                ConfirmDialog::tr("Are you sure you want to delete the selected device(s) from the system "
                                  "permanently? This action cannot be undone."),
                ConfirmDialog::tr("Delete")};
    case ConfirmDialog::Kind::RemoveFromSite:
        return {ConfirmDialog::tr("Delete Device(s) from Site"),
                ConfirmDialog::tr(
                    "Are you sure you want to delete the copy of selected device(s) from this site? "
                    "This action will not affect the list of Device Overview."),
                ConfirmDialog::tr("Delete")};
    case ConfirmDialog::Kind::RestartDevices:
        return {
            ConfirmDialog::tr("Restart Device"),
            ConfirmDialog::tr("Are you sure you want to restart device? This operation may take some time."),
            ConfirmDialog::tr("Restart")};
    case ConfirmDialog::Kind::DeleteSite:
        return {
            ConfirmDialog::tr("Delete Site"),
            ConfirmDialog::tr("Are you sure you want to delete the site? This action will also delete the "
                              "sub-site(s) and the copy of selected device(s) of each site and sub-site."),
            ConfirmDialog::tr("Delete")};
    case ConfirmDialog::Kind::UnlinkService:
        return {ConfirmDialog::tr("Norvell Service Management"),
                ConfirmDialog::tr("Are you sure you want to disconnect from this service?") +
                    QStringLiteral("\n\n") +
                    ConfirmDialog::tr(
                        "Disconnecting will stop the synchronization of all devices managed by this "
                        "Device Manager. You will need to set up the connection again to restore "
                        "synchronization."),
                ConfirmDialog::tr("Disconnect")};
    }
    return {};
}

} // namespace

ConfirmDialog::ConfirmDialog(Kind kind, QWidget *parent, int count)
    : FramelessDialog(parent), m_ui(formIn<Ui::ConfirmDialog>(content())), m_kind(kind) {
    setObjectName(QStringLiteral("ConfirmDialog"));
    const Wording wording = wordingOf(kind, count);
    setWindowTitle(wording.title);
    m_ui->messageLabel->setText(wording.text);
    m_ui->acceptButton->setText(wording.accept);
    // Beside a button that cancels something else, "Cancel" would say the opposite of what it does.
    if (kind == Kind::CancelTask)
        m_ui->cancelButton->setText(tr("Keep running"));
    if (kind == Kind::LeavePage)
        m_ui->cancelButton->setText(tr("Discard changes"));
    connect(m_ui->acceptButton, &QPushButton::clicked, this, &QDialog::accept);
    connect(m_ui->cancelButton, &QPushButton::clicked, this, [this] { done(QDialog::Rejected); });
}

ConfirmDialog::~ConfirmDialog() = default;

void ConfirmDialog::addDetail(QWidget *detail) {
    m_ui->bodyLayout->addWidget(detail);
}

void ConfirmDialog::setAcceptable(bool acceptable) {
    m_ui->acceptButton->setEnabled(acceptable);
}

void ConfirmDialog::reject() {
    // Changes are lost by the button that says so, never by a key or the cross.
    done(m_kind == Kind::LeavePage ? QDialog::Accepted : QDialog::Rejected);
}
