#pragma once

#include <QString>

#include <functional>

/// What is wrong with a store file, for whoever tells the user. Any thread.
namespace StoreTrouble {

enum class Kind {
    Repaired,   ///< it was damaged; a new one holds what could be read of it
    Unrepaired, ///< it is damaged and no new one can be made
    Unreadable, ///< it cannot be opened or read
    Unwritable  ///< what it holds can be read, but nothing can be stored: a full disk, or no permission
};

struct Report {
    Kind kind = Kind::Repaired;
    QString file;
    QString keptAs; ///< Repaired: the damaged file's new name
    int rows = 0;   ///< Repaired: how many entries could be read
};

/// Tells the receiver once for each file and kind. What comes before there is one waits for it.
void report(const Report &report);

/// The receiver is called on the reporting thread; an empty one is none.
void setReceiver(std::function<void(const Report &)> receiver);

} // namespace StoreTrouble
