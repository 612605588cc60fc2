#include "api/session/requestgroup.h"

#include "api/transport/requestdeadline.h"

#include <utility>

namespace {
thread_local const RequestGroup *currentGroup = nullptr;
} // namespace

void RequestGroup::cut() const {
    *m_cut = true;
    RequestDeadline::cut(*this);
}

const RequestGroup *RequestGroup::current() {
    return currentGroup;
}

RequestGroup::Scope::Scope(RequestGroup group) : m_group(std::move(group)), m_outer(currentGroup) {
    currentGroup = &m_group;
}

RequestGroup::Scope::~Scope() {
    currentGroup = m_outer;
}
