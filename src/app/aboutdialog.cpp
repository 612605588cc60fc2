#include "aboutdialog.h"

#include "icons.h"
#include "ui_aboutdialog.h"

#include <QHeaderView>

namespace {

/// What is shipped with the program or inside it.
struct Part {
    const char *name;
    const char *version;
    const char *licence;
};

constexpr Part parts[] = {
    {"Qt", NVLDM_QT_VERSION, "LGPL 3"},
    {"OpenSSL", NVLDM_OPENSSL_VERSION, "Apache 2.0"},
    {"SQLite", NVLDM_SQLITE_VERSION, "Public domain"},
    {"SQLiteCpp", NVLDM_SQLITECPP_VERSION, "MIT"},
    {"JSON for Modern C++", NVLDM_JSON_VERSION, "MIT"},
    {"cpp-httplib", NVLDM_HTTPLIB_VERSION, "MIT"},
    {"yaml-cpp", NVLDM_YAMLCPP_VERSION, "MIT"},
    {"Inter", "", "SIL Open Font License 1.1"},
    {"Symbola", "", "Free for any use"},
};

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
    fillParts();
    connect(m_ui->okButton, &QPushButton::clicked, this, &QDialog::accept);
}

AboutDialog::~AboutDialog() = default;

void AboutDialog::fillParts() {
    QTableWidget *table = m_ui->partsTable;
    table->setRowCount(static_cast<int>(std::size(parts)));
    for (int row = 0; row < table->rowCount(); ++row) {
        table->setItem(row, 0, cell(parts[row].name));
        table->setItem(row, 1, cell(parts[row].version));
        table->setItem(row, 2, cell(parts[row].licence));
    }
    table->horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    table->horizontalHeader()->setSectionResizeMode(QHeaderView::ResizeToContents);
    table->setFixedHeight(table->horizontalHeader()->sizeHint().height() + table->verticalHeader()->length());
}
