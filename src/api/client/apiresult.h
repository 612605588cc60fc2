#pragma once

#include <QString>

/// Results of the service client's methods. Callers compare with ApiOk and show or log the number otherwise.
enum ApiResult : unsigned {
    ApiOk = 0,
    ApiException = 1,         ///< an exception escaped the request or the handling of its answer
    ApiInvalidArgument = 11,  ///< a precondition failed; nothing was sent
    ApiTransportError = 12,   ///< no HTTP response at all
    ApiHttpStatusError = 13,  ///< a status other than 200
    ApiMissingData = 14,      ///< code 0 without the "data" that the method returns
    ApiServerError = 15,      ///< a non-zero code without a result of its own
    ApiCipherFailure = 16,    ///< a password could not be ciphered
    ApiCode105 = 17,          ///< credentials or token not accepted
    ApiCode108 = 18,          ///< no more sessions
    ApiTargetNotWritten = 19, ///< exportFile: the target exists already or cannot be written
    ApiKeyChanged = 20,       ///< the server has another key than the expected one; nothing was sent
    ApiEmailTaken = 1003      ///< newMember of the local client: the e-mail has an account already
};

/// What a result other than ApiOk means to the user: the part of a sentence that follows "could not be done:
/// ".
QString apiResultText(unsigned result);

/// Logs the failure of a method, if its result is one, and hands the result on.
unsigned loggedResult(const char *method, unsigned result);
