#pragma once

#include <QObject>

#include <mutex>
#include <string>

/// What happens to the session as a whole, told in the user-interface thread.
class SessionEvents : public QObject {
    Q_OBJECT

public:
    static SessionEvents &instance();

    /// Tells that the service does not know the session of this generation any more; once a session.
    void reportLost(quint64 generation);
    /// True for a session that the service has ended, as told last.
    bool wasLost(quint64 generation) const { return generation != 0 && generation == m_lastLost; }

    /// The server of the session of this generation has shown another key than the session's; fingerprint:
    /// of that key. Any thread. The first report asks the question below, which stays one until it is
    /// answered; after a refusal it is not asked again in that session.
    void reportKeyChanged(quint64 generation, const std::string &fingerprint);
    /// True while the user is being asked about the server's key. Any thread.
    bool isKeyInQuestion() const;
    /// What the user has answered. A key that was trusted becomes the session's.
    void answerKeyQuestion(bool trusted);

signals:
    /// The user has to say whether the server's new key is to be trusted. Until then, and without trust,
    /// nothing is sent to it.
    void keyChanged(const QString &fingerprint);

    /// The service has ended the present session: log off here, without asking it again.
    void sessionLost();

private:
    SessionEvents() = default;

    enum class KeyQuestion { None, Open, Refused };

    quint64 m_lastLost = 0;
    mutable std::mutex m_mutex; ///< for what follows
    KeyQuestion m_keyQuestion = KeyQuestion::None;
    quint64 m_keyGeneration = 0; ///< of the session that the question is about
    std::string m_newKey;
};
