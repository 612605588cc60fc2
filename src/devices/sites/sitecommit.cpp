#include "devices/sites/sitecommit.h"

#include "api/session/servicerequest.h"
#include "devices/inventory/inventoryreader.h"
#include "devices/sites/sitetree.h"
#include "platform/log/messagelog.h"

#include <QDebug>

#include <nlohmann/json.hpp>

namespace {

struct Answer {
    unsigned result = ApiOk;
    Sites::List reading; ///< what the service had right before
};

/// The commit says of every site what it shall be, so what other clients have changed meanwhile is read first
/// and kept.
Answer commit(ServiceSession &session, SiteEdits edits) {
    const LoginInfo &login = session.login();
    qDebug("login info ip: %s, port: %d, account: %s, token: %s", qUtf8Printable(login.address),
           static_cast<int>(login.port), qUtf8Printable(login.account),
           MessageLog::secret(login.token).constData());
    Answer answer;
    answer.result = InventoryReader::readSites(session, answer.reading);
    if (answer.result != ApiOk) {
        qWarning("HTTP API(commitSites) failed!");
        return answer;
    }
    edits.takeReading(answer.reading);
    const JSON sites = edits.commitRecords();
    answer.result = session.call([&](CApiClient &client) { return client.commitSites(sites, "all"); });
    if (answer.result == ApiOk)
        qDebug("commit site info: %s", dumpJson(sites).c_str());
    else
        qWarning("HTTP API(commitSites) failed!");
    return answer;
}

} // namespace

SiteCommit::SiteCommit(SiteTree *tree, QObject *parent) : QObject(parent), m_tree(tree) {}

void SiteCommit::send() {
    if (m_tree->edits().isCommitting() || !m_tree->edits().isDirty())
        return;
    const SiteEdits edits = m_tree->edits();
    m_tree->beginCommit();
    const auto giveUp = [this] {
        m_tree->endCommit(false);
        emit failed(tr("The site changes could not be sent. Press Apply to try again."));
    };
    const bool started = ServiceRequest::post(
        NetJob::createRunner("committing sites"), this,
        [edits](ServiceSession &session) { return commit(session, edits); },
        [this](const Answer &answer) {
            if (answer.result == ApiOk)
                m_tree->setSites(answer.reading);
            onAnswer(answer.result);
        },
        [giveUp](JobOutcome end) {
            // With its session the tree has forgotten the commit.
            if (end == JobOutcome::NotRun || end == JobOutcome::Failed)
                giveUp();
        });
    if (!started)
        giveUp();
}

void SiteCommit::onAnswer(unsigned result) {
    m_tree->endCommit(result == ApiOk);
    if (result != ApiOk)
        emit failed(tr("The site changes could not be sent: %1. Press Apply to try again.")
                        .arg(apiResultText(result)));
    emit answered();
}
