#include "platform/files/storetrouble.h"

#include <mutex>
#include <set>
#include <utility>
#include <vector>

namespace StoreTrouble {

namespace {

struct State {
    std::mutex mutex;
    std::function<void(const Report &)> receiver;
    std::set<std::pair<QString, Kind>> told;
    std::vector<Report> waiting;
};

State &state() {
    static State state;
    return state;
}

} // namespace

void report(const Report &report) {
    const std::lock_guard lock(state().mutex);
    if (!state().told.insert({report.file, report.kind}).second)
        return;
    if (state().receiver)
        state().receiver(report);
    else
        state().waiting.push_back(report);
}

void setReceiver(std::function<void(const Report &)> receiver) {
    const std::lock_guard lock(state().mutex);
    state().receiver = std::move(receiver);
    if (!state().receiver)
        return;
    for (const Report &report : std::exchange(state().waiting, {}))
        state().receiver(report);
}

} // namespace StoreTrouble
