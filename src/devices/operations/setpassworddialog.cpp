#include "devices/operations/setpassworddialog.h"

#include "api/session/servicesession.h"
#include "devices/operations/credentialfields.h"
#include "devices/operations/credentialrules.h"
#include "devices/operations/deviceactions.h"
#include "devices/operations/deviceoperations.h"
#include "devices/operations/operations.h"
#include "devices/operations/passwordchecklist.h"
#include "devices/operations/passwordpolicydialog.h"
#include "devices/operations/targetsummary.h"
#include "platform/log/messagelog.h"
#include "tasks/service/tasktargets.h"
#include "tasks/service/tasktype.h"
#include "widgets/controls/passwordedit.h"

#include <QComboBox>
#include <QDebug>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPointer>
#include <QToolButton>

#include <nlohmann/json.hpp>

#include <new>

namespace {

const auto mismatchIcon = QStringLiteral(":/images/icon_general_hint_solid_black.svg");

QString strengthText(Passwords::Strength strength) {
    switch (strength) {
    case Passwords::Strength::None:
        break;
    case Passwords::Strength::Weak:
        return SetPasswordDialog::tr("Strength: weak");
    case Passwords::Strength::Fair:
        return SetPasswordDialog::tr("Strength: fair");
    case Passwords::Strength::Strong:
        return SetPasswordDialog::tr("Strength: strong");
    }
    return SetPasswordDialog::tr("Strength: --");
}

DeviceOperations::Outcome setPolicy(const DeviceOperations::DeviceTask &task, const PasswordPolicy &policy) {
    const auto work = [&](const QStringList &ids, const QString &tid) {
        return task.session.call([&](CApiClient &client) {
            return client.setPassPolicy(TaskTargets::ids(ids), std::to_string(policy.rules).c_str(),
                                        policy.length, tid.toUtf8().constData());
        });
    };
    const DeviceOperations::Outcome outcome = DeviceOperations::runTask(task, work);
    qDebug(outcome.result == ApiOk ? "apply password policy successfully!" : "apply password policy failed!");
    return outcome;
}

} // namespace

SetPasswordDialog::SetPasswordDialog(OperationTargets::List targets, DeviceActions *actions, QWidget *parent)
    : OperationDialog(tr("Set Password"), parent),
      m_actions(actions),
      m_netTask(new (std::nothrow) NetTask),
      m_name(CredentialFields::makeName(body())),
      m_nameWarning(addField(tr("Username"), m_name, "nameWarningLabel")),
      m_password(CredentialFields::makePassword("passEdit", body())),
      m_passwordWarning(addField(tr("New Password"), m_password, "passWarningLabel")),
      m_strength(label({}, "quiet")),
      m_confirm(CredentialFields::makePassword("confirmEdit", body())),
      m_confirmWarning(nullptr),
      m_policyEdit(new QLabel(body())),
      m_policyView(new PasswordChecklist(body())) {
    if (!m_netTask)
        qDebug("net task create failed!should not be this case!");
    setObjectName(QStringLiteral("SetPasswordDialog"));
    for (const OperationTarget &target : targets)
        m_policies.push_back(target.device->policy);
    buildPasswordHead();
    m_confirmWarning = addField(tr("Confirm Password"), m_confirm, "confirmWarningLabel");
    buildPolicyHead();
    addPart(m_policyView);
    finish(std::move(targets), OperationTargets::Need::Account, tr("Apply"), "applyButton");
    connect(m_name, &QComboBox::editTextChanged, this, &SetPasswordDialog::onTextChanged);
    connect(m_password, &QLineEdit::textChanged, this, &SetPasswordDialog::onTextChanged);
    connect(m_confirm, &QLineEdit::textChanged, this, &SetPasswordDialog::onTextChanged);
    connect(&this->targets(), &TargetSummary::tickedChanged, this, &SetPasswordDialog::showPolicy);
    onTextChanged();
    m_password->setFocus();
}

SetPasswordDialog::~SetPasswordDialog() {}

/// Below the password: how strong it is, and the way to one that the program makes.
void SetPasswordDialog::buildPasswordHead() {
    auto *line = new QWidget(body());
    m_strength->setObjectName(QStringLiteral("strengthLabel"));
    auto *generate = new QToolButton(line);
    generate->setObjectName(QStringLiteral("generateButton"));
    generate->setText(tr("Generate a password"));
    generate->setFocusPolicy(Qt::StrongFocus);
    generate->setProperty("role", "link");
    auto *layout = new QHBoxLayout(line);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_strength, 1);
    layout->addWidget(generate);
    addPart(line);
    connect(generate, &QToolButton::clicked, this, &SetPasswordDialog::generate);
}

void SetPasswordDialog::buildPolicyHead() {
    auto *line = new QWidget(body());
    m_policyEdit->setText(QStringLiteral("<a href=\"edit\">%1</a>").arg(tr("Edit").toHtmlEscaped()));
    m_policyEdit->setObjectName(QStringLiteral("policyEditLabel"));
    m_policyEdit->setTextInteractionFlags(Qt::LinksAccessibleByMouse | Qt::LinksAccessibleByKeyboard);
    m_policyEdit->setFocusPolicy(Qt::StrongFocus);
    auto *layout = new QHBoxLayout(line);
    layout->setContentsMargins(0, 6, 0, 0);
    layout->addWidget(label(tr("Password Policy"), "title"), 1);
    layout->addWidget(m_policyEdit);
    addPart(line);
    connect(m_policyEdit, &QLabel::linkActivated, this, &SetPasswordDialog::on_policyEditLabel_linkActivated);
}

void SetPasswordDialog::generate() {
    const QString password = Passwords::generate(policyInForce(), m_name->currentText());
    m_password->setText(password);
    m_confirm->setText(password);
    // Nobody knows it yet, so it has to be seen once.
    m_password->setShown(true);
}

void SetPasswordDialog::onTextChanged() {
    for (QLabel *line : {m_nameWarning, m_passwordWarning, m_confirmWarning})
        CredentialFields::tell(line, {});
    setComplaint({});
    m_strength->setText(strengthText(Passwords::strengthOf(m_password->text())));
    showPolicy();
}

void SetPasswordDialog::showPolicy() {
    // A policy is set for the devices that are ticked.
    m_policyEdit->setEnabled(targets().tickedCount() > 0);
    m_policyView->showPolicy(policyInForce(), m_password->text(), m_name->currentText());
    setWarnings(policyWarnings());
}

PasswordPolicy SetPasswordDialog::policyOf(int target) const {
    return m_policies[static_cast<std::size_t>(target)];
}

PasswordPolicy SetPasswordDialog::policyInForce() const {
    PasswordPolicy strictest;
    for (const int target : targets().ticked())
        strictest = strictest.joinedWith(policyOf(target));
    return strictest;
}

std::vector<TargetWarning> SetPasswordDialog::policyWarnings() const {
    const QString password = m_password->text();
    TargetWarning refusing{[](int count) {
                               return tr("%n device(s) will refuse this password by their policy.", nullptr,
                                         count);
                           },
                           tr("Against its policy"),
                           {}};
    for (std::size_t i = 0; !password.isEmpty() && i < m_policies.size(); ++i) {
        if (!m_policies[i].isMetBy(password, m_name->currentText()))
            refusing.targets.push_back(static_cast<int>(i));
    }
    if (refusing.targets.empty())
        return {};
    return {refusing};
}

bool SetPasswordDialog::areFieldsGood() {
    using CredentialFields::tell;
    const bool name = tell(m_nameWarning, CredentialRules::nameProblem(m_name->currentText()));
    const bool password = tell(m_passwordWarning, CredentialRules::passwordProblem(m_password->text()));
    const bool confirm = tell(m_confirmWarning, CredentialRules::passwordProblem(m_confirm->text()));
    const bool equal = m_password->text() == m_confirm->text();
    if (name && password && confirm && !equal)
        setComplaint(tr("New Password and Confirm Password don't match."), mismatchIcon);
    // The rules leave characters of one byte alone.
    const int room = DeviceOperations::roomInPasswordCommand();
    const bool fits = m_name->currentText().size() + m_password->text().size() <= room;
    if (name && password && confirm && equal && !fits)
        setComplaint(
            tr("Username and password are too long: together they may have %1 characters.").arg(room));
    QWidget *const wrong = !name                             ? static_cast<QWidget *>(m_name)
                           : !password || (confirm && equal) ? m_password
                                                             : m_confirm;
    const bool good = name && password && confirm && equal && fits;
    if (!good)
        wrong->setFocus();
    return good;
}

void SetPasswordDialog::apply() {
    if (!areFieldsGood())
        return;
    JSON devices = TaskTargets::ids(targets().tickedIds());
    emit setPassword(devices, m_name->currentText(), m_password->text());
    accept();
}

void SetPasswordDialog::on_policyEditLabel_linkActivated(const QString &) {
    auto *dialog = new PasswordPolicyDialog(policyInForce(), this);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    connect(dialog, &PasswordPolicyDialog::applyPolicy, this, &SetPasswordDialog::onApplyPolicy);
    dialog->open();
}

void SetPasswordDialog::onApplyPolicy(int length, int type) {
    qDebug("apply password policy: length[%d], type[%d]", length, type);
    const PasswordPolicy policy{length, type};
    const auto begun = [dialog = QPointer(this), ticked = targets().ticked(), policy] {
        if (!dialog)
            return;
        for (const int target : ticked)
            dialog->m_policies[static_cast<std::size_t>(target)] = policy;
        dialog->showPolicy();
    };
    const auto run = [policy](const DeviceOperations::DeviceTask &task) { return setPolicy(task, policy); };
    m_actions->start({TaskType::passwordPolicy, targets().tickedIds(), run}, m_netTask.get(), begun);
}

namespace {

DeviceOperations::Outcome changePassword(const DeviceOperations::DeviceTask &task, const QString &name,
                                         const QString &password) {
    qDebug("set password: device id count[%d], dump[%s], name[%s], password[%s]",
           static_cast<int>(task.deviceIds.size()), DeviceOperations::dumpIds(task.deviceIds).constData(),
           qUtf8Printable(name), MessageLog::secret(password).constData());
    return DeviceOperations::runCommand(task, DeviceOperations::passwordCommand(name, password));
}

void onSetPassword(DeviceActions *actions, const JSON &devices, const QString &name,
                   const QString &password) {
    qDebug("onSetPassword: name: %s, password: %s", qUtf8Printable(name),
           MessageLog::secret(password).constData());
    const auto run = [name, password](const DeviceOperations::DeviceTask &task) {
        return changePassword(task, name, password);
    };
    actions->start({TaskType::changePassword, TaskTargets::idTexts(devices), run, true});
}

QDialog *openSetPassword(OperationContext &context, OperationRequest request) {
    auto *dialog =
        new SetPasswordDialog(std::move(request.targets), context.actions(), context.dialogParent());
    QObject::connect(
        dialog, &SetPasswordDialog::setPassword, context.actions(),
        [actions = context.actions()](const JSON &devices, const QString &name, const QString &password) {
            onSetPassword(actions, devices, name, password);
        });
    return dialog;
}

} // namespace

const Operation Operations::setPassword{.objectName = "setPasswordButton",
                                        .text = QT_TRANSLATE_NOOP("Operation", "Set Password"),
                                        .icon = "tool_set_password_line",
                                        .group = Operation::Group::DeviceButtons,
                                        .needs = Operation::Needs::Selection,
                                        .taskTypes = {"deviceChangePass"},
                                        .helpPage = "authorizing.html",
                                        .open = openSetPassword};
