#include "devices/inventory/recordpool.h"

namespace {

/// Texts that differ for each device anyway need not be looked up for ever.
constexpr qsizetype poolLimit = 10000;
constexpr qsizetype baseLimit = 256;

template <typename Value>
Value sharedIn(QSet<Value> &pool, const Value &value) {
    if (const auto found = pool.constFind(value); found != pool.cend())
        return *found;
    if (pool.size() < poolLimit)
        pool.insert(value);
    return value;
}

} // namespace

QString RecordPool::shared(const QString &text) {
    return sharedIn(m_texts, text);
}

QStringList RecordPool::shared(const QStringList &texts) {
    return sharedIn(m_lists, texts);
}

DeltaText RecordPool::keep(const QString &model, const std::string &text) {
    const QString key = m_bases.size() < baseLimit ? model : QString();
    DeltaText::Base &base = m_bases[key];
    if (!base)
        base = std::make_shared<const std::string>(text);
    return {base, text};
}
