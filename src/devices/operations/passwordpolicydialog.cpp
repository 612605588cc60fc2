#include "devices/operations/passwordpolicydialog.h"

#include "ui_passwordpolicydialog.h"

#include <algorithm>

namespace {

struct RuleBox {
    QCheckBox *box;
    PasswordPolicy::Rule rule;
};

std::vector<RuleBox> boxesOf(const Ui::PasswordPolicyDialog &ui) {
    return {{ui.alphabeticCheckBox, PasswordPolicy::Alphabetic},
            {ui.numericCheckBox, PasswordPolicy::Numeric},
            {ui.specialCheckBox, PasswordPolicy::Special},
            {ui.uppercaseCheckBox, PasswordPolicy::Uppercase},
            {ui.lowercaseCheckBox, PasswordPolicy::Lowercase},
            {ui.usernameCheckBox, PasswordPolicy::NotUserName}};
}

} // namespace

PasswordPolicyDialog::PasswordPolicyDialog(const PasswordPolicy &policy, QWidget *parent)
    : FramelessDialog(parent), m_ui(formIn<Ui::PasswordPolicyDialog>(content())) {
    setObjectName(QStringLiteral("PasswordPolicyDialog"));
    setWindowTitle(tr("Password Policy"));
    m_ui->lengthSpinBox->setRange(PasswordPolicy::shortest, PasswordPolicy::longest);
    m_ui->lengthSpinBox->setValue(std::max(policy.length, PasswordPolicy::shortest));
    m_ui->usernameCheckBox->setText(tr("Prohibition of a password that is the same as the") + u' ' +
                                    tr("username"));
    for (const auto &[box, rule] : boxesOf(*m_ui))
        box->setChecked(policy.rules & rule);
    connect(m_ui->lengthCheckBox, &QCheckBox::toggled, m_ui->lengthSpinBox, &QWidget::setEnabled);
    m_ui->lengthCheckBox->setChecked(true);
    connect(m_ui->applyButton, &QPushButton::clicked, this, &PasswordPolicyDialog::onApply);
    connect(m_ui->cancelButton, &QPushButton::clicked, this, &QDialog::reject);
}

PasswordPolicyDialog::~PasswordPolicyDialog() = default;

void PasswordPolicyDialog::onApply() {
    int mask = 0;
    for (const auto &[box, rule] : boxesOf(*m_ui))
        mask |= box->isChecked() ? rule : 0;
    // Devices know no policy without a length, so the box goes along also when it is off.
    emit applyPolicy(m_ui->lengthSpinBox->value(), mask);
    accept();
}
