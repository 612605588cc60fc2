#include "targetbox.h"

#include "checktable.h"
#include "icons.h"
#include "targetmodel.h"
#include "targetwarninglines.h"

#include <QCheckBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QLocale>
#include <QToolButton>
#include <QVBoxLayout>

namespace {

constexpr int listHeight = 220;
} // namespace

TargetBox::TargetBox(QWidget *parent)
    : QWidget(parent), m_model(new TargetModel(this)), m_warnings(new TargetWarningLines(m_model, this)) {
    setObjectName(QStringLiteral("targetBox"));
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(6);
    layout->addWidget(buildHead());
    layout->addWidget(m_warnings);
    m_list = buildList();
    layout->addWidget(m_list);
}

QWidget *TargetBox::buildHead() {
    auto *head = new QWidget(this);
    m_count = new QLabel(head);
    m_count->setObjectName(QStringLiteral("targetCountLabel"));
    m_count->setProperty("role", "caption");
    m_toggle = new QToolButton(head);
    m_toggle->setObjectName(QStringLiteral("showTargetsButton"));
    m_toggle->setText(tr("Show"));
    m_toggle->setFocusPolicy(Qt::StrongFocus);
    m_toggle->setProperty("role", "link");
    connect(m_toggle, &QToolButton::clicked, this, &TargetBox::toggleList);
    auto *layout = new QHBoxLayout(head);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_count, 1);
    layout->addWidget(m_toggle);
    return head;
}

QWidget *TargetBox::buildList() {
    auto *list = new QWidget(this);
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
    table->setAccessibleName(tr("Devices of the operation"));
    table->setFixedHeight(listHeight);
    table->showList(m_model, {150, 130, 150}, 1);
    auto *layout = new QVBoxLayout(list);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(6);
    layout->addWidget(search);
    layout->addWidget(m_all);
    layout->addWidget(table);
    connect(search, &QLineEdit::textChanged, m_model, &TargetModel::setSearch);
    connect(m_all, &QCheckBox::clicked, this,
            [this] { m_model->setShownChecked(m_model->shownState() != Qt::Checked); });
    connect(m_model, &TargetModel::changed, this, &TargetBox::showTicked);
    list->hide();
    return list;
}

void TargetBox::setTargets(OperationTargets::List targets) {
    m_warnings->setWarnings({});
    m_model->setTargets(std::move(targets));
}

void TargetBox::setWarnings(std::vector<TargetWarning> warnings) {
    m_model->setWarnings(warnings);
    m_warnings->setWarnings(std::move(warnings));
}

const OperationTargets::List &TargetBox::targets() const {
    return m_model->targets();
}

std::vector<int> TargetBox::ticked() const {
    return m_model->checkedItems();
}

int TargetBox::tickedCount() const {
    return m_model->checkedCount();
}

QStringList TargetBox::tickedIds() const {
    return m_model->checkedIds();
}

void TargetBox::toggleList() {
    m_list->setVisible(!m_list->isVisibleTo(this));
    m_toggle->setText(m_list->isVisibleTo(this) ? tr("Hide") : tr("Show"));
}

void TargetBox::showTicked() {
    const int ticked = m_model->checkedCount();
    const int all = m_model->itemCount();
    m_count->setText(
        ticked == all
            ? tr("%n device(s) selected", nullptr, all)
            : tr("%1 of %2 devices selected").arg(QLocale().toString(ticked), QLocale().toString(all)));
    m_all->setCheckState(m_model->shownState());
    emit tickedChanged();
}
