#include "pages/settings/settingsform.h"

#include "pages/settings/serversettings.h"
#include "store/lastfolder.h"
#include "widgets/controls/wrappingcheckbox.h"
#include "widgets/dialogs/filedialogs.h"
#include "widgets/style/icons.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalBlocker>
#include <QSpinBox>
#include <QVBoxLayout>

#include <algorithm>

namespace {

constexpr int formWidth = 760;
constexpr int indent = 34;
constexpr int numberWidth = 96;
constexpr QSize iconSize{20, 20};
// What can be typed; what is more than a setting takes is set back while it is typed.
constexpr int most = 9999;
constexpr int firstLogDays = 30;
constexpr int firstRestorePoints = 10;

/// A line of the form, moved in below its section's title.
QHBoxLayout *addRow(QVBoxLayout *layout) {
    auto *row = new QHBoxLayout;
    row->setContentsMargins(indent, 0, 0, 0);
    row->setSpacing(10);
    layout->addLayout(row);
    return row;
}

QLabel *rowLabel(const QString &text) {
    auto *label = new QLabel(text);
    label->setProperty("role", QStringLiteral("setting"));
    return label;
}

} // namespace

SettingsForm::SettingsForm(QWidget *parent) : QWidget(parent) {
    setObjectName(QStringLiteral("settingsForm"));
    setMaximumWidth(formWidth);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(24, 20, 24, 20);
    layout->setSpacing(8);
    addClient(layout);
    addServer(layout);
    addDeviceManagement(layout);
    layout->addStretch();
    for (Field &field : m_fields)
        field.first = field.value();
    connect(this, &SettingsForm::edited, this, &SettingsForm::onEdited);
    showEnabled();
}

void SettingsForm::onEdited(const QString &key) {
    for (Field &field : m_fields)
        field.touched = field.touched || field.key == key;
}

void SettingsForm::addClient(QVBoxLayout *layout) {
    addSection(layout, QStringLiteral("icon_general_client_line"), tr("Client"));
    addGroup(layout, tr("Notification"));
    addSwitch(layout, "nf_alarms", "alarmCheckBox", tr("Pop up  notification banners for all the alarms"));
    addSwitch(layout, "nf_tasks", "taskCheckBox", tr("Pop up  notification banners for all the tasks"));
    addGroup(layout, tr("Language"));
    addLanguage(layout);
}

void SettingsForm::addServer(QVBoxLayout *layout) {
    addSection(layout, QStringLiteral("icon_general_server_line"), tr("Server"));
    addGroup(layout, tr("Log"));
    addNumber(layout, "log_keepdays", "logSpinBox", tr("Number of days to keep logs"), QString())
        ->setValue(firstLogDays);
}

void SettingsForm::addDeviceManagement(QVBoxLayout *layout) {
    addSection(layout, QStringLiteral("icon_general_devices_line"), tr("Device Management"));
    addGroup(layout, tr("Default File Location"));
    addPath(layout);
    addGroup(layout, tr("Configuration Restore Point"));
    addSwitch(layout, "rp_auto", "restorePointCheckBox",
              tr("Create configuration restore points automatically every night if configuration changes are "
                 "detected."));
    addNumber(layout, "rp_keepnum", "restorePointSpinBox", tr("Number of automatic restore points to keep"),
              tr("for each camera"))
        ->setValue(firstRestorePoints);
    addGroup(layout, tr("Firmware Upload Limit"));
    addUploadLimit(layout);
}

void SettingsForm::addSection(QVBoxLayout *layout, const QString &icon, const QString &title) {
    if (layout->count() > 0)
        layout->addSpacing(18);
    auto *row = new QHBoxLayout;
    row->setSpacing(14);
    auto *picture = new QLabel;
    picture->setPixmap(Icons::pixmap(QStringLiteral(":/images/%1.svg").arg(icon), iconSize, 2.0));
    picture->setFixedWidth(iconSize.width());
    auto *heading = new QLabel(title);
    heading->setProperty("role", QStringLiteral("heading"));
    row->addWidget(picture);
    row->addWidget(heading);
    row->addStretch();
    layout->addLayout(row);
}

void SettingsForm::addGroup(QVBoxLayout *layout, const QString &title) {
    layout->addSpacing(6);
    auto *label = new QLabel(title);
    label->setProperty("role", QStringLiteral("title"));
    addRow(layout)->addWidget(label);
}

QCheckBox *SettingsForm::addSwitch(QVBoxLayout *layout, const char *key, const char *name,
                                   const QString &text) {
    auto *box = new WrappingCheckBox(text);
    box->setObjectName(QLatin1String(name));
    addRow(layout)->addWidget(box);
    addField(
        key, [box] { return QVariant(box->isChecked()); },
        [box](const QVariant &value) { box->setChecked(value.toBool()); });
    connect(box, &QCheckBox::toggled, this, [this, key] { emit edited(QLatin1String(key)); });
    return box;
}

QSpinBox *SettingsForm::addNumber(QVBoxLayout *layout, const char *key, const char *name,
                                  const QString &before, const QString &after) {
    QSpinBox *box = makeNumber(key, name, before + QLatin1Char(' ') + after);
    QHBoxLayout *row = addRow(layout);
    QLabel *label = rowLabel(before);
    label->setBuddy(box);
    row->addWidget(label);
    row->addWidget(box);
    row->addWidget(rowLabel(after));
    row->addStretch();
    return box;
}

QSpinBox *SettingsForm::makeNumber(const char *key, const char *name, const QString &accessibleName) {
    auto *box = new QSpinBox(this);
    box->setObjectName(QLatin1String(name));
    box->setAccessibleName(accessibleName.trimmed());
    box->setRange(1, most);
    box->setFixedWidth(numberWidth);
    addField(
        key, [box] { return QVariant(box->value()); },
        [box](const QVariant &value) { box->setValue(value.toInt()); });
    const int limit = ServerSettings::setting(QLatin1String(key)).most;
    connect(box, &QSpinBox::valueChanged, this, [this, box, key, limit](int value) {
        // Setting the value back comes here again.
        if (value > limit)
            return box->setValue(limit);
        emit edited(QLatin1String(key));
    });
    return box;
}

void SettingsForm::addUploadLimit(QVBoxLayout *layout) {
    m_uploadLimited = addSwitch(layout, "svr_fw_upload_limit_enabled", "uploadLimitCheckBox",
                                tr("Upload firmware to up to"));
    m_uploadLimit = makeNumber("svr_fw_upload_limit", "uploadLimitSpinBox",
                               tr("Upload firmware to up to so many devices simultaneously."));
    auto *row = static_cast<QHBoxLayout *>(layout->itemAt(layout->count() - 1)->layout());
    m_uploadLimited->setSizePolicy(QSizePolicy::Maximum, QSizePolicy::Fixed);
    row->addWidget(m_uploadLimit);
    row->addWidget(rowLabel(tr("devices simultaneously.")));
    row->addStretch();
    connect(m_uploadLimited, &QCheckBox::toggled, this, &SettingsForm::showEnabled);
}

void SettingsForm::addPath(QVBoxLayout *layout) {
    m_path = new QLineEdit;
    m_path->setObjectName(QStringLiteral("filePathEdit"));
    m_path->setAccessibleName(tr("Default File Location"));
    auto *button = new QPushButton(tr("Browse"));
    button->setObjectName(QStringLiteral("browseButton"));
    button->setAutoDefault(false);
    QHBoxLayout *row = addRow(layout);
    row->addWidget(m_path, 1);
    row->addWidget(button);
    addField(
        "rp_download_path", [this] { return QVariant(m_path->text()); },
        [this](const QVariant &value) { m_path->setText(value.toString()); });
    connect(m_path, &QLineEdit::textChanged, this,
            [this] { emit edited(QStringLiteral("rp_download_path")); });
    connect(button, &QPushButton::clicked, this, &SettingsForm::browse);
}

void SettingsForm::browse() {
    const QString begin = m_path->text().isEmpty() ? LastFolder::path() : m_path->text();
    FileDialogs::askFolder(this, tr("Select Directory"), begin,
                           [this](const QString &folder) { m_path->setText(folder); });
}

void SettingsForm::addLanguage(QVBoxLayout *layout) {
    m_language = new QComboBox;
    m_language->setObjectName(QStringLiteral("languageComboBox"));
    m_language->setAccessibleName(tr("Language of the user interface"));
    m_language->addItem(tr("As the system"), QString());
    // A language is named in itself.
    m_language->addItem(QStringLiteral("English"), QStringLiteral("en"));
    m_language->addItem(QStringLiteral("Deutsch"), QStringLiteral("de"));
    m_language->addItem(QString::fromUtf8("日本語"), QStringLiteral("ja"));
    QHBoxLayout *row = addRow(layout);
    QLabel *label = rowLabel(tr("Language of the user interface"));
    label->setBuddy(m_language);
    row->addWidget(label);
    row->addWidget(m_language);
    row->addStretch();
    // Windows are made once, with their texts.
    auto *hint = new QLabel(tr("Another language is used from the next start of the program on."));
    hint->setObjectName(QStringLiteral("languageHintLabel"));
    hint->setProperty("role", QStringLiteral("caption"));
    hint->setWordWrap(true);
    addRow(layout)->addWidget(hint);
    addField(
        "ui_lang", [this] { return m_language->currentData(); },
        [this](const QVariant &value) {
            // A language that only another client has is kept, not replaced.
            if (m_language->findData(value) < 0)
                m_language->addItem(value.toString(), value);
            m_language->setCurrentIndex(m_language->findData(value));
        });
    connect(m_language, &QComboBox::currentIndexChanged, this,
            [this] { emit edited(QStringLiteral("ui_lang")); });
}

void SettingsForm::addField(const char *key, std::function<QVariant()> value,
                            std::function<void(const QVariant &)> setValue) {
    m_fields.push_back({QLatin1String(key), std::move(value), std::move(setValue)});
}

QVariantMap SettingsForm::values() const {
    QVariantMap values;
    for (const Field &field : m_fields) {
        if (field.offered || field.touched)
            values[field.key] = field.value();
    }
    return values;
}

void SettingsForm::setValues(const QVariantMap &values) {
    {
        const QSignalBlocker blocker(this);
        for (const Field &field : m_fields) {
            if (values.contains(field.key))
                field.setValue(values.value(field.key));
        }
    }
    showEnabled();
}

void SettingsForm::restore(const QVariantMap &values) {
    QVariantMap all = values;
    for (Field &field : m_fields) {
        field.touched = false;
        if (!all.contains(field.key))
            all[field.key] = field.first;
    }
    setValues(all);
}

void SettingsForm::setOffered(const QStringList &keys) {
    for (Field &field : m_fields)
        field.offered = keys.contains(field.key);
}

void SettingsForm::showEnabled() {
    m_uploadLimit->setEnabled(m_uploadLimited->isChecked());
}
