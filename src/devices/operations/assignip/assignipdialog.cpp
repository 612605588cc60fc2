#include "devices/operations/assignip/assignipdialog.h"

#include "api/session/servicerequest.h"
#include "devices/inventory/inventoryreader.h"
#include "devices/operations/assignip/assignipmodel.h"
#include "devices/operations/operations.h"
#include "devices/operations/targetwarninglines.h"
#include "tasks/queue/exetaskmgr.h"
#include "ui_assignipdialog.h"
#include "widgets/style/icons.h"

#include <QAction>
#include <QDebug>
#include <QLocale>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <exception>

namespace {

bool isEveryPattern(const QStringList &patterns) {
    return std::all_of(patterns.begin(), patterns.end(), [](const QString &each) {
        return AddressPattern::isAddress(each) || AddressPattern::isPattern(each);
    });
}

qint64 countOf(const QStringList &patterns) {
    qint64 count = 0;
    for (const QString &each : patterns)
        count += AddressPattern::count(each);
    return count;
}

/// Builds a part of the dialog; what fails there leaves the other parts as good as they are.
template <typename Build>
void guarded(const char *message, const Build &build) {
    try {
        build();
    } catch (const std::exception &error) {
        qWarning("%s%s", message, error.what());
    }
}

} // namespace

AssignIpDialogII::AssignIpDialogII(OperationTargets::List targets, const DeviceSnapshotPtr &managed,
                                   QWidget *parent)
    : FramelessDialog(parent),
      m_ui(formIn<Ui::AssignIpDialogII>(content())),
      m_warning(m_ui->msgWarningIcon, m_ui->msgWarningLabel),
      m_managed(managed),
      m_model(new AssignIpModel(std::move(targets), *managed, this)),
      m_targetWarnings(new TargetWarningLines(m_model, content())),
      m_stateWarnings(OperationTargets::warnings(m_model->targets(), OperationTargets::Need::Authorization)) {
    setObjectName(QStringLiteral("AssignIpDialogII"));
    setWindowTitle(tr("Assign IP"));
    setAttribute(Qt::WA_DeleteOnClose);
    guarded("Initiated configuration UI occurs error: ", [this] { initFields(); });
    guarded("Initiated table UI occurs error: ", [this] { initTable(); });
    connectParts();
    onMethodChanged();
}

AssignIpDialogII::~AssignIpDialogII() = default;

void AssignIpDialogII::initFields() {
    m_ui->methodComboBox->addItems({tr("Auto"), tr("Manual")});
    m_ui->maskEdit->setText(QStringLiteral("255.255.255.0"));
    m_ui->warningsLayout->addWidget(m_targetWarnings);
}

void AssignIpDialogII::initTable() {
    m_ui->searchEdit->addAction(
        Icons::icon(QStringLiteral(":/images/icon_general_search_line.svg"), {16, 16}),
        QLineEdit::LeadingPosition);
    m_ui->deviceTable->showList(m_model, {150, 150, 130, 140}, -1);
    m_ui->deviceTable->setEditTriggers(QAbstractItemView::DoubleClicked | QAbstractItemView::EditKeyPressed);
}

void AssignIpDialogII::connectParts() {
    connect(m_ui->methodComboBox, &QComboBox::currentIndexChanged, this, &AssignIpDialogII::onMethodChanged);
    for (QLineEdit *edit :
         {m_ui->addressEdit, static_cast<QLineEdit *>(m_ui->maskEdit),
          static_cast<QLineEdit *>(m_ui->gatewayEdit), static_cast<QLineEdit *>(m_ui->dns1Edit),
          static_cast<QLineEdit *>(m_ui->dns2Edit)})
        connect(edit, &QLineEdit::textChanged, this, &AssignIpDialogII::onFieldChanged);
    connect(m_ui->searchEdit, &QLineEdit::textChanged, m_model, &AssignIpModel::setSearch);
    connect(m_ui->selectAllCheckBox, &QCheckBox::clicked, this,
            [this] { m_model->setShownChecked(m_model->shownState() != Qt::Checked); });
    connect(m_model, &AssignIpModel::changed, this, &AssignIpDialogII::plan);
    connect(m_model, &AssignIpModel::layoutChanged, this, &AssignIpDialogII::plan);
    connect(m_model, &AssignIpModel::addressTyped, this, &AssignIpDialogII::onFieldChanged);
    connect(m_model, &AssignIpModel::addressRefused, this, [this](const QString &text) {
        m_warning.setText(tr("\"%1\" is no IP address; the device keeps the one it had.").arg(text));
    });
    connect(m_ui->applyButton, &QPushButton::clicked, this, &AssignIpDialogII::onApply);
    connect(m_ui->cancelButton, &QPushButton::clicked, this, &QDialog::reject);
}

bool AssignIpDialogII::isManual() const {
    return m_ui->methodComboBox->currentIndex() == 1;
}

void AssignIpDialogII::onMethodChanged() {
    m_ui->manualFields->setVisible(isManual());
    m_model->setAutomatic(!isManual());
    onFieldChanged();
}

void AssignIpDialogII::onFieldChanged() {
    m_warning.setText({});
    plan();
}

IpAssignment::Network AssignIpDialogII::network() const {
    const QStringList patterns = AddressPattern::split(m_ui->addressEdit->text());
    IpAssignment::Network network;
    if (isEveryPattern(patterns))
        network.patterns = patterns;
    if (AddressPattern::isMask(m_ui->maskEdit->address()))
        network.mask = AddressPattern::numberOf(m_ui->maskEdit->address());
    if (m_ui->gatewayEdit->isValid())
        network.gateway = AddressPattern::numberOf(m_ui->gatewayEdit->address());
    return network;
}

/// Hands out addresses as the fields stand and shows what is wrong with them.
void AssignIpDialogII::plan() {
    updateState();
    m_enough = true;
    m_conflicts = false;
    if (!isManual())
        return showWarnings({});
    const IpAssignment::Network network = this->network();
    const std::vector<int> items = m_model->checkedItems();
    IpAssignment &assignment = m_model->assignment();
    // Without a mask nobody can tell which addresses are free for devices.
    if (network.mask == 0) {
        assignment.clear();
        return showWarnings({});
    }
    m_enough = assignment.handOut(network, items);
    std::vector<TargetWarning> warnings = assignment.conflicts(network, items);
    m_conflicts = !warnings.empty();
    for (TargetWarning &each : assignment.doubts(network, items))
        warnings.push_back(std::move(each));
    showWarnings(std::move(warnings));
}

void AssignIpDialogII::showWarnings(std::vector<TargetWarning> more) {
    more.insert(more.begin(), m_stateWarnings.begin(), m_stateWarnings.end());
    m_model->showAddresses(more);
    m_targetWarnings->setWarnings(std::move(more));
}

void AssignIpDialogII::updateState() {
    m_ui->totalLabel->setText(tr("Total Quantity: %1").arg(QLocale().toString(m_model->checkedCount())));
    m_ui->selectAllCheckBox->setCheckState(m_model->shownState());
    m_ui->applyButton->setEnabled(m_model->checkedCount() > 0 && !m_checking);
}

bool AssignIpDialogII::complain(QLineEdit *field, const QString &problem) {
    m_warning.setText(problem);
    field->setFocus();
    return false;
}

bool AssignIpDialogII::areFieldsGood() {
    const QStringList patterns = AddressPattern::split(m_ui->addressEdit->text());
    for (QLineEdit *field : {m_ui->addressEdit, static_cast<QLineEdit *>(m_ui->maskEdit),
                             static_cast<QLineEdit *>(m_ui->gatewayEdit)}) {
        if (field->text().trimmed().isEmpty())
            return complain(field, tr("The field can’t be empty."));
    }
    if (!isEveryPattern(patterns))
        return complain(m_ui->addressEdit, tr("Each address has four parts: numbers from 0 to 255, ranges as "
                                              "in 10-19, or * for any."));
    if (!AddressPattern::isMask(m_ui->maskEdit->address()))
        return complain(m_ui->maskEdit, tr("This is no subnet mask, as 255.255.255.0 is one."));
    if (!m_ui->gatewayEdit->isValid())
        return complain(m_ui->gatewayEdit, tr("The gateway is no IP address."));
    for (IPLineEdit *dns : {m_ui->dns1Edit, m_ui->dns2Edit}) {
        if (!dns->text().isEmpty() && !dns->isValid())
            return complain(dns, tr("The DNS server is no IP address."));
    }
    const int waiting = m_model->assignment().waitingCount(m_model->checkedItems());
    if (countOf(patterns) < waiting || !m_enough || m_conflicts)
        return complain(m_ui->addressEdit,
                        tr("IP conflicts or not enough available IP addresses. Pleasea use available IP or "
                           "try a wider IP range."));
    return true;
}

void AssignIpDialogII::onApply() {
    qDebug("Current assgined IP mode: %s", isManual() ? "Manual" : "Auto");
    plan();
    if (!isManual())
        return finishWith(applyAutomatically());
    if (areFieldsGood())
        checkAndApply();
}

void AssignIpDialogII::finishWith(bool isStarted) {
    if (isStarted)
        accept();
    else
        m_warning.setText(tr("The assignment could not be started."));
}

/// Other clients give devices addresses, too, so the plan has to hold on the list as it is at this moment.
void AssignIpDialogII::checkAndApply() {
    m_warning.setText({});
    m_checking = ServiceRequest::post(
        NetJob::createRunner("reading the addresses in use"), this,
        [previous = m_managed](ServiceSession &session) {
            return InventoryReader::readDevices(session, previous);
        },
        [this, shown = checkedAddresses()](const DeviceSnapshotPtr &managed) {
            onManagedRead(managed, shown);
        },
        [this](JobOutcome end) {
            m_checking = false;
            updateState();
            if (end == JobOutcome::NotRun || end == JobOutcome::Failed)
                onManagedRead(nullptr, {});
        });
    updateState();
    if (!m_checking)
        onManagedRead(nullptr, {});
}

std::vector<quint32> AssignIpDialogII::checkedAddresses() const {
    std::vector<quint32> addresses;
    for (const int item : m_model->checkedItems())
        addresses.push_back(m_model->assignment().address(item));
    return addresses;
}

/// shown: the addresses that the user has agreed to.
void AssignIpDialogII::onManagedRead(const DeviceSnapshotPtr &managed, const std::vector<quint32> &shown) {
    if (!managed)
        return m_warning.setText(tr("The addresses in use could not be read. Press Apply to try again."));
    m_managed = managed;
    m_model->assignment().setManaged(*managed);
    plan();
    if (!isManual() || !areFieldsGood())
        return;
    if (checkedAddresses() == shown)
        return finishWith(applyManually());
    m_warning.setText(
        tr("Some of the addresses were taken meanwhile, so others are given now. Look at them and "
           "press Apply again."));
}

bool AssignIpDialogII::applyAutomatically() {
    qDebug("Applying 'assigning IP automatically'.");
    JSON devices = JSON::array();
    for (const int item : m_model->checkedItems())
        devices.push_back(m_model->targets()[static_cast<std::size_t>(item)].device->id.toStdString());
    return ExeTaskMgr::instance().insertNewAutoAssignIpTask(devices);
}

bool AssignIpDialogII::applyManually() {
    qDebug("Applying 'assigning IP manually'.");
    JSON devices = JSON::array();
    for (const int item : m_model->checkedItems())
        devices.push_back(
            {{"id", m_model->targets()[static_cast<std::size_t>(item)].device->id.toStdString()},
             {"ip", AddressPattern::textOf(m_model->assignment().address(item)).toStdString()}});
    return ExeTaskMgr::instance().insertNewManualAssignIpTask(
        devices, m_ui->maskEdit->address(), m_ui->gatewayEdit->address(), m_ui->dns1Edit->address(),
        m_ui->dns2Edit->address());
}

namespace {

QDialog *on_ipButton_clicked(OperationContext &context, OperationRequest request) {
    return new AssignIpDialogII(std::move(request.targets), context.devices(), context.dialogParent());
}

} // namespace

const Operation Operations::assignIp{.objectName = "ipButton",
                                     .text = QT_TRANSLATE_NOOP("Operation", "Assign IP Address"),
                                     .icon = "tool_assign_ip_line",
                                     .group = Operation::Group::DeviceButtons,
                                     .needs = Operation::Needs::Selection,
                                     .taskTypes = {"deviceAssignIPAuto", "deviceAssignIPManual"},
                                     .helpPage = "addresses.html",
                                     .open = on_ipButton_clicked};
