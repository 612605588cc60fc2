#pragma once

#include "devices/inventory/deltatext.h"

#include <QHash>
#include <QSet>
#include <QStringList>

/// What the records of a reading have in common, kept once: column texts, lists of sites, and the texts that
/// whole records are kept as differences from. Used while records are read, by one thread.
class RecordPool {
public:
    /// The same text, sharing its letters with all equal ones.
    QString shared(const QString &text);
    QStringList shared(const QStringList &texts);

    /// Keeps the text of a device's whole record. Devices of a model are most alike.
    DeltaText keep(const QString &model, const std::string &text);

private:
    QSet<QString> m_texts;
    QSet<QStringList> m_lists;
    QHash<QString, DeltaText::Base> m_bases; ///< by model
};
