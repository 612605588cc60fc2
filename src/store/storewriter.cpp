#include "store/storewriter.h"

#include <QCoreApplication>
#include <QThreadPool>

namespace StoreWriter {

namespace {

QThreadPool &writer() {
    static QThreadPool *const pool = [] {
        auto *made = new QThreadPool;
        made->setMaxThreadCount(1);
        // A thread that the end of the process finds at rest holds it up on some systems.
        qAddPostRoutine(flush);
        return made;
    }();
    return *pool;
}

} // namespace

void post(std::function<void()> write) {
    writer().start(std::move(write));
}

void flush() {
    writer().waitForDone();
}

} // namespace StoreWriter
