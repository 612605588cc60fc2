// Commands that the service runs on devices.

#include "apiclient.h"

#include <nlohmann/json.hpp>

unsigned CApiClient::runCustomCgisEx(const JSON &cgis, const JSON &devices, JSON &answers) {
    if (!cgis.is_array() || !devices.is_array())
        return ApiInvalidArgument;
    return postAsAccount({"runCustomCgisEx", "/v1/cgi/customx", Payload::Plain},
                         {{"cgis", cgis}, {"devices", devices}}, &answers);
}
