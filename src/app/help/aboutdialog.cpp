#include "app/help/aboutdialog.h"

#include "platform/system/thirdpartycomponents.h"
#include "store/localstore.h"
#include "store/serverkeys.h"
#include "ui_aboutdialog.h"
#include "widgets/style/icons.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QHeaderView>

#include <algorithm>
#include <iterator>
#include <vector>

namespace {

constexpr int rowsInSight = 10;

constexpr ThirdPartyComponent parts[] = {
    {"Qt", NVLDM_QT_VERSION, "LGPL 3"},
    {"OpenSSL", NVLDM_OPENSSL_VERSION, "Apache 2.0"},
    {"SQLite", NVLDM_SQLITE_VERSION, "Public domain"},
    {"SQLiteCpp", NVLDM_SQLITECPP_VERSION, "MIT"},
    {"JSON for Modern C++", NVLDM_JSON_VERSION, "MIT"},
    {"cpp-httplib", NVLDM_HTTPLIB_VERSION, "MIT"},
    {"Inter", "", "SIL Open Font License 1.1"},
    {"Symbola", "", "Free for any use"},
};

std::vector<ThirdPartyComponent> allParts() {
    std::vector<ThirdPartyComponent> all(std::begin(parts), std::end(parts));
    const std::span<const ThirdPartyComponent> further = systemParts();
    all.insert(all.end(), further.begin(), further.end());
    return all;
}

QTableWidgetItem *cell(const char *text) {
    return new QTableWidgetItem(QString::fromLatin1(text));
}

} // namespace

AboutDialog::AboutDialog(QWidget *parent)
    : FramelessDialog(parent), m_ui(formIn<Ui::AboutDialog>(content())) {
    setObjectName(QStringLiteral("AboutDialog"));
    setWindowTitle(tr("About"));
    m_ui->logoLabel->setPixmap(Icons::pixmap(QStringLiteral(":/images/logo_mark.svg"), {48, 48}, 2.0));
    m_ui->nameLabel->setText(QCoreApplication::applicationName());
    m_ui->versionLabel->setText(QCoreApplication::applicationVersion());
    showServerKey();
    fillParts();
    connect(m_ui->okButton, &QPushButton::clicked, this, &QDialog::accept);
    m_ui->okButton->setFocus();
}

AboutDialog::~AboutDialog() = default;

void AboutDialog::showServerKey() {
    const LoginInfo login = CLocalStore::instance().loginInfo();
    m_ui->keyWidget->setVisible(!login.serverKey.empty());
    m_ui->keyCaption->setText(login.server == ServerKeys::thisComputer
                                  ? tr("Key of the service on this computer (SHA-256)")
                                  : tr("Key of the server %1 (SHA-256)").arg(login.server));
    m_ui->keyLabel->setText(ServerKeys::readable(login.serverKey));
    connect(m_ui->copyKeyButton, &QPushButton::clicked, this,
            [this] { QGuiApplication::clipboard()->setText(m_ui->keyLabel->text()); });
}

void AboutDialog::fillParts() {
    QTableWidget *table = m_ui->partsTable;
    for (const ThirdPartyComponent &part : allParts()) {
        const int row = table->rowCount();
        table->setRowCount(row + 1);
        table->setItem(row, 0, cell(part.name));
        table->setItem(row, 1, cell(part.version));
        table->setItem(row, 2, cell(part.licence));
    }
    table->horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    table->horizontalHeader()->setSectionResizeMode(QHeaderView::ResizeToContents);
    const int rows = std::min(table->rowCount(), rowsInSight);
    table->setFixedHeight(table->horizontalHeader()->sizeHint().height() +
                          rows * table->verticalHeader()->defaultSectionSize());
    table->setFocusPolicy(rows < table->rowCount() ? Qt::StrongFocus : Qt::NoFocus);
}
