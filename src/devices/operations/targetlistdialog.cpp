#include "devices/operations/targetlistdialog.h"

#include "devices/operations/targetmodel.h"
#include "widgets/lists/checktable.h"
#include "widgets/style/icons.h"

#include <QCheckBox>
#include <QFrame>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace {
constexpr QSize listSize{640, 400};
} // namespace

TargetListDialog::TargetListDialog(TargetModel *model, QWidget *parent)
    : FramelessDialog(parent), m_model(model) {
    setObjectName(QStringLiteral("TargetListDialog"));
    setWindowTitle(tr("Devices"));
    setAttribute(Qt::WA_DeleteOnClose);
    auto *layout = new QVBoxLayout(content());
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(buildList(), 1);
    layout->addWidget(buildFooter());
    connect(m_model, &TargetModel::changed, this, &TargetListDialog::showTicked);
    // The next one to look at the list finds all of it.
    connect(this, &QDialog::finished, m_model, [this] { m_model->setSearch({}); });
    showTicked();
}

QWidget *TargetListDialog::buildList() {
    auto *list = new QWidget(content());
    auto *search = new QLineEdit(list);
    search->setObjectName(QStringLiteral("targetSearchEdit"));
    search->setPlaceholderText(tr("Search model, IP or MAC"));
    search->setAccessibleName(tr("Search"));
    search->setMaxLength(256);
    search->addAction(Icons::icon(QStringLiteral(":/images/icon_general_search_line.svg"), {16, 16}),
                      QLineEdit::LeadingPosition);
    m_all = new QCheckBox(tr("Select all/Deselect all"), list);
    m_all->setObjectName(QStringLiteral("targetAllCheckBox"));
    auto *table = new CheckTable(list);
    table->setObjectName(QStringLiteral("targetTable"));
    table->setAccessibleName(windowTitle());
    table->setMinimumSize(listSize);
    table->showList(m_model, {150, 130, 150}, -1);
    auto *layout = new QVBoxLayout(list);
    layout->setContentsMargins(20, 16, 20, 16);
    layout->setSpacing(8);
    layout->addWidget(search);
    layout->addWidget(m_all);
    layout->addWidget(table, 1);
    connect(search, &QLineEdit::textChanged, m_model, &TargetModel::setSearch);
    connect(m_all, &QCheckBox::clicked, this,
            [this] { m_model->setShownChecked(m_model->shownState() != Qt::Checked); });
    return list;
}

QWidget *TargetListDialog::buildFooter() {
    auto *footer = new QFrame(content());
    footer->setObjectName(QStringLiteral("dialogFooter"));
    auto *close = new QPushButton(tr("Close"), footer);
    close->setObjectName(QStringLiteral("closeButton"));
    close->setDefault(true);
    auto *layout = new QHBoxLayout(footer);
    layout->setContentsMargins(20, 14, 20, 14);
    layout->addStretch();
    layout->addWidget(close);
    connect(close, &QPushButton::clicked, this, &QDialog::accept);
    return footer;
}

void TargetListDialog::showTicked() {
    m_all->setCheckState(m_model->shownState());
}
