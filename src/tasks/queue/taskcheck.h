#pragma once

#include "platform/json.h"

#include <initializer_list>

/// The checks of an insertion, one after the other. The first one that fails is logged, and the rest are
/// passed over.
class TaskCheck {
public:
    /// place: the insertion's name, which its messages end with; null for none.
    explicit TaskCheck(const char *place = nullptr) : m_place(place) {}

    TaskCheck &require(bool condition,
                       const char *refusal = "Inserting new task with the invalid parameter.");
    /// Texts that have to be there.
    TaskCheck &texts(std::initializer_list<QString> texts);
    TaskCheck &fileName(const QString &name);
    /// A list of devices with at least one.
    TaskCheck &devices(const JSON &devices,
                       const char *emptyRefusal = "Inserting new task requires the device information.");
    /// A list of files with at least one.
    TaskCheck &certificates(const JSON &files);

    bool passed() const { return m_passed; }

private:
    const char *m_place;
    bool m_passed = true;
};
