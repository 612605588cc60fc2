#pragma once

#include "api/session/netjob.h"
#include "api/session/servicesession.h"
#include "api/session/sessionevents.h"

/// The road of every request on the stored session.
namespace ServiceRequest {

/// Copies the stored session, runs the work with it on the runner and brings the result home as NetJob does.
/// The result is dropped when the session has ended meanwhile; an answer that the service does not know the
/// session any more is reported to SessionEvents, so that no caller has to look for it.
template <typename Work, typename Result = std::invoke_result_t<Work, ServiceSession &>>
bool post(NetTask *runner, QObject *receiver, Work work,
          std::type_identity_t<std::function<void(Result)>> done, NetJob::Ended ended = {},
          NetTask::Preparation preparation = {}) {
    auto session = std::make_shared<ServiceSession>(CLocalStore::instance().loginInfo());
    return NetJob::post(
        runner, receiver, [session, work = std::move(work)]() mutable { return work(*session); },
        std::move(done), std::move(ended), std::move(preparation),
        [session] {
            if (session->isLost())
                SessionEvents::instance().reportLost(session->login().generation);
            return session->isPresent() && !session->isLost();
        });
}

} // namespace ServiceRequest
