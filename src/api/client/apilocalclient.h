#pragma once

#include "api/client/apiclient.h"

/// The client of the service on this computer, with the account calls that only it offers. They carry a fresh
/// generic token, never a session's, so they work before anybody has logged in, and go to no other key than
/// the one that is remembered of this computer's service.
class CApiLocalClient : public CApiClient {
public:
    explicit CApiLocalClient(std::uint32_t uPort);

    /// members: object with "total_items" and "data", the account records.
    virtual unsigned memberList(int nStart, int nCount, JSON &members);
    /// szName and szDescription may be null. ApiEmailTaken when there is such an account.
    virtual unsigned newMember(const char *szEmail, const char *szPassword, const char *szName,
                               const char *szPermission, const char *szDescription);
    virtual unsigned reviseMemberPassword(const char *szEmail, const char *szOld, const char *szNew);
};
