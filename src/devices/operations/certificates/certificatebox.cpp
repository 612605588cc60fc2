#include "devices/operations/certificates/certificatebox.h"

#include "devices/operations/certificates/certificatepaths.h"
#include "devices/operations/certificates/certificatereader.h"
#include "devices/operations/targetwarninglines.h"
#include "widgets/lists/checktable.h"
#include "widgets/style/icons.h"
#include "widgets/style/plaintext.h"

#include <QCheckBox>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QLocale>
#include <QPushButton>
#include <QToolButton>

namespace {

constexpr int shownStrangers = 3;

/// Gives room to what is said below it before the dialog outgrows small screens.
class YieldingTable : public CheckTable {
public:
    explicit YieldingTable(QWidget *parent) : CheckTable(parent) { setMinimumHeight(110); }
    QSize sizeHint() const override { return {1000, 250}; }
};

} // namespace

CertificateBox::CertificateBox(OperationTargets::List targets, QWidget *parent)
    : QWidget(parent),
      m_model(new CertificateModel(std::move(targets), this)),
      m_reader(new CertificateReader(this)),
      m_layout(new QVBoxLayout(this)),
      m_warnings(new TargetWarningLines(m_model, this)) {
    setObjectName(QStringLiteral("certificateBox"));
    m_layout->setContentsMargins(0, 0, 0, 0);
    m_layout->setSpacing(6);
    m_layout->addWidget(buildHead());
    m_layout->addWidget(buildTable(), 1);
    m_layout->addWidget(buildHandPicking());
    m_filesNote = new QLabel(this);
    m_filesNote->setObjectName(QStringLiteral("filesNoteLabel"));
    m_filesNote->setTextFormat(Qt::PlainText);
    m_filesNote->setProperty("role", "warning");
    m_filesNote->setWordWrap(true);
    m_filesNote->hide();
    m_layout->addWidget(m_filesNote);
    m_layout->addWidget(m_warnings);
    connectParts();
    setNeeds(CertificateNeeds::Nothing);
}

QWidget *CertificateBox::buildHead() {
    auto *head = new QWidget(this);
    m_all = new QCheckBox(tr("Select all/Deselect all"), head);
    m_all->setObjectName(QStringLiteral("selectAllCheckBox"));
    auto *search = new QLineEdit(head);
    search->setObjectName(QStringLiteral("searchEdit"));
    search->setAccessibleName(tr("Search"));
    search->setPlaceholderText(tr("Search model, IP or MAC"));
    search->setMaxLength(256);
    search->setFixedWidth(260);
    search->addAction(Icons::icon(QStringLiteral(":/images/icon_general_search_line.svg"), {16, 16}),
                      QLineEdit::LeadingPosition);
    m_choose = new QPushButton(tr("Choose files…"), head);
    m_choose->setObjectName(QStringLiteral("chooseFilesButton"));
    m_choose->setAutoDefault(false);
    auto *layout = new QHBoxLayout(head);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(12);
    layout->addWidget(m_all);
    layout->addStretch();
    layout->addWidget(search);
    layout->addWidget(m_choose);
    connect(search, &QLineEdit::textChanged, m_model, &CertificateModel::setSearch);
    return head;
}

QWidget *CertificateBox::buildTable() {
    m_table = new YieldingTable(this);
    m_table->setObjectName(QStringLiteral("deviceTable"));
    m_table->setAccessibleName(tr("Devices and their certificates"));
    m_table->showList(m_model, {140, 110, 145, 180, 175, 100}, -1);
    m_table->setSelectionMode(QAbstractItemView::ExtendedSelection);
    return m_table;
}

QToolButton *CertificateBox::addLink(QWidget *line, const char *name, const QString &text) {
    auto *link = new QToolButton(line);
    link->setObjectName(QLatin1String(name));
    link->setText(text);
    link->setFocusPolicy(Qt::StrongFocus);
    link->setProperty("role", "link");
    line->layout()->addWidget(link);
    return link;
}

QWidget *CertificateBox::buildHandPicking() {
    m_handPicking = new QWidget(this);
    auto *layout = new QHBoxLayout(m_handPicking);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    m_details = new QLabel(m_handPicking);
    m_details->setObjectName(QStringLiteral("certificateDetailsLabel"));
    m_details->setTextFormat(Qt::PlainText);
    m_details->setProperty("role", "quiet");
    // A subject may be longer than any dialog.
    m_details->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
    layout->addWidget(m_details, 1);
    m_pickCertificate = addLink(m_handPicking, "pickCertificateButton", tr("Pick certificate…"));
    m_pickKey = addLink(m_handPicking, "pickKeyButton", tr("Pick private key…"));
    m_takeAway = addLink(m_handPicking, "takeAwayButton", tr("Remove files"));
    return m_handPicking;
}

void CertificateBox::connectParts() {
    connect(m_all, &QCheckBox::clicked, this,
            [this] { m_model->setShownChecked(m_model->shownState() != Qt::Checked); });
    connect(m_choose, &QPushButton::clicked, this, &CertificateBox::chooseFiles);
    connect(m_pickCertificate, &QToolButton::clicked, this,
            [this] { pick(CertificateModel::Slot::Certificate); });
    connect(m_pickKey, &QToolButton::clicked, this, [this] { pick(CertificateModel::Slot::Key); });
    connect(m_takeAway, &QToolButton::clicked, this, [this] { m_model->removeFiles(selectedItems()); });
    connect(m_table, &QTableView::doubleClicked, this, [this](const QModelIndex &index) {
        if (index.column() == CertificateModel::CertificateColumn)
            pick(CertificateModel::Slot::Certificate);
        else if (index.column() == CertificateModel::KeyColumn)
            pick(CertificateModel::Slot::Key);
    });
    connect(m_model, &CertificateModel::changed, this, &CertificateBox::showState);
    connect(m_model, &CertificateModel::filesChanged, this, [this] {
        m_warnings->setWarnings(m_model->warnings());
        showState();
        showSelection();
    });
    connect(m_reader, &CertificateReader::progressed, this, &CertificateBox::showReading);
    connect(m_table->selectionModel(), &QItemSelectionModel::selectionChanged, this,
            &CertificateBox::showSelection);
    connect(m_model, &QAbstractItemModel::modelReset, this, &CertificateBox::showSelection);
}

void CertificateBox::setNeeds(CertificateNeeds needs) {
    const bool files = needs != CertificateNeeds::Nothing;
    const bool keys = CertificateCheck::needsKey(needs);
    m_choose->setVisible(files);
    m_handPicking->setVisible(files);
    m_pickKey->setVisible(keys);
    m_table->setColumnHidden(CertificateModel::CertificateColumn, !files);
    m_table->setColumnHidden(CertificateModel::KeyColumn, !keys);
    m_table->setColumnHidden(CertificateModel::ExpiryColumn, !files);
    m_model->setNeeds(needs);
    showReading();
}

void CertificateBox::setPassPhrase(const QString &passPhrase) {
    m_passPhrase = passPhrase;
    m_reader->read(m_model->encryptedKeys(), passPhrase,
                   [this](const auto &files) { m_model->replace(files); });
}

void CertificateBox::setDeviceWarnings(std::vector<TargetWarning> warnings) {
    m_model->setDeviceWarnings(std::move(warnings));
}

void CertificateBox::takeFiles(const QStringList &paths) {
    if (needs() == CertificateNeeds::Nothing)
        return;
    if (!isReading())
        m_unmatchedFiles.clear();
    m_reader->read(paths, m_passPhrase, [this](const auto &files) { onMatched(files); });
}

bool CertificateBox::isReading() const {
    return m_reader->isReading();
}

void CertificateBox::chooseFiles() {
    CertificatePaths::ask(this, tr("Choose files"), CertificatePaths::Count::Many,
                          [this](const QStringList &paths) { takeFiles(paths); });
}

void CertificateBox::pick(CertificateModel::Slot slot) {
    const std::vector<int> items = selectedItems();
    if (items.empty())
        return;
    const QString title =
        slot == CertificateModel::Slot::Key ? tr("Pick private key") : tr("Pick certificate");
    CertificatePaths::ask(
        this, title, CertificatePaths::Count::One, [this, items, slot](const QStringList &paths) {
            m_unmatchedFiles.clear();
            m_reader->read(paths, m_passPhrase,
                           [this, items, slot](const auto &files) { onPicked(items, files.front(), slot); });
        });
}

void CertificateBox::onMatched(const CertificateModel::Files &files) {
    for (const CertificateFilePtr &stranger : m_model->matchFiles(files))
        m_unmatchedFiles +=
            stranger->error.isEmpty() ? stranger->name : tr("%1 (%2)").arg(stranger->name, stranger->error);
}

void CertificateBox::onPicked(const std::vector<int> &items, const CertificateFilePtr &file,
                              CertificateModel::Slot slot) {
    if (m_model->assign(items, file, slot))
        return;
    QString reason = file->error;
    if (reason.isEmpty())
        reason = slot == CertificateModel::Slot::Key ? tr("There is no private key in the file.")
                                                     : tr("There is no certificate in the file.");
    m_unmatchedFiles += tr("%1 (%2)").arg(file->name, reason);
}

/// How far the reading is, then which files belong to no device.
void CertificateBox::showReading() {
    const bool files = needs() != CertificateNeeds::Nothing;
    QString text;
    if (isReading())
        text = tr("%n file(s) left to read…", nullptr, m_reader->left());
    else if (!m_unmatchedFiles.isEmpty())
        text = tr("%n file(s) not used: %1", nullptr, static_cast<int>(m_unmatchedFiles.size()))
                   .arg(m_unmatchedFiles.first(std::min<qsizetype>(shownStrangers, m_unmatchedFiles.size()))
                            .join(tr(", "))) +
               (m_unmatchedFiles.size() > shownStrangers ? QStringLiteral("…") : QString());
    m_filesNote->setText(text);
    m_filesNote->setToolTip(isReading() ? QString() : PlainText::toolTip(m_unmatchedFiles.join(tr(", "))));
    m_filesNote->setVisible(files && !text.isEmpty());
    emit changed();
}

void CertificateBox::showState() {
    m_ready = m_model->readyItems();
    m_all->setCheckState(m_model->shownState());
    emit changed();
}

void CertificateBox::showSelection() {
    const std::vector<int> items = selectedItems();
    QString text =
        tr("Files find their devices by the MAC addresses in their names. Drop them here, or select "
           "rows to pick by hand.");
    if (!items.empty())
        text = m_model->details(items.front());
    m_details->setToolTip(PlainText::toolTip(text));
    m_details->setText(
        items.empty() ? text : m_details->fontMetrics().elidedText(text, Qt::ElideRight, m_details->width()));
    for (QToolButton *link : {m_pickCertificate, m_pickKey, m_takeAway})
        link->setEnabled(!items.empty());
}

std::vector<int> CertificateBox::selectedItems() const {
    std::vector<int> items;
    for (const QModelIndex &index : m_table->selectionModel()->selectedRows())
        items.push_back(m_model->itemAt(index.row()));
    return items;
}

CertificateAssignments CertificateBox::order() const {
    CertificateAssignments order;
    order.entries.reserve(m_ready.size());
    for (const int item : m_ready)
        order.entries.push_back(
            {m_model->targets()[static_cast<std::size_t>(item)].device, m_model->pair(item)});
    return order;
}
