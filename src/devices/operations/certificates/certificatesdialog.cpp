#include "devices/operations/certificates/certificatesdialog.h"

#include "devices/operations/certificates/certificatelistmodel.h"
#include "devices/operations/operations.h"
#include "widgets/lists/rowdelegate.h"
#include "widgets/style/icons.h"
#include "widgets/style/theme.h"

#include <QDateTime>
#include <QFrame>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QLocale>
#include <QPushButton>
#include <QStackedWidget>
#include <QTableView>

namespace {

constexpr QSize listSize{1080, 460};
constexpr int widths[] = {120, 110, 110, 220, 130, 130, 110};

} // namespace

CertificatesDialog::CertificatesDialog(const DeviceSnapshotPtr &devices, QWidget *parent)
    : FramelessDialog(parent),
      m_model(new CertificateListModel(this)),
      m_pages(new QStackedWidget(content())) {
    setObjectName(QStringLiteral("CertificatesDialog"));
    setWindowTitle(tr("Certificates in use"));
    setAttribute(Qt::WA_DeleteOnClose);
    auto *body = new QWidget(content());
    auto *parts = new QVBoxLayout(body);
    parts->setContentsMargins(20, 14, 20, 14);
    parts->setSpacing(8);
    parts->addWidget(buildHead());
    parts->addWidget(m_pages, 1);
    m_pages->addWidget(buildTable());
    m_empty = addPage("emptyLabel", tr("Reading the certificates…"));
    m_pages->setCurrentWidget(m_empty);
    m_pages->setFixedSize(listSize);
    auto *layout = new QVBoxLayout(content());
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(body, 1);
    layout->addWidget(buildFooter());
    connect(m_search, &QLineEdit::textChanged, m_model, &CertificateListModel::setSearch);
    connect(m_model, &CertificateListModel::arranged, this, &CertificatesDialog::showState);
    connect(m_model, &CertificateListModel::failed, this,
            [this] { m_empty->setText(tr("The certificates could not be read.")); });
    connect(m_table, &QTableView::activated, this, &CertificatesDialog::choose);
    m_search->setFocus();
    m_model->gather(devices, QDateTime::currentMSecsSinceEpoch());
}

QWidget *CertificatesDialog::buildHead() {
    auto *head = new QWidget(content());
    m_expired = new QLabel(head);
    m_expired->setObjectName(QStringLiteral("expiredLabel"));
    m_expired->setProperty("role", "warning");
    m_search = new QLineEdit(head);
    m_search->setObjectName(QStringLiteral("searchEdit"));
    m_search->setAccessibleName(tr("Search"));
    m_search->setPlaceholderText(tr("Search device or subject"));
    m_search->setMaxLength(256);
    m_search->setFixedWidth(300);
    m_search->addAction(Icons::icon(QStringLiteral(":/images/icon_general_search_line.svg"), {16, 16}),
                        QLineEdit::LeadingPosition);
    auto *layout = new QHBoxLayout(head);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_expired, 1);
    layout->addWidget(m_search);
    return head;
}

QWidget *CertificatesDialog::buildTable() {
    m_table = new QTableView(m_pages);
    m_table->setObjectName(QStringLiteral("certificateTable"));
    m_table->setAccessibleName(windowTitle());
    m_table->setModel(m_model);
    m_table->setItemDelegate(new RowDelegate(m_table));
    m_table->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_table->setSelectionMode(QAbstractItemView::SingleSelection);
    m_table->setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    m_table->setShowGrid(false);
    m_table->setWordWrap(false);
    m_table->setTabKeyNavigation(false);
    m_table->verticalHeader()->hide();
    m_table->verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    m_table->verticalHeader()->setDefaultSectionSize(Theme::rowHeight);
    QHeaderView *header = m_table->horizontalHeader();
    header->setHighlightSections(false);
    header->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    header->setStretchLastSection(true);
    header->setFixedHeight(34);
    for (int column = 0; column < static_cast<int>(std::size(widths)); ++column)
        m_table->setColumnWidth(column, widths[column]);
    header->setSortIndicator(static_cast<int>(CertificateColumn::Expires), Qt::AscendingOrder);
    m_table->setSortingEnabled(true);
    return m_table;
}

QLabel *CertificatesDialog::addPage(const char *name, const QString &text) {
    auto *page = new QLabel(text, m_pages);
    page->setObjectName(QLatin1String(name));
    page->setTextFormat(Qt::PlainText);
    page->setAlignment(Qt::AlignCenter);
    page->setProperty("role", "quiet");
    m_pages->addWidget(page);
    return page;
}

QWidget *CertificatesDialog::buildFooter() {
    auto *footer = new QFrame(content());
    footer->setObjectName(QStringLiteral("dialogFooter"));
    m_count = new QLabel(footer);
    m_count->setObjectName(QStringLiteral("countLabel"));
    m_count->setProperty("role", "caption");
    auto *close = new QPushButton(tr("Close"), footer);
    close->setObjectName(QStringLiteral("closeButton"));
    close->setAutoDefault(false);
    auto *layout = new QHBoxLayout(footer);
    layout->setContentsMargins(20, 14, 20, 14);
    layout->addWidget(m_count, 1);
    layout->addWidget(close);
    connect(close, &QPushButton::clicked, this, &QDialog::accept);
    return footer;
}

void CertificatesDialog::choose(const QModelIndex &index) {
    emit deviceChosen(m_model->at(index.row()).device->id);
    accept();
}

void CertificatesDialog::showState() {
    const QLocale locale;
    const int shown = m_model->rowCount();
    const int expired = m_model->expiredCount();
    const int soon = m_model->soonCount();
    m_pages->setCurrentIndex(shown > 0 ? 0 : 1);
    m_empty->setText(m_model->total() == 0 ? tr("No device works with a certificate.")
                                           : tr("No certificate matches the search."));
    m_expired->setText(expired + soon == 0 ? QString()
                                           : tr("%1 expired, %2 within %3 days")
                                                 .arg(locale.toString(expired), locale.toString(soon),
                                                      QString::number(CertificateValidities::soonDays)));
    m_count->setText(
        tr("%1 of %2 certificates").arg(locale.toString(shown), locale.toString(m_model->total())));
}

namespace {

QDialog *openCertificateList(OperationContext &context, OperationRequest) {
    auto *dialog = new CertificatesDialog(context.devices(), context.dialogParent());
    QObject::connect(dialog, &CertificatesDialog::deviceChosen, context.dialogParent(),
                     [&context](const QString &id) { context.selectDevice(id, {}); });
    return dialog;
}

} // namespace

const Operation Operations::certificateList{.objectName = "certificateListAction",
                                            .text = QT_TRANSLATE_NOOP("Operation", "Certificates in use"),
                                            .group = Operation::Group::RowMenu,
                                            .needs = Operation::Needs::Session,
                                            .helpPage = "certificates.html",
                                            .open = openCertificateList};
