#pragma once

#include "store/basestore.h"

#include <QtGlobal>

/// The local service's own store, of which the client reads the port. Created where needed and dropped after.
class CConfigStore {
public:
    CConfigStore();

    /// The port on which the local service listens, or 0 where it is not known.
    quint32 serverPort() const;

private:
    CBaseStore m_store;
};
