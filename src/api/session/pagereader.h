#pragma once

#include "api/client/apiclient.h"

#include <functional>
#include <string_view>

class ServiceSession;

namespace PageReader {

/// How many devices, states or sites are asked for at a time.
inline constexpr int recordsOfPage = 2000;

/// A method of the client that lists a page: first record, number of records, the page.
using ListCall = unsigned (CApiClient::*)(int, int, JSON &);

/// Asked before every page but the first whether the reading goes on.
using GoOn = std::function<bool()>;

/// Reads a list of the service page by page, and hands every page to the taker, until one is short, or
/// 200,000 records have been read, or it may not go on. Returns the first result that is not ApiOk;
/// ApiMissingData for a page that is no array. For a runner's thread; one for readings lets others send
/// requests before every page.
unsigned readAll(ServiceSession &session, ListCall list, int pageSize,
                 const std::function<void(JSON &page)> &take, const GoOn &goOn = {});

/// A method of the client that gives a page as the text of an array.
using TextCall = unsigned (CApiClient::*)(int, int, std::string &);

/// The same, but the taker gets the text of each record, unparsed and not yet known to be JSON. What it
/// throws over such a text ends the reading with ApiException.
unsigned readTexts(ServiceSession &session, TextCall list,
                   const std::function<void(std::string_view record)> &take);

} // namespace PageReader
