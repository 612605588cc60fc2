#pragma once

#include <QString>

#include <functional>

class QDialog;

/// The way of a dialog's operation into its queue.
namespace Queueing {

/// Hands an operation over on a runner, for the lists of tens of thousands of devices take their time. The
/// dialog is accepted once that is done; until then it takes no input.
///
/// insert: must not touch widgets. refused: the queue did not take it, or nothing came of it.
void post(QDialog *dialog, std::function<bool()> insert, std::function<void()> refused);

template <typename Queue>
void post(QDialog *dialog, std::function<bool(Queue &)> insert, std::function<void()> refused) {
    // A queue belongs to the thread in which it is made.
    post(
        dialog, [&queue = Queue::instance(), insert = std::move(insert)] { return insert(queue); },
        std::move(refused));
}

} // namespace Queueing
