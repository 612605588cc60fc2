#include "pagereader.h"

#include "requestturn.h"
#include "servicesession.h"

#include <nlohmann/json.hpp>

namespace PageReader {

namespace {
/// A service whose pages never end is not followed for ever.
constexpr int recordLimit = 200'000;
} // namespace

unsigned readAll(ServiceSession &session, ListCall list, int pageSize,
                 const std::function<void(JSON &)> &take, const GoOn &goOn) {
    for (int start = 0; start < recordLimit; start += pageSize) {
        if (start > 0 && goOn && !goOn())
            break;
        RequestTurn::passOn();
        JSON records;
        const unsigned result =
            session.call([&](CApiClient &client) { return (client.*list)(start, pageSize, records); });
        if (result != ApiOk)
            return result;
        if (!records.is_array())
            return ApiMissingData;
        const std::size_t count = records.size();
        take(records);
        if (count < static_cast<std::size_t>(pageSize))
            break;
    }
    return ApiOk;
}

} // namespace PageReader
