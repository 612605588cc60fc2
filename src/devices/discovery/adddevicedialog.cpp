#include "devices/discovery/adddevicedialog.h"

#include "api/session/pagereader.h"
#include "base/macaddress.h"
#include "devices/discovery/adddevicemanualdialog.h"
#include "devices/discovery/csvdevices.h"
#include "devices/discovery/discoveredmodel.h"
#include "devices/sites/devicecommit.h"
#include "devices/sites/sitelist.h"
#include "store/lastfolder.h"
#include "ui_adddevicedialog.h"
#include "widgets/dialogs/filedialogs.h"
#include "widgets/dialogs/transientmessage.h"
#include "widgets/style/icons.h"

#include <QAction>
#include <QDebug>
#include <QFileInfo>
#include <QLocale>
#include <QThreadPool>

#include <nlohmann/json.hpp>

#include <unordered_set>

struct AddDeviceDialog::Addition {
    unsigned result = ApiOk;
    unsigned check = ApiOk; ///< of reading the list back
    int sent = 0;
    int known = 0; ///< devices that were not sent, since the service had them by then
    std::vector<DeviceRecordPtr> missing;
};

namespace {

std::string macOf(const JSON &record) {
    return MacAddress::plain(textMember(record, "d_mac"));
}

unsigned readMacs(ServiceSession &session, std::unordered_set<std::string> &macs) {
    return PageReader::readAll(session, &CApiClient::listDevices, PageReader::recordsOfPage, [&](JSON &page) {
        for (const JSON &record : page)
            macs.insert(macOf(record));
    });
}

/// The record as it came; what is managed at all is in the overview.
JSON recordToAdd(const DeviceRecord &device) {
    JSON record = parseJson(device.json());
    if (device.siteIds.contains(Sites::overviewId))
        return record;
    JSON sites = JSON::array({Sites::overviewId.toStdString()});
    for (const QString &id : device.siteIds)
        sites.push_back(id.toStdString());
    record["siteid"] = std::move(sites);
    return record;
}

/// The records as an array; of very many the first ones, since all of them are one line of the log.
QByteArray listText(const std::vector<DeviceRecordPtr> &devices) {
    constexpr std::size_t maxListed = 1000;
    QByteArray text = "[";
    for (std::size_t i = 0; i < devices.size() && i < maxListed; ++i)
        text.append(text.size() > 1 ? "," : "").append(QByteArray::fromStdString(devices[i]->json()));
    return text + ']';
}

void logSelected(const std::vector<DeviceRecordPtr> &devices) {
    QThreadPool::globalInstance()->start([devices] {
        int row = 0;
        for (const DeviceRecordPtr &device : devices)
            qDebug("add selected row device: %d, json string: %s", row++, device->json().c_str());
    });
}

void logImported(const std::vector<DeviceRecordPtr> &imported, const std::vector<DeviceRecordPtr> &listed) {
    QThreadPool::globalInstance()->start([imported, listed] {
        qDebug("Found csv devices(%d): %s", static_cast<int>(imported.size()),
               listText(imported).constData());
        qDebug("current devices(%d): %s", static_cast<int>(listed.size()), listText(listed).constData());
    });
}

} // namespace

AddDeviceDialog::AddDeviceDialog(const DeviceSnapshotPtr &managed, QWidget *parent)
    : FramelessDialog(parent),
      m_ui(formIn<Ui::AddDeviceDialog>(content())),
      m_warning(m_ui->msgWarningIcon, m_ui->msgWarningLabel),
      m_model(new DiscoveredModel(this)),
      m_discovery(new DeviceDiscovery(this)) {
    setObjectName(QStringLiteral("AddDeviceDialog"));
    setWindowTitle(tr("Add Device"));
    m_askOpenPath = [this](const auto &chosen) {
        FileDialogs::askOpenPath(this, tr("Open File"), LastFolder::path(), QStringLiteral("csv File(*.csv)"),
                                 chosen);
    };
    m_askSavePath = [this](const auto &chosen) {
        const QString suggestion = LastFolder::file(tr("Devices") + QStringLiteral(".csv"));
        FileDialogs::askSavePath(this, tr("Save as"), suggestion, QStringLiteral("csv File(*.csv)"),
                                 QStringLiteral("csv"), chosen);
    };
    m_ui->discoveredTable->showList(m_model, {150, 170, 140, 170, 110}, DiscoveredModel::IpColumn);
    m_ui->searchEdit->addAction(
        Icons::icon(QStringLiteral(":/images/icon_general_search_line.svg"), {16, 16}),
        QLineEdit::LeadingPosition);
    // What comes and goes must not move what stands beside it.
    QSizePolicy policy = m_ui->spinner->sizePolicy();
    policy.setRetainSizeWhenHidden(true);
    m_ui->spinner->setSizePolicy(policy);
    connectParts();
    updateSelection();
    setManaged(managed);
}

AddDeviceDialog::~AddDeviceDialog() {
    m_stopReading.request_stop();
}

void AddDeviceDialog::setManaged(const DeviceSnapshotPtr &managed) {
    m_managed = managed;
    // What is being added stays until that is done.
    if (managed && !m_adding)
        m_knownFound += m_model->setManaged(*managed);
    updateState();
}

void AddDeviceDialog::connectParts() {
    connect(m_model, &DiscoveredModel::changed, this, [this] {
        updateSelection();
        updateState();
    });
    connect(m_discovery, &DeviceDiscovery::found, this, &AddDeviceDialog::onFound);
    connect(m_discovery, &DeviceDiscovery::progressed, this, &AddDeviceDialog::updateState);
    connect(m_discovery, &DeviceDiscovery::failed, this, [this](const QString &reason) {
        m_failure = reason;
        m_warning.setText(tr("The search failed: %1.").arg(reason));
        updateState();
    });
    connect(m_ui->searchEdit, &QLineEdit::textChanged, m_model, &DiscoveredModel::setSearch);
    connect(m_ui->selectAllCheckBox, &QCheckBox::clicked, this,
            [this] { m_model->setShownChecked(m_model->shownState() != Qt::Checked); });
    connect(m_ui->refreshButton, &QPushButton::clicked, this, &AddDeviceDialog::deviceAutoDiscovery);
    connect(m_ui->addManuallyButton, &QPushButton::clicked, this, &AddDeviceDialog::openManualDialog);
    connect(m_ui->importCsvButton, &QPushButton::clicked, this,
            [this] { m_askOpenPath([this](const QString &path) { importCsv(path); }); });
    connect(m_ui->templateButton, &QToolButton::clicked, this,
            [this] { m_askSavePath([this](const QString &path) { saveTemplate(path); }); });
    connect(m_ui->addButton, &QPushButton::clicked, this, &AddDeviceDialog::on_addButton_clicked);
    connect(m_ui->cancelButton, &QPushButton::clicked, this, &QDialog::reject);
    connect(this, &QDialog::finished, this, [this] {
        if (!m_adding)
            deleteLater();
    });
}

void AddDeviceDialog::showEvent(QShowEvent *event) {
    FramelessDialog::showEvent(event);
    if (!m_searched)
        deviceAutoDiscovery();
}

void AddDeviceDialog::deviceAutoDiscovery() {
    m_searched = true;
    m_warning.setText({});
    m_failure.clear();
    m_knownFound = 0;
    m_model->clear();
    m_discovery->start({});
}

void AddDeviceDialog::openManualDialog() {
    auto *dialog = new AddDeviceManualDialog(this);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    connect(dialog, &AddDeviceManualDialog::discoveryRequested, this,
            &AddDeviceDialog::onDeviceManualDiscovery);
    dialog->open();
}

void AddDeviceDialog::onDeviceManualDiscovery(DeviceDiscovery::Method method, const QString &from,
                                              const QString &to) {
    qDebug("onDeviceManualDiscovery: method: %d, ip from: %s to %s", static_cast<int>(method),
           qUtf8Printable(from), qUtf8Printable(to));
    m_warning.setText({});
    m_failure.clear();
    m_discovery->start({method, from, to});
}

void AddDeviceDialog::onFound(const DeviceDiscovery::Search &search,
                              const std::vector<DeviceRecordPtr> &devices) {
    const bool isManual = search.method != DeviceDiscovery::Method::Network;
    const DiscoveredModel::Added added =
        m_model->add(devices, isManual ? DeviceSource::Manual : DeviceSource::Network);
    m_knownFound = added.known;
    updateState();
    if (added.withoutMac > 0)
        return m_warning.setText(
            tr("%n device(s) without a good MAC address answered, which cannot be added.", nullptr,
               added.withoutMac));
    if (!isManual || added.taken > 0)
        return;
    if (!devices.empty())
        m_warning.setText(tr("What was found there is managed or listed already."));
    else if (search.method == DeviceDiscovery::Method::Address)
        m_warning.setText(tr("No device was found at %1.").arg(search.from));
    else
        m_warning.setText(tr("No device was found from %1 to %2.").arg(search.from, search.to));
}

/// Runs a job on a file outside the lock of the requests.
template <typename Work, typename Done>
void AddDeviceDialog::runOnFile(const QString &path, Work work, Done done) {
    LastFolder::rememberFile(path);
    m_warning.setText({});
    m_onFile = true;
    const auto ended = [this](JobOutcome end) {
        m_onFile = false;
        updateState();
        if (end != JobOutcome::Delivered)
            m_warning.setText(tr("Nothing was done with the file: %1.").arg(jobEndText(end)));
    };
    auto *runner = NetJob::createRunner("working on a device file", NetTask::Turn::Beside);
    if (!NetJob::post(runner, this, work, done, ended))
        ended(JobOutcome::NotRun);
    updateState();
}

void AddDeviceDialog::importCsv(const QString &path) {
    runOnFile(
        path, [path, stop = m_stopReading.get_token()] { return CsvDevices::readFile(path, stop); },
        [this, path](const CsvDevices::Reading &reading) { onCsvRead(QFileInfo(path).fileName(), reading); });
}

void AddDeviceDialog::saveTemplate(const QString &path) {
    runOnFile(
        path, [path] { return CsvDevices::writeTemplate(path); },
        [this](const QString &error) {
            if (error.isEmpty())
                tell(tr("The template was written."), TransientMessage::Kind::Success);
            else
                m_warning.setText(tr("The template could not be written: %1.").arg(error));
        });
}

void AddDeviceDialog::onCsvRead(const QString &name, const CsvDevices::Reading &reading) {
    if (!reading.error.isEmpty())
        return m_warning.setText(tr("The file \"%1\" could not be read: %2.").arg(name, reading.error));
    logImported(reading.devices, m_model->devices());
    const auto [added, known, withoutMac] = m_model->add(reading.devices, DeviceSource::File);
    if (added > 0)
        tell(tr("%n device(s) added to the list.", nullptr, added), TransientMessage::Kind::Success);
    if (reading.devices.empty() && reading.refused.empty())
        m_warning.setText(tr("There is no device in the file \"%1\".").arg(name));
    else if (known > 0)
        m_warning.setText(tr("Managed or listed already: %n device(s) of the file.", nullptr, known));
    if (reading.refused.empty())
        return;
    std::vector<InvalidDeviceDialog::Entry> entries;
    for (const CsvDevices::RefusedRow &row : reading.refused)
        entries.push_back({tr("Line %1").arg(row.line), row.reason});
    QString message =
        tr("%n row(s) of the file \"%1\" could not be read.", nullptr, reading.refusedCount).arg(name);
    if (reading.refusedCount > static_cast<int>(entries.size()))
        message += QLatin1Char(' ') + tr("The first %1 are listed.").arg(QLocale().toString(entries.size()));
    listInvalid(message, entries);
}

void AddDeviceDialog::on_addButton_clicked() {
    const std::vector<DeviceRecordPtr> devices = m_model->checkedDevices();
    if (devices.empty() || m_adding || !m_managed)
        return;
    logSelected(devices);
    m_warning.setText({});
    m_adding = true;
    DeviceDiscovery::request(
        this, "adding devices", [devices](ServiceSession &session) { return addTo(session, devices); },
        [this](const Addition &addition) { onAdded(addition); },
        [this](const QString &reason) { onAddFailed(reason); });
    updateState();
}

/// Sends those of the devices that the service does not have, and looks which of them it has after that.
/// Other clients add devices too, and a device that is sent as a new one leaves its sites.
AddDeviceDialog::Addition AddDeviceDialog::addTo(ServiceSession &session,
                                                 const std::vector<DeviceRecordPtr> &devices) {
    Addition addition;
    std::unordered_set<std::string> present;
    addition.result = readMacs(session, present);
    if (addition.result != ApiOk)
        return addition;
    JSON records = JSON::array();
    std::vector<DeviceRecordPtr> sent;
    for (const DeviceRecordPtr &device : devices) {
        JSON record = recordToAdd(*device);
        if (present.contains(macOf(record)))
            continue;
        records.push_back(std::move(record));
        sent.push_back(device);
    }
    addition.sent = static_cast<int>(sent.size());
    addition.known = static_cast<int>(devices.size()) - addition.sent;
    addition.result = DeviceCommit::send(session, records);
    if (addition.result != ApiOk || sent.empty())
        return addition;
    addition.check = readMacs(session, present);
    for (std::size_t i = 0; addition.check == ApiOk && i < sent.size(); ++i) {
        if (!present.contains(macOf(records[i])))
            addition.missing.push_back(sent[i]);
    }
    return addition;
}

void AddDeviceDialog::onAdded(const Addition &addition) {
    if (addition.result != ApiOk)
        return onAddFailed(apiResultText(addition.result));
    m_adding = false;
    accept();
    const int missing = static_cast<int>(addition.missing.size());
    QStringList told;
    if (addition.check != ApiOk)
        told += tr("%n device(s) sent; whether the server lists them could not be checked: %1.", nullptr,
                   addition.sent)
                    .arg(apiResultText(addition.check));
    else if (missing < addition.sent)
        told += tr("%n device(s) added.", nullptr, addition.sent - missing);
    if (addition.known > 0)
        told += tr("Managed already and left as they are: %n device(s).", nullptr, addition.known);
    if (!told.isEmpty())
        tell(told.join(QLatin1Char(' ')),
             addition.check == ApiOk ? TransientMessage::Kind::Success : TransientMessage::Kind::Error);
    std::vector<InvalidDeviceDialog::Entry> entries;
    for (const DeviceRecordPtr &device : addition.missing)
        entries.push_back({tr("%1, %2").arg(device->text(DeviceColumn::Ip), device->text(DeviceColumn::Mac)),
                           tr("The server does not list the device after it was sent.")});
    if (missing > 0)
        listInvalid(tr("%n device(s) could not be added.", nullptr, missing), entries);
    emit devicesAdded();
}

void AddDeviceDialog::onAddFailed(const QString &reason) {
    m_adding = false;
    const QString message = tr("The devices could not be added: %1.").arg(reason);
    m_warning.setText(message);
    setManaged(m_managed);
    if (isVisible())
        return;
    tell(message, TransientMessage::Kind::Error);
    deleteLater();
}

void AddDeviceDialog::tell(const QString &message, TransientMessage::Kind kind) {
    if (QWidget *over = isVisible() ? this : parentWidget())
        TransientMessage::show(over, message, kind);
}

void AddDeviceDialog::listInvalid(const QString &message,
                                  const std::vector<InvalidDeviceDialog::Entry> &entries) {
    auto *dialog = new InvalidDeviceDialog(message, entries, isVisible() ? this : parentWidget());
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    dialog->open();
}

void AddDeviceDialog::updateSelection() {
    m_ui->countLabel->setText(
        tr("%1 of %2 devices selected").arg(m_model->checkedCount()).arg(m_model->itemCount()));
    m_ui->selectAllCheckBox->setCheckState(m_model->shownState());
}

void AddDeviceDialog::updateState() {
    const QString wait = waitText();
    m_ui->spinner->setVisible(!wait.isEmpty());
    m_ui->waitLabel->setText(wait);
    for (QWidget *button : std::initializer_list<QWidget *>{m_ui->refreshButton, m_ui->addManuallyButton,
                                                            m_ui->importCsvButton, m_ui->templateButton})
        button->setEnabled(!m_adding && !m_onFile);
    m_ui->addButton->setEnabled(!m_adding && !m_onFile && m_managed && m_model->checkedCount() > 0);
    m_ui->cancelButton->setText(m_adding ? tr("Close") : tr("Cancel"));
    const bool hasRows = m_model->rowCount() > 0;
    m_ui->selectAllCheckBox->setEnabled(hasRows && !m_adding);
    m_ui->discoveredTable->setEnabled(!m_adding);
    updateEmptyPage();
    m_ui->contentStack->setCurrentWidget(hasRows ? m_ui->tablePage : m_ui->emptyPage);
}

QString AddDeviceDialog::waitText() const {
    if (m_adding)
        return tr("Adding...");
    if (m_onFile)
        return tr("Working on the file...");
    if (!m_discovery->isSearching())
        return m_managed ? QString() : tr("Waiting for the list of managed devices...");
    const int passed = m_discovery->passedSeconds();
    if (passed == DeviceDiscovery::scanSeconds)
        return tr("Reading what was found...");
    return tr("Searching... %1 of %2 seconds").arg(passed).arg(DeviceDiscovery::scanSeconds);
}

void AddDeviceDialog::updateEmptyPage() {
    if (m_model->itemCount() > 0) {
        m_ui->emptyTitleLabel->setText(tr("No device matches"));
        m_ui->emptyHintLabel->setText(tr("The search leaves none of the devices."));
    } else if (m_discovery->isSearching()) {
        m_ui->emptyTitleLabel->setText(tr("Searching for devices..."));
        m_ui->emptyHintLabel->setText(tr("The server looks for devices on its network."));
    } else if (!m_failure.isEmpty()) {
        m_ui->emptyTitleLabel->setText(tr("The search failed"));
        m_ui->emptyHintLabel->setText(tr("Press Refresh to try again."));
    } else {
        m_ui->emptyTitleLabel->setText(tr("No new device found"));
        m_ui->emptyHintLabel->setText(
            m_knownFound > 0 ? tr("Managed already: %n device(s) that answered.", nullptr, m_knownFound)
                             : tr("Devices that the server does not reach by itself can be added manually or "
                                  "from a file."));
    }
}
