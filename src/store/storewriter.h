#pragma once

#include <functional>

/// Writes of small things to the stores, off the user-interface thread and in their order: a durable write
/// takes as long as the disk does.
namespace StoreWriter {

/// Queues a write. Any thread.
void post(std::function<void()> write);

/// Waits until everything that was queued is written.
void flush();

} // namespace StoreWriter
