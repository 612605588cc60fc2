#include "api/session/pagereader.h"

#include "api/session/requestturn.h"
#include "api/session/servicesession.h"
#include "platform/elementtexts.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <algorithm>

namespace PageReader {

namespace {
/// A service whose pages never end is not followed for ever.
constexpr int recordLimit = 200'000;

/// Called when every page was full.
void warnOfLimit() {
    qWarning("%d records were read; what the service has beyond is left out", recordLimit);
}
} // namespace

unsigned readAll(ServiceSession &session, ListCall list, int pageSize,
                 const std::function<void(JSON &)> &take, const GoOn &goOn) {
    for (int start = 0; start < recordLimit; start += pageSize) {
        if (start > 0 && goOn && !goOn())
            return ApiOk;
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
            return ApiOk;
    }
    warnOfLimit();
    return ApiOk;
}

unsigned readTexts(ServiceSession &session, TextCall list,
                   const std::function<void(std::string_view)> &take) {
    std::string text;
    for (int start = 0; start < recordLimit; start += recordsOfPage) {
        RequestTurn::passOn();
        const unsigned result =
            session.call([&](CApiClient &client) { return (client.*list)(start, recordsOfPage, text); });
        if (result != ApiOk)
            return result;
        try {
            if (!text.starts_with('[') && !parseJson(text).is_array())
                return ApiMissingData;
            const std::vector<std::string_view> records = elementTexts(text);
            std::for_each(records.begin(), records.end(), take);
            if (records.size() < recordsOfPage)
                return ApiOk;
        } catch (const std::exception &error) {
            qWarning("A page of records cannot be read: %s", error.what());
            return ApiException;
        }
    }
    warnOfLimit();
    return ApiOk;
}

} // namespace PageReader
