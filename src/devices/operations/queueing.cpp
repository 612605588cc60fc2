#include "devices/operations/queueing.h"

#include "api/session/netjob.h"
#include "store/localstore.h"

#include <QDialog>

#include <utility>

namespace Queueing {

void post(QDialog *dialog, std::function<bool()> insert, std::function<void()> refused) {
    dialog->setEnabled(false);
    const auto failed = [dialog, refused = std::move(refused)] {
        dialog->setEnabled(true);
        refused();
    };
    const auto ended = [failed](JobOutcome end) {
        if (end != JobOutcome::Delivered)
            failed();
    };
    const quint64 session = CLocalStore::instance().loginInfo().generation;
    const bool started = NetJob::post(
        NetJob::createRunner("queueing an operation", NetTask::Turn::Beside), dialog,
        [insert = std::move(insert), session]() mutable {
            // The lists are freed here too: that takes its time as well.
            const std::function<bool()> once = std::exchange(insert, nullptr);
            // What was asked for in one session is not done in the next one.
            return CLocalStore::instance().loginInfo().generation == session && once();
        },
        [dialog, failed](bool done) { done ? dialog->accept() : failed(); }, ended);
    if (!started)
        ended(JobOutcome::NotRun);
}

} // namespace Queueing
