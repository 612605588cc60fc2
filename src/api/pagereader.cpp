#include "pagereader.h"

#include "servicesession.h"

#include <nlohmann/json.hpp>

namespace PageReader {

namespace {
/// A service whose pages never end is not followed for ever.
constexpr int pageLimit = 400;
} // namespace

unsigned readAll(ServiceSession &session, ListCall list, int pageSize,
                 const std::function<void(JSON &)> &take) {
    return readUntil(session, list, pageSize, [&take](JSON &page) {
        take(page);
        return false;
    });
}

unsigned readUntil(ServiceSession &session, ListCall list, int pageSize,
                   const std::function<bool(JSON &)> &hasEnough) {
    for (int page = 0; page < pageLimit; ++page) {
        JSON records;
        const unsigned result = session.call(
            [&](CApiClient &client) { return (client.*list)(page * pageSize, pageSize, records); });
        if (result != ApiOk)
            return result;
        if (!records.is_array())
            return ApiMissingData;
        const std::size_t count = records.size();
        if (hasEnough(records) || count < static_cast<std::size_t>(pageSize))
            break;
    }
    return ApiOk;
}

} // namespace PageReader
