#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"

namespace emulator {

namespace {

std::string parentOf(const Json &body) {
    std::string parent = optionalText(body, "parentid");
    return parent.empty() ? std::string(rootSiteId) : parent;
}

Response newSite(Service &service, const Call &call) {
    const std::string name = filledTextMember(call.body, "sitename");
    const std::string parent = parentOf(call.body);
    const std::string id =
        service.withModel([&](Model &model) { return model.sites.add(name, parent, nowMs()); });
    return Response::secret(jsonText({{"siteid", id}}));
}

Response updateSite(Service &service, const Call &call) {
    const std::string id = filledTextMember(call.body, "siteid");
    const std::string name = filledTextMember(call.body, "sitename");
    service.withModel([&](Model &model) { model.sites.rename(id, name); });
    return {};
}

Response dropSite(Service &service, const Call &call) {
    const std::string id = filledTextMember(call.body, "siteid");
    service.withModel([&](Model &model) { removeSite(model, id); });
    return {};
}

Response listSites(Service &service, const Call &call) {
    const Page page = pageOf(call.body);
    return Response::secret(service.withModel([&](Model &model) { return model.sites.pageText(page); }));
}

Response commitSiteList(Service &service, const Call &call) {
    const std::string stage = textMember(call.body, "state");
    const Json &sites = arrayMember(call.body, "sites");
    service.withModel([&](Model &model) {
        const auto records = model.batches.take("sites " + call.session.session, stage, sites, nowMs());
        if (records)
            commitSites(model, *records);
    });
    return {};
}

} // namespace

Endpoints siteEndpoints() {
    return {
        {"POST", "/v1/site/new", Role::Writer, &newSite},
        {"POST", "/v1/site/update", Role::Writer, &updateSite},
        {"POST", "/v1/site/rms", Role::Writer, &dropSite},
        {"POST", "/v1/site/list", Role::Reader, &listSites},
        {"POST", "/v1/site/commit", Role::Writer, &commitSiteList},
    };
}

} // namespace emulator
