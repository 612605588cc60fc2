#pragma once

#include <atomic>
#include <memory>

/// Requests that end together: those of a session, of a login dialog, of a check.
///
/// Copies speak of the same group. Any thread.
class RequestGroup {
public:
    RequestGroup() : m_cut(std::make_shared<std::atomic_bool>(false)) {}

    /// Ends every request of the group that is under way, and every later one as soon as it begins.
    void cut() const;
    bool isCut() const { return *m_cut; }

    bool operator==(const RequestGroup &other) const { return m_cut == other.m_cut; }

    class Scope;

    /// The group that this thread's next request belongs to, or null. Valid while its scope lasts.
    static const RequestGroup *current();

private:
    std::shared_ptr<std::atomic_bool> m_cut;
};

/// Makes the requests that this thread begins members of the group, for as long as it lives.
class RequestGroup::Scope {
public:
    explicit Scope(RequestGroup group);
    ~Scope();
    Scope(const Scope &) = delete;
    Scope &operator=(const Scope &) = delete;

private:
    RequestGroup m_group;
    const RequestGroup *m_outer;
};
