#include "sitecommit.h"

#include "messagelog.h"
#include "servicerequest.h"
#include "sitetree.h"

#include <QDebug>

#include <nlohmann/json.hpp>

namespace {

unsigned commit(ServiceSession &session, const JSON &sites) {
    const LoginInfo &login = session.login();
    qDebug("login info ip: %s, port: %d, account: %s, token: %s", qUtf8Printable(login.address),
           static_cast<int>(login.port), qUtf8Printable(login.account),
           MessageLog::secret(login.token).constData());
    const unsigned result =
        session.call([&](CApiClient &client) { return client.commitSites(sites, "all"); });
    if (result == ApiOk)
        qDebug("commit site info: %s", dumpJson(sites).c_str());
    else
        qWarning("HTTP API(commitSites) failed!");
    return result;
}

} // namespace

SiteCommit::SiteCommit(SiteTree *tree, QObject *parent) : QObject(parent), m_tree(tree) {}

void SiteCommit::send() {
    if (m_tree->edits().isCommitting() || !m_tree->edits().isDirty())
        return;
    const bool started = ServiceRequest::post(
        NetJob::createRunner("committing sites"), this,
        [sites = m_tree->beginCommit()](ServiceSession &session) { return commit(session, sites); },
        [this](unsigned result) { onAnswer(result); },
        [this](JobEnd end) {
            if (end != JobEnd::Delivered)
                m_tree->endCommit(false);
            if (end == JobEnd::NotRun || end == JobEnd::Failed)
                emit failed(tr("The site changes could not be sent. Press Apply to try again."));
        });
    if (!started)
        m_tree->endCommit(false);
}

void SiteCommit::onAnswer(unsigned result) {
    m_tree->endCommit(result == ApiOk);
    if (result != ApiOk)
        emit failed(tr("The site changes could not be sent: %1. Press Apply to try again.")
                        .arg(apiResultText(result)));
    emit answered();
}
