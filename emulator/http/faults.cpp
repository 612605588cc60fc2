#include "http/faults.h"

#include <array>
#include <charconv>
#include <string_view>
#include <utility>

namespace emulator {

namespace {

enum class Value { None, Number, Where };

struct KindName {
    std::string_view name;
    FaultKind kind;
    Value value;
};

constexpr std::array<KindName, 15> kinds = {{
    {"no-answer", FaultKind::NoResponse, Value::None},
    {"late", FaultKind::Late, Value::Number},
    {"reset", FaultKind::Reset, Value::None},
    {"status", FaultKind::Status, Value::Number},
    {"not-json", FaultKind::NotJson, Value::None},
    {"wrong-types", FaultKind::WrongTypes, Value::Where},
    {"no-data", FaultKind::NoData, Value::None},
    {"bad-cipher", FaultKind::BadCipher, Value::None},
    {"code", FaultKind::ResponseCode, Value::Number},
    {"renew", FaultKind::Renew, Value::None},
    {"expire", FaultKind::Expire, Value::None},
    {"drip", FaultKind::Drip, Value::None},
    {"early", FaultKind::Early, Value::Number},
    {"cut-body", FaultKind::CutBody, Value::Number},
    {"slow-body", FaultKind::SlowBody, Value::Number},
}};

template <typename Number>
Number numberOf(std::string_view text, const char *what) {
    Number number{};
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (error != std::errc() || end != text.data() + text.size())
        throw FaultError(std::string(what) + " needs a number");
    return number;
}

std::pair<std::string_view, std::string_view> splitAt(std::string_view text, char separator) {
    const auto at = text.find(separator);
    return at == std::string_view::npos ? std::pair(text, std::string_view())
                                        : std::pair(text.substr(0, at), text.substr(at + 1));
}

const KindName &kindOf(std::string_view name) {
    for (const KindName &kind : kinds)
        if (kind.name == name)
            return kind;
    throw FaultError("unknown kind of fault \"" + std::string(name) + "\"");
}

void readValue(Fault &fault, const KindName &kind, std::string_view value) {
    const std::string name(kind.name);
    if (kind.value == Value::None && !value.empty())
        throw FaultError(name + " takes no value");
    if (kind.value == Value::Number) {
        fault.number = numberOf<int>(value, name.c_str());
        const bool isStatus = fault.kind == FaultKind::Status || fault.kind == FaultKind::Early;
        if (fault.number < 0 || (isStatus && (fault.number < 200 || fault.number > 599)))
            throw FaultError(name + " takes no such number");
    }
    if (kind.value == Value::Where) {
        fault.where = value.empty() ? "members" : std::string(value);
        if (fault.where != "members" && fault.where != "data" && fault.where != "code")
            throw FaultError(name + " knows members, data and code");
    }
}

void readLimit(Fault &fault, std::string_view limit) {
    const auto [name, value] = splitAt(limit, '=');
    if (name == "after") {
        fault.after = numberOf<std::uint64_t>(value, "after");
    } else if (name == "times") {
        fault.times = numberOf<std::uint64_t>(value, "times");
    } else if (name == "rate") {
        fault.rate = numberOf<double>(value, "rate");
        if (!(fault.rate >= 0 && fault.rate <= 1))
            throw FaultError("rate goes from 0 to 1");
    } else {
        throw FaultError("unknown limit \"" + std::string(name) + "\" of a fault");
    }
}

} // namespace

Fault readFault(const std::string &text) {
    auto [head, limits] = splitAt(text, ',');
    const auto [what, path] = splitAt(head, '@');
    const auto [name, value] = splitAt(what, '=');
    const KindName &kind = kindOf(name);
    Fault fault;
    fault.kind = kind.kind;
    fault.path = path;
    if (head.find('@') != std::string_view::npos && !path.starts_with('/'))
        throw FaultError("the path of a fault begins with \"/\"");
    readValue(fault, kind, value);
    while (!limits.empty()) {
        const auto [limit, rest] = splitAt(limits, ',');
        readLimit(fault, limit);
        limits = rest;
    }
    return fault;
}

void Faults::add(const std::string &text) {
    Fault fault = readFault(text);
    const std::lock_guard lock(m_mutex);
    m_faults.push_back(std::move(fault));
}

void Faults::clear() {
    const std::lock_guard lock(m_mutex);
    m_faults.clear();
}

FaultPlan Faults::planFor(const std::string &path) {
    const std::lock_guard lock(m_mutex);
    FaultPlan plan;
    for (Fault &fault : m_faults) {
        // A fault that loses against an earlier one keeps its turns for later requests.
        const bool adds = fault.kind == FaultKind::Late || fault.kind == FaultKind::Renew ||
                          fault.kind == FaultKind::Expire || fault.kind == FaultKind::SlowBody;
        if ((plan.main && !adds) || !hits(fault, path))
            continue;
        plan.lateMs += fault.kind == FaultKind::Late ? fault.number : 0;
        plan.bodyRate = fault.kind == FaultKind::SlowBody ? fault.number : plan.bodyRate;
        plan.renew |= fault.kind == FaultKind::Renew;
        plan.expire |= fault.kind == FaultKind::Expire;
        if (!adds)
            plan.main = fault;
    }
    return plan;
}

bool Faults::hits(Fault &fault, const std::string &path) {
    if (!path.starts_with(fault.path) || ++fault.seen <= fault.after)
        return false;
    if ((fault.times && fault.hits >= *fault.times) || !m_random.chance(fault.rate))
        return false;
    ++fault.hits;
    return true;
}

} // namespace emulator
