#include "storewriter.h"

#include <QThreadPool>

namespace StoreWriter {

namespace {

QThreadPool &writer() {
    static QThreadPool *const pool = [] {
        auto *made = new QThreadPool;
        made->setMaxThreadCount(1);
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
