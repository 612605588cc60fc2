#pragma once

#include <QObject>

/// What happens to the session as a whole, told in the user-interface thread.
class SessionEvents : public QObject {
    Q_OBJECT

public:
    static SessionEvents &instance();

    /// Tells that the service does not know the session of this generation any more; once a session.
    void reportLost(quint64 generation);
    /// True for a session that the service has ended, as told last.
    bool wasLost(quint64 generation) const { return generation != 0 && generation == m_lastLost; }

signals:
    /// The service has ended the present session: log off here, without asking it again.
    void sessionLost();

private:
    SessionEvents() = default;

    quint64 m_lastLost = 0;
};
