#include "devices/operations/targetsummary.h"

#include "devices/operations/targetlistdialog.h"
#include "devices/operations/targetmodel.h"
#include "devices/operations/targetwarninglines.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QLocale>
#include <QToolButton>
#include <QVBoxLayout>

TargetSummary::TargetSummary(QWidget *parent)
    : QWidget(parent), m_model(new TargetModel(this)), m_warnings(new TargetWarningLines(m_model, this)) {
    setObjectName(QStringLiteral("targetBox"));
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(6);
    layout->addWidget(buildHead());
    layout->addWidget(m_warnings);
    connect(m_model, &TargetModel::changed, this, &TargetSummary::showTicked);
}

QWidget *TargetSummary::buildHead() {
    auto *head = new QWidget(this);
    m_count = new QLabel(head);
    m_count->setObjectName(QStringLiteral("targetCountLabel"));
    m_count->setProperty("role", "caption");
    auto *show = new QToolButton(head);
    show->setObjectName(QStringLiteral("showTargetsButton"));
    show->setText(tr("Show"));
    show->setFocusPolicy(Qt::StrongFocus);
    show->setProperty("role", "link");
    connect(show, &QToolButton::clicked, this, &TargetSummary::openList);
    auto *layout = new QHBoxLayout(head);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_count, 1);
    layout->addWidget(show);
    return head;
}

void TargetSummary::setTargets(OperationTargets::List targets) {
    m_warnings->setWarnings({});
    m_model->setTargets(std::move(targets));
}

void TargetSummary::setWarnings(std::vector<TargetWarning> warnings) {
    m_model->setWarnings(warnings);
    m_warnings->setWarnings(std::move(warnings));
}

const OperationTargets::List &TargetSummary::targets() const {
    return m_model->targets();
}

std::vector<int> TargetSummary::ticked() const {
    return m_model->checkedItems();
}

int TargetSummary::tickedCount() const {
    return m_model->checkedCount();
}

QStringList TargetSummary::tickedIds() const {
    return m_model->checkedIds();
}

void TargetSummary::setTicked(const std::vector<int> &targets, bool ticked) {
    m_model->setChecked(targets, ticked);
}

void TargetSummary::openList() {
    auto *dialog = new TargetListDialog(m_model, this);
    dialog->open();
}

void TargetSummary::showTicked() {
    const int ticked = m_model->checkedCount();
    const int all = m_model->itemCount();
    m_count->setText(
        ticked == all
            ? tr("%Ln device(s) selected", nullptr, all)
            : tr("%1 of %2 devices selected").arg(QLocale().toString(ticked), QLocale().toString(all)));
    emit tickedChanged();
}
