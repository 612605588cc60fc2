#include "sessionevents.h"

#include "localstore.h"

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
