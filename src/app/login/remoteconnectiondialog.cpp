#include "app/login/remoteconnectiondialog.h"

#include "app/login/serveraddress.h"
#include "app/login/serverdialog.h"
#include "platform/log/messagelog.h"
#include "store/clientstore.h"
#include "store/serverkeys.h"
#include "store/storewriter.h"
#include "ui_remoteconnectiondialog.h"
#include "widgets/style/plaintext.h"

#include <QDateTime>
#include <QDebug>
#include <QHeaderView>
#include <QLocale>
#include <QPointer>

#include <nlohmann/json.hpp>

#include <optional>

namespace {

/// The list as a log line carries it.
QByteArray logText(JSON servers) {
    for (JSON &server : servers) {
        server.erase("sealed");
        server["pass"] = MessageLog::secret(server.value("pass", std::string())).toStdString();
    }
    return QByteArray::fromStdString(dumpJson(servers));
}

JSON record(const QString &id, const QString &remember, const QString &name, const QString &info,
            const QString &email, const QString &password) {
    return {{"id", id.toStdString()},         {"svrname", name.toStdString()},
            {"info", info.toStdString()},     {"acc", email.toStdString()},
            {"pass", password.toStdString()}, {"remember", remember.toStdString()}};
}

/// As ServerKeys names it; empty for an address that cannot be read.
QString keyNameOf(const JSON &server) {
    const std::optional<ServerAddress> address = ServerAddress::parse(stringMember(server, "info"));
    return address ? address->keyName() : QString();
}

QStringList keyNamesOf(const JSON &servers) {
    QStringList names;
    for (const JSON &server : servers)
        names.append(keyNameOf(server));
    return names;
}

QTableWidgetItem *cell(const QString &value) {
    auto *item = new QTableWidgetItem(value);
    item->setToolTip(PlainText::toolTip(value));
    return item;
}

} // namespace

RemoteConnectionDialog::RemoteConnectionDialog(QWidget *parent)
    : FramelessDialog(parent),
      m_ui(formIn<Ui::RemoteConnectionDialog>(content())),
      m_warning(m_ui->msgWarningIcon, m_ui->msgWarningLabel),
      m_servers(std::make_unique<JSON>(JSON::array())) {
    setObjectName(QStringLiteral("RemoteConnectionDialog"));
    setWindowTitle(tr("Remote Connection"));
    m_ui->tableWidget->setColumnCount(3);
    m_ui->tableWidget->setHorizontalHeaderLabels(
        {tr("Server Name"), tr("Server Information"), tr("Key Fingerprint")});
    m_ui->tableWidget->setSelectionMode(QAbstractItemView::SingleSelection);
    m_ui->tableWidget->setColumnWidth(0, 190);
    m_ui->tableWidget->setColumnWidth(1, 190);
    connect(m_ui->remoteSearchEdit, &QLineEdit::textChanged, this, &RemoteConnectionDialog::filterRows);
    connect(m_ui->tableWidget, &QTableWidget::itemSelectionChanged, this,
            &RemoteConnectionDialog::updateButtons);
    connect(m_ui->tableWidget, &QTableWidget::cellDoubleClicked, this,
            &RemoteConnectionDialog::openEditDialog);
    connect(m_ui->addButton, &QPushButton::clicked, this, &RemoteConnectionDialog::openAddDialog);
    connect(m_ui->editButton, &QPushButton::clicked, this, &RemoteConnectionDialog::openEditDialog);
    connect(m_ui->deleteButton, &QPushButton::clicked, this, &RemoteConnectionDialog::deleteSelected);
    connect(m_ui->saveButton, &QPushButton::clicked, this, &RemoteConnectionDialog::save);
    connect(m_ui->cancelButton, &QPushButton::clicked, this, &QDialog::reject);
    load();
}

RemoteConnectionDialog::~RemoteConnectionDialog() = default;

void RemoteConnectionDialog::load() {
    const bool loaded = CClientStore::instance().loadServerList(*m_servers) == 0;
    if (!loaded)
        m_warning.setText(tr("The saved servers could not be read."));
    // A list that was begun anew would take the place of the one that could not be read.
    m_ui->addButton->setEnabled(loaded);
    m_ui->saveButton->setEnabled(loaded);
    m_loadedServers = keyNamesOf(*m_servers);
    qDebug("list server: %s, size: %d", logText(*m_servers).constData(), static_cast<int>(m_servers->size()));
    fillTable();
}

void RemoteConnectionDialog::fillTable() {
    m_ui->tableWidget->setRowCount(static_cast<int>(m_servers->size()));
    int row = 0;
    for (const JSON &server : *m_servers) {
        qDebug("server name: %s, information: %s", qUtf8Printable(stringMember(server, "svrname")),
               qUtf8Printable(stringMember(server, "info")));
        m_ui->tableWidget->setItem(row, 0, cell(stringMember(server, "svrname")));
        m_ui->tableWidget->setItem(row, 1, cell(stringMember(server, "info")));
        m_ui->tableWidget->setItem(
            row, 2, cell(ServerKeys::readable(ServerKeys::instance().fingerprint(keyNameOf(server)))));
        ++row;
    }
    filterRows();
}

void RemoteConnectionDialog::filterRows() {
    for (int row = 0; row < m_ui->tableWidget->rowCount(); ++row)
        m_ui->tableWidget->setRowHidden(row, !matchesSearch((*m_servers)[static_cast<std::size_t>(row)]));
    updateButtons();
}

bool RemoteConnectionDialog::matchesSearch(const JSON &server) const {
    const QString wanted = m_ui->remoteSearchEdit->text().trimmed();
    return stringMember(server, "svrname").contains(wanted, Qt::CaseInsensitive) ||
           stringMember(server, "info").contains(wanted, Qt::CaseInsensitive);
}

/// What was just entered is to be seen, also where the search speaks of others.
void RemoteConnectionDialog::select(int row) {
    if (!matchesSearch((*m_servers)[static_cast<std::size_t>(row)]))
        m_ui->remoteSearchEdit->clear();
    m_ui->tableWidget->selectRow(row);
}

int RemoteConnectionDialog::selectedRow() const {
    const QList<QTableWidgetItem *> items = m_ui->tableWidget->selectedItems();
    return items.isEmpty() || m_ui->tableWidget->isRowHidden(items.first()->row()) ? -1
                                                                                   : items.first()->row();
}

void RemoteConnectionDialog::updateButtons() {
    const bool selected = selectedRow() >= 0 && !m_saving;
    m_ui->editButton->setEnabled(selected);
    m_ui->deleteButton->setEnabled(selected);
    showKeyOfSelected();
}

/// The column has no room for the whole of it.
void RemoteConnectionDialog::showKeyOfSelected() {
    const int row = selectedRow();
    const std::optional<ServerKey> key =
        row < 0 ? std::nullopt
                : ServerKeys::instance().find(keyNameOf((*m_servers)[static_cast<std::size_t>(row)]));
    const auto timeText = [](const QDateTime &time) {
        return QLocale().toString(time.toLocalTime(), QLocale::ShortFormat);
    };
    m_ui->keyLabel->setText(key ? ServerKeys::readable(key->fingerprint) : QString());
    m_ui->keyTimeLabel->setText(
        key       ? tr("First seen %1, last seen %2").arg(timeText(key->firstSeen), timeText(key->lastSeen))
        : row < 0 ? QString()
                  : tr("The key of this server is remembered with the first login."));
}

void RemoteConnectionDialog::openAddDialog() {
    auto *dialog = new AddServerDialog(this);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    connect(dialog, &AddServerDialog::addServer, this, &RemoteConnectionDialog::onAddServer);
    dialog->open();
}

void RemoteConnectionDialog::openEditDialog() {
    const int row = selectedRow();
    if (row < 0)
        return;
    const JSON &server = (*m_servers)[static_cast<std::size_t>(row)];
    auto *dialog = new EditServerDialog(stringMember(server, "remember"), stringMember(server, "svrname"),
                                        stringMember(server, "info"), stringMember(server, "acc"),
                                        stringMember(server, "pass"), this);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    connect(dialog, &EditServerDialog::editServer, this, &RemoteConnectionDialog::onEditServer);
    dialog->open();
}

void RemoteConnectionDialog::onAddServer(const QString &remember, const QString &name, const QString &info,
                                         const QString &email, const QString &password) {
    qDebug("add server remember: %s, name: %s, info: %s, email: %s, password: %s", qUtf8Printable(remember),
           qUtf8Printable(name), qUtf8Printable(info), qUtf8Printable(email),
           MessageLog::secret(password).constData());
    const QString id = QStringLiteral("SVR%1").arg(QDateTime::currentMSecsSinceEpoch());
    m_servers->push_back(record(id, remember, name, info, email, password));
    fillTable();
    select(m_ui->tableWidget->rowCount() - 1);
}

void RemoteConnectionDialog::onEditServer(const QString &remember, const QString &name, const QString &info,
                                          const QString &email, const QString &password) {
    qDebug("edit server remember: %s, name: %s, info: %s, email: %s, password: %s", qUtf8Printable(remember),
           qUtf8Printable(name), qUtf8Printable(info), qUtf8Printable(email),
           MessageLog::secret(password).constData());
    const int row = selectedRow();
    if (row < 0)
        return;
    JSON &server = (*m_servers)[static_cast<std::size_t>(row)];
    // A password that could not be opened is kept while nobody enters another.
    server.update(record(stringMember(server, "id"), remember, name, info, email, password));
    fillTable();
    select(row);
}

void RemoteConnectionDialog::deleteSelected() {
    const int row = selectedRow();
    if (row < 0)
        return;
    m_servers->erase(static_cast<std::size_t>(row));
    m_ui->tableWidget->clearSelection();
    fillTable();
}

void RemoteConnectionDialog::save() {
    setSaving(true);
    StoreWriter::post([servers = *m_servers, dialog = QPointer(this)] {
        const bool saved = CClientStore::instance().saveServerList(servers);
        QMetaObject::invokeMethod(
            qApp,
            [dialog, saved] {
                if (dialog)
                    dialog->onSaved(saved);
            },
            Qt::QueuedConnection);
    });
}

void RemoteConnectionDialog::onSaved(bool saved) {
    setSaving(false);
    if (!saved) {
        m_warning.setText(tr("The list could not be saved; the saved one is as it was."));
        return;
    }
    forgetKeysBut(keyNamesOf(*m_servers));
    qDebug("save server list [%s] to database!", logText(*m_servers).constData());
    emit updateSvr();
    accept();
}

void RemoteConnectionDialog::forgetKeysBut(const QStringList &servers) const {
    for (const QString &server : m_loadedServers) {
        if (!servers.contains(server))
            ServerKeys::instance().forget(server);
    }
}

/// What is being written is not changed meanwhile.
void RemoteConnectionDialog::setSaving(bool saving) {
    m_saving = saving;
    setClosable(!saving);
    for (QPushButton *button : {m_ui->addButton, m_ui->saveButton, m_ui->cancelButton})
        button->setEnabled(!saving);
    updateButtons();
}
