#pragma once

#include "apiclient.h"

#include <functional>

class ServiceSession;

namespace PageReader {

/// How many devices, states or sites are asked for at a time.
inline constexpr int recordsOfPage = 2000;

/// A method of the client that lists a page: first record, number of records, the page.
using ListCall = unsigned (CApiClient::*)(int, int, JSON &);

/// Reads a list of the service page by page, and hands every page to the taker, until one is short. Returns
/// the first result that is not ApiOk; ApiMissingData for a page that is no array. For a runner's thread.
unsigned readAll(ServiceSession &session, ListCall list, int pageSize,
                 const std::function<void(JSON &page)> &take);

/// The same, and no further than to the page with which the taker has enough.
unsigned readUntil(ServiceSession &session, ListCall list, int pageSize,
                   const std::function<bool(JSON &page)> &hasEnough);

} // namespace PageReader
