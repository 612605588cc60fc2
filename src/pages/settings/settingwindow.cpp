#include "pages/settings/settingwindow.h"

#include "api/session/jobendtext.h"
#include "api/session/servicerequest.h"
#include "pages/settings/settingschangeddialog.h"
#include "pages/settings/settingsform.h"
#include "store/lastfolder.h"
#include "store/localstore.h"
#include "store/storewriter.h"
#include "tasks/notify/notifier.h"
#include "widgets/controls/waitingspinner.h"

#include <QDebug>
#include <QFrame>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QScrollArea>
#include <QVBoxLayout>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <new>
#include <utility>

SettingWindow::SettingWindow(QWidget *parent) : QWidget(parent), m_runner(new (std::nothrow) NetTask) {
    qDebug("SettingWindow constructor");
    setObjectName(QStringLiteral("SettingWindow"));
    // Each in its place from the start: widgets that move to another parent are styled all over again.
    auto *scroll = new QScrollArea(this);
    m_form = new SettingsForm(scroll->viewport());
    scroll->setObjectName(QStringLiteral("settingsScroll"));
    scroll->setWidgetResizable(true);
    scroll->setFocusPolicy(Qt::NoFocus);
    scroll->setWidget(m_form);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(buildNotice());
    layout->addWidget(scroll, 1);
    layout->addWidget(buildFooter());
    connect(m_form, &SettingsForm::edited, this, &SettingWindow::onEdited);
    reset();
}

SettingWindow::~SettingWindow() {
    qDebug("SettingWindow destructor");
}

QWidget *SettingWindow::buildNotice() {
    m_notice = new QFrame(this);
    m_notice->setObjectName(QStringLiteral("settingsNotice"));
    m_noticeText = new QLabel(m_notice);
    m_noticeText->setObjectName(QStringLiteral("noticeLabel"));
    m_noticeText->setProperty("role", QStringLiteral("warning"));
    m_noticeText->setTextFormat(Qt::PlainText);
    m_noticeText->setWordWrap(true);
    m_retry = new QPushButton(tr("Retry"), m_notice);
    m_retry->setObjectName(QStringLiteral("retryButton"));
    m_retry->setAutoDefault(false);
    auto *layout = new QHBoxLayout(m_notice);
    layout->setContentsMargins(24, 10, 24, 10);
    layout->addWidget(m_noticeText, 1);
    layout->addWidget(m_retry);
    connect(m_retry, &QPushButton::clicked, this, &SettingWindow::loadConfig);
    return m_notice;
}

QWidget *SettingWindow::buildFooter() {
    auto *footer = new QFrame(this);
    footer->setObjectName(QStringLiteral("settingsFooter"));
    m_spinner = new WaitingSpinner(footer);
    m_status = new QLabel(footer);
    m_status->setObjectName(QStringLiteral("statusLabel"));
    m_status->setProperty("role", QStringLiteral("caption"));
    m_status->setTextFormat(Qt::PlainText);
    m_cancel = new QPushButton(tr("Cancel"), footer);
    m_cancel->setObjectName(QStringLiteral("cancelButton"));
    m_apply = new QPushButton(tr("Apply"), footer);
    m_apply->setObjectName(QStringLiteral("applyButton"));
    m_apply->setProperty("role", QStringLiteral("primary"));
    auto *layout = new QHBoxLayout(footer);
    layout->setContentsMargins(24, 12, 24, 12);
    layout->setSpacing(10);
    layout->addWidget(m_spinner);
    layout->addWidget(m_status, 1);
    layout->addWidget(m_cancel);
    layout->addWidget(m_apply);
    connect(m_cancel, &QPushButton::clicked, this, [this] {
        discardEdits();
        m_status->setText(tr("Changes were taken back."));
    });
    connect(m_apply, &QPushButton::clicked, this, &SettingWindow::saveConfig);
    return footer;
}

bool SettingWindow::hasUnsavedEdits() const {
    const QVariantMap &kept = m_discardedWhileSaving ? m_saving : m_loaded;
    return m_everLoaded && !ServerSettings::differences(kept, m_form->values()).isEmpty();
}

void SettingWindow::discardEdits() {
    m_discardedWhileSaving = !m_saving.isEmpty();
    m_form->restore(m_discardedWhileSaving ? m_saving : m_loaded);
    enableButtons(false);
    m_status->clear();
}

void SettingWindow::reset() {
    if (m_question)
        m_question->close();
    m_loaded.clear();
    m_saving.clear();
    m_discardedWhileSaving = false;
    m_form->restore({});
    m_everLoaded = false;
    m_form->setEnabled(false);
    enableButtons(false);
    showNotice({});
    showBusy({});
    m_status->clear();
    Notifier::instance().setEnabled(true, true);
}

void SettingWindow::loadConfig() {
    const bool started = ServiceRequest::post(
        m_runner.get(), this, &SettingWindow::load, [this](const Loaded &loaded) { onLoaded(loaded); },
        [this](JobOutcome end) { onJobEnded(end, tr("The settings could not be read: %1."), true); });
    if (started)
        showBusy(tr("Loading settings..."));
}

void SettingWindow::onJobEnded(JobOutcome end, const QString &failure, bool offersRetry) {
    showBusy({});
    if (end == JobOutcome::NotRun || end == JobOutcome::Failed)
        showNotice(failure.arg(jobEndText(end)), offersRetry);
    // Another session may have begun while the answer for the last one was awaited, and the page was busy
    // then.
    if (end == JobOutcome::SessionGone && CLocalStore::instance().loginInfo().isComplete())
        loadConfig();
}

SettingWindow::Loaded SettingWindow::load(ServiceSession &session) {
    JSON object;
    Loaded loaded;
    loaded.result = session.call([&](CApiClient &client) { return client.loadServerSettings(object); });
    if (loaded.result == ApiOk)
        loaded.reading = ServerSettings::read(object);
    else
        qWarning("HTTP API(loadServerSettings) failed!");
    return loaded;
}

void SettingWindow::onLoaded(const Loaded &loaded) {
    if (loaded.result != ApiOk)
        return showNotice(tr("The settings could not be read: %1.").arg(apiResultText(loaded.result)), true);
    // Edits that were made while the answer was awaited are the user's and stay.
    QVariantMap values = loaded.reading.values;
    if (m_everLoaded) {
        const QVariantMap shown = m_form->values();
        for (const QString &key : ServerSettings::differences(m_loaded, shown))
            values[key] = shown.value(key);
    }
    m_form->setEnabled(true);
    m_form->setOffered(loaded.reading.values.keys());
    m_form->setValues(values);
    m_everLoaded = true;
    takeOver(loaded.reading.values);
    enableButtons(hasUnsavedEdits());
    QStringList remarks = loaded.reading.remarks;
    if (loaded.reading.offersNone)
        remarks += tr("The server offers no settings.");
    else if (!remarks.isEmpty())
        m_apply->setEnabled(true);
    showNotice(remarks.join(QLatin1Char('\n')));
}

/// What the service has acts here at once.
void SettingWindow::takeOver(const QVariantMap &values) {
    m_loaded = values;
    Notifier::instance().setEnabled(values.value(QStringLiteral("nf_alarms"), true).toBool(),
                                    values.value(QStringLiteral("nf_tasks"), true).toBool());
    if (!values.contains(QStringLiteral("ui_lang")))
        return;
    const QString language = values.value(QStringLiteral("ui_lang")).toString();
    StoreWriter::post([language] {
        CLocalStore &store = CLocalStore::instance();
        if (store.uiLanguage() != language)
            store.setUiLanguage(language);
    });
}

void SettingWindow::onEdited(const QString &key) {
    m_status->clear();
    if (m_loaded.contains(key) && m_form->values().value(key) != m_loaded.value(key))
        enableButtons(true);
}

void SettingWindow::saveConfig() {
    const QVariantMap wanted = m_form->values();
    const bool started = ServiceRequest::post(
        m_runner.get(), this,
        [loaded = m_loaded, wanted](ServiceSession &session) { return save(session, loaded, wanted); },
        [this, wanted](const Saved &saved) { onSaved(saved, wanted); },
        [this](JobOutcome end) {
            endSaving();
            onJobEnded(end, tr("The settings could not be saved: %1."), false);
        });
    if (!started)
        return;
    m_saving = wanted;
    m_discardedWhileSaving = false;
    showBusy(tr("Saving settings..."));
}

/// What was discarded while it was being saved, and was not saved, goes now.
void SettingWindow::endSaving() {
    const QVariantMap saving = std::exchange(m_saving, {});
    if (!std::exchange(m_discardedWhileSaving, false))
        return;
    const QVariantMap shown = m_form->values();
    QVariantMap discarded;
    for (const QString &key : ServerSettings::differences(saving, m_loaded)) {
        if (shown.value(key) == saving.value(key))
            discarded[key] = m_loaded.value(key);
    }
    m_form->setValues(discarded);
    enableButtons(hasUnsavedEdits());
}

SettingWindow::Saved SettingWindow::save(ServiceSession &session, const QVariantMap &loaded,
                                         const QVariantMap &wanted) {
    Saved saved;
    Loaded fresh = load(session);
    saved.loadResult = fresh.result;
    if (fresh.result != ApiOk) {
        qWarning("HTTP API(saveServerSettings) failed!");
        return saved;
    }
    for (const QString &key : ServerSettings::differences(loaded, fresh.reading.values)) {
        if (fresh.reading.values.value(key) != wanted.value(key))
            saved.changed += key;
    }
    saved.fresh = std::move(fresh.reading);
    if (!saved.changed.isEmpty())
        return saved;
    const JSON object = ServerSettings::toJson(wanted);
    saved.saveResult = session.call([&](CApiClient &client) { return client.saveServerSettings(object); });
    if (saved.saveResult != ApiOk)
        qWarning("HTTP API(saveServerSettings) failed!");
    return saved;
}

void SettingWindow::onSaved(const Saved &saved, const QVariantMap &wanted) {
    if (!saved.changed.isEmpty())
        return m_discardedWhileSaving ? takeOver(saved.fresh.values) : resolveConflict(saved, wanted);
    if (const unsigned result = saved.loadResult != ApiOk ? saved.loadResult : saved.saveResult;
        result != ApiOk)
        return showNotice(tr("The settings could not be saved: %1.").arg(apiResultText(result)));
    const QString folderKey = QStringLiteral("rp_download_path");
    const QString folder = wanted.value(folderKey).toString();
    if (wanted.contains(folderKey) && folder != m_loaded.value(folderKey).toString())
        LastFolder::rememberFolder(folder);
    takeOver(wanted);
    showNotice({});
    // What was changed while the answer was awaited is not saved.
    enableButtons(hasUnsavedEdits());
    m_status->setText(tr("Settings saved."));
}

void SettingWindow::resolveConflict(const Saved &saved, const QVariantMap &wanted) {
    const QVariantMap server = saved.fresh.values;
    m_question = new SettingsChangedDialog(saved.changed, wanted, server, this);
    m_question->setAttribute(Qt::WA_DeleteOnClose);
    // From here on the service's values are known, so that only newer changes are told again.
    connect(m_question, &SettingsChangedDialog::keepPageValues, this, [this, server] {
        m_loaded = server;
        saveConfig();
    });
    connect(m_question, &SettingsChangedDialog::keepServerValues, this,
            [this, server, changed = saved.changed] {
                QVariantMap theirs;
                for (const QString &key : changed)
                    theirs[key] = server.value(key);
                m_form->setValues(theirs);
                takeOver(server);
                if (hasUnsavedEdits())
                    return saveConfig();
                enableButtons(false);
                m_status->setText(tr("The server's settings were kept."));
            });
    m_question->open();
}

void SettingWindow::showNotice(const QString &text, bool offersRetry) {
    m_noticeText->setText(text);
    m_notice->setVisible(!text.isEmpty());
    m_retry->setVisible(offersRetry);
}

void SettingWindow::showBusy(const QString &text) {
    m_spinner->setVisible(!text.isEmpty());
    // The end of a job may have told something of its own by now.
    if (!text.isEmpty() || m_status->text() == m_busyText)
        m_status->setText(text);
    m_busyText = text;
}

void SettingWindow::enableButtons(bool enabled) {
    m_apply->setEnabled(enabled);
    m_cancel->setEnabled(enabled);
}
