#include "api/session/sessionevents.h"

#include "store/localstore.h"

#include <QCoreApplication>
#include <QDebug>

SessionEvents &SessionEvents::instance() {
    static SessionEvents events;
    return events;
}

void SessionEvents::reportLost(quint64 generation) {
    if (generation == m_lastLost || generation != CLocalStore::instance().loginInfo().generation)
        return;
    m_lastLost = generation;
    emit sessionLost();
}

void SessionEvents::reportKeyChanged(quint64 generation, const std::string &fingerprint) {
    const LoginInfo login = CLocalStore::instance().loginInfo();
    // A request that was under way while the key was trusted has no news.
    if (login.generation != generation || login.serverKey == fingerprint)
        return;
    {
        const std::lock_guard lock(m_mutex);
        if (m_keyGeneration == generation && m_keyQuestion != KeyQuestion::None)
            return;
        m_keyGeneration = generation;
        m_keyQuestion = KeyQuestion::Open;
        m_newKey = fingerprint;
    }
    qWarning("The key of server %s has changed from %s to %s; nothing is sent to it",
             qUtf8Printable(login.server), login.serverKey.c_str(), fingerprint.c_str());
    QMetaObject::invokeMethod(
        QCoreApplication::instance(),
        [this, key = QString::fromStdString(fingerprint)] { emit keyChanged(key); }, Qt::QueuedConnection);
}

bool SessionEvents::isKeyInQuestion() const {
    const std::lock_guard lock(m_mutex);
    return m_keyQuestion == KeyQuestion::Open &&
           m_keyGeneration == CLocalStore::instance().loginInfo().generation;
}

void SessionEvents::answerKeyQuestion(bool trusted) {
    const std::lock_guard lock(m_mutex);
    if (m_keyQuestion != KeyQuestion::Open)
        return;
    m_keyQuestion = trusted ? KeyQuestion::None : KeyQuestion::Refused;
    if (trusted)
        CLocalStore::instance().trustServerKey(m_newKey, m_keyGeneration);
}
