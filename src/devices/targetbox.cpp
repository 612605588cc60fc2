#include "targetbox.h"

#include "targetlistdialog.h"
#include "targetmodel.h"
#include "targetwarninglines.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QLocale>
#include <QToolButton>
#include <QVBoxLayout>

TargetBox::TargetBox(QWidget *parent)
    : QWidget(parent), m_model(new TargetModel(this)), m_warnings(new TargetWarningLines(m_model, this)) {
    setObjectName(QStringLiteral("targetBox"));
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(6);
    layout->addWidget(buildHead());
    layout->addWidget(m_warnings);
    connect(m_model, &TargetModel::changed, this, &TargetBox::showTicked);
}

QWidget *TargetBox::buildHead() {
    auto *head = new QWidget(this);
    m_count = new QLabel(head);
    m_count->setObjectName(QStringLiteral("targetCountLabel"));
    m_count->setProperty("role", "caption");
    auto *show = new QToolButton(head);
    show->setObjectName(QStringLiteral("showTargetsButton"));
    show->setText(tr("Show"));
    show->setFocusPolicy(Qt::StrongFocus);
    show->setProperty("role", "link");
    connect(show, &QToolButton::clicked, this, &TargetBox::openList);
    auto *layout = new QHBoxLayout(head);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_count, 1);
    layout->addWidget(show);
    return head;
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

void TargetBox::setTicked(const std::vector<int> &targets, bool ticked) {
    m_model->setChecked(targets, ticked);
}

void TargetBox::openList() {
    auto *dialog = new TargetListDialog(m_model, this);
    dialog->open();
}

void TargetBox::showTicked() {
    const int ticked = m_model->checkedCount();
    const int all = m_model->itemCount();
    m_count->setText(
        ticked == all
            ? tr("%Ln device(s) selected", nullptr, all)
            : tr("%1 of %2 devices selected").arg(QLocale().toString(ticked), QLocale().toString(all)));
    emit tickedChanged();
}
