#include "devices/operations/targetwarninglines.h"

#include "widgets/lists/checklistmodel.h"
#include "widgets/style/icons.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>
#include <iterator>

namespace {
constexpr QSize iconSize{12, 12};
} // namespace

TargetWarningLines::TargetWarningLines(CheckListModel *targets, QWidget *parent)
    : QWidget(parent), m_targets(targets), m_lines(new QVBoxLayout(this)) {
    setObjectName(QStringLiteral("targetWarnings"));
    m_lines->setContentsMargins(0, 0, 0, 0);
    m_lines->setSpacing(4);
    connect(targets, &CheckListModel::changed, this, &TargetWarningLines::showLines);
    hide();
}

void TargetWarningLines::setWarnings(std::vector<TargetWarning> warnings) {
    m_warnings = std::move(warnings);
    showLines();
}

void TargetWarningLines::showLines() {
    while (QLayoutItem *line = m_lines->takeAt(0)) {
        // The link that was clicked is in one of them.
        line->widget()->hide();
        line->widget()->deleteLater();
        delete line;
    }
    for (const TargetWarning &warning : m_warnings) {
        std::vector<int> checked;
        std::copy_if(warning.targets.begin(), warning.targets.end(), std::back_inserter(checked),
                     [this](int item) { return m_targets->isChecked(item); });
        if (!checked.empty())
            addLine(warning, checked);
    }
    setVisible(m_lines->count() > 0);
}

void TargetWarningLines::addLine(const TargetWarning &warning, const std::vector<int> &checked) {
    auto *line = new QWidget(this);
    auto *icon = new QLabel(line);
    icon->setPixmap(Icons::pixmap(QStringLiteral(":/images/icon_general_warning_solid.svg"), iconSize,
                                  devicePixelRatioF()));
    auto *text = new QLabel(warning.summary(static_cast<int>(checked.size())), line);
    text->setObjectName(QStringLiteral("targetWarningLabel"));
    text->setTextFormat(Qt::PlainText);
    text->setProperty("role", "warning");
    text->setWordWrap(true);
    auto *leaveOut = new QToolButton(line);
    leaveOut->setObjectName(QStringLiteral("leaveOutButton"));
    leaveOut->setText(tr("Leave them out"));
    leaveOut->setAccessibleDescription(text->text());
    leaveOut->setFocusPolicy(Qt::StrongFocus);
    leaveOut->setProperty("role", "link");
    connect(leaveOut, &QToolButton::clicked, this,
            [this, checked] { m_targets->setChecked(checked, false); });
    auto *layout = new QHBoxLayout(line);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(6);
    layout->addWidget(icon);
    layout->addWidget(text, 1);
    layout->addWidget(leaveOut);
    m_lines->addWidget(line);
}
