#pragma once

#include <QObject>

class SiteTree;

/// Sends the user's changes of sites, all of them in one commit. User-interface thread.
class SiteCommit : public QObject {
    Q_OBJECT

public:
    /// The tree must outlive the object.
    explicit SiteCommit(SiteTree *tree, QObject *parent = nullptr);

    /// Begins a commit, unless one is under way or there is nothing to send.
    void send();

signals:
    /// The service has answered; its sites may be others now.
    void answered();
    /// The changes are still here; the message says why.
    void failed(const QString &message);

private:
    void onAnswer(unsigned result);

    SiteTree *m_tree;
};
