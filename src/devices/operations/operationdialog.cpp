#include "devices/operations/operationdialog.h"

#include "devices/operations/targetsummary.h"

#include <QFrame>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace {

constexpr int dialogWidth = 480;

QLabel *namedLabel(const char *name, QWidget *parent) {
    auto *label = new QLabel(parent);
    label->setObjectName(QLatin1String(name));
    return label;
}

} // namespace

OperationDialog::OperationDialog(const QString &title, QWidget *parent)
    : FramelessDialog(parent),
      m_layout(new QVBoxLayout(content())),
      m_body(new QWidget(content())),
      m_parts(new QVBoxLayout(m_body)),
      m_footNote(label({}, "quiet")),
      m_complaint(namedLabel("msgWarningIcon", m_body), namedLabel("msgWarningLabel", m_body)) {
    setWindowTitle(title);
    setAttribute(Qt::WA_DeleteOnClose);
    m_parts->setContentsMargins(20, 18, 20, 12);
    m_parts->setSpacing(8);
    m_layout->setContentsMargins(0, 0, 0, 0);
    m_layout->setSpacing(0);
    m_layout->addWidget(m_body, 1);
    content()->setFixedWidth(dialogWidth);
}

OperationDialog::~OperationDialog() = default;

QWidget *OperationDialog::buildFooter(const QString &acceptText, const char *acceptName) {
    auto *footer = new QFrame(content());
    footer->setObjectName(QStringLiteral("dialogFooter"));
    auto *cancel = new QPushButton(tr("Cancel"), footer);
    cancel->setObjectName(QStringLiteral("cancelButton"));
    cancel->setAutoDefault(false);
    m_accept = new QPushButton(acceptText, footer);
    m_accept->setObjectName(QLatin1String(acceptName));
    m_accept->setDefault(true);
    m_footNote->setObjectName(QStringLiteral("footNoteLabel"));
    auto *layout = new QHBoxLayout(footer);
    layout->setContentsMargins(20, 14, 20, 14);
    layout->addWidget(m_footNote, 1);
    layout->addWidget(cancel);
    layout->addWidget(m_accept);
    connect(cancel, &QPushButton::clicked, this, &QDialog::reject);
    connect(m_accept, &QPushButton::clicked, this, [this] {
        if (m_accept->isEnabled())
            apply();
    });
    return footer;
}

void OperationDialog::finish(OperationTargets::List targets, OperationTargets::Need need,
                             const QString &acceptText, const char *acceptName) {
    addTargets(std::move(targets), need);
    finish(acceptText, acceptName);
}

void OperationDialog::addTargets(OperationTargets::List targets, OperationTargets::Need need) {
    m_need = need;
    m_targets = new TargetSummary(m_body);
    replaceTargets(std::move(targets));
    m_parts->addWidget(m_targets);
}

void OperationDialog::replaceTargets(OperationTargets::List targets) {
    m_given = OperationTargets::warnings(targets, m_need);
    m_targets->setTargets(std::move(targets));
    m_targets->setWarnings(m_given);
}

void OperationDialog::finish(const QString &acceptText, const char *acceptName) {
    auto *line = new QWidget(m_body);
    auto *layout = new QHBoxLayout(line);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(6);
    layout->addWidget(m_body->findChild<QLabel *>(QStringLiteral("msgWarningIcon")));
    layout->addWidget(m_body->findChild<QLabel *>(QStringLiteral("msgWarningLabel")), 1);
    m_parts->addWidget(line);
    m_layout->addWidget(buildFooter(acceptText, acceptName));
    connect(m_targets, &TargetSummary::tickedChanged, this, &OperationDialog::updateAccept);
    updateAccept();
}

void OperationDialog::addPart(QWidget *part) {
    m_parts->addWidget(part);
}

QLabel *OperationDialog::addField(const QString &caption, QWidget *field, const char *warningName) {
    auto *captionLabel = label(caption, "caption");
    captionLabel->setBuddy(field);
    field->setAccessibleName(caption);
    QLabel *warning = label({}, "warning");
    warning->setObjectName(QLatin1String(warningName));
    warning->setWordWrap(true);
    warning->hide();
    m_parts->addWidget(captionLabel);
    m_parts->addWidget(field);
    m_parts->addWidget(warning);
    return warning;
}

QLabel *OperationDialog::label(const QString &text, const char *role) const {
    auto *made = new QLabel(text, m_body);
    made->setTextFormat(Qt::PlainText);
    made->setProperty("role", role);
    return made;
}

void OperationDialog::setWarnings(std::vector<TargetWarning> warnings) {
    warnings.insert(warnings.begin(), m_given.begin(), m_given.end());
    m_targets->setWarnings(std::move(warnings));
}

void OperationDialog::setFootNote(const QString &text) {
    m_footNote->setText(text);
}

void OperationDialog::updateAccept() {
    m_accept->setEnabled(m_targets->tickedCount() > 0 && isComplete());
}
