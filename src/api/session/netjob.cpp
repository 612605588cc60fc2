#include "api/session/netjob.h"

#include <QDebug>

#include <new>

namespace NetJob {

NetTask *createRunner(const char *purpose, NetTask::Turn turn) {
    auto *runner = new (std::nothrow) NetTask(turn);
    if (!runner) {
        qWarning("Fail to create NetTask while %s", purpose);
        return nullptr;
    }
    QObject::connect(runner, &QThread::finished, runner, &QObject::deleteLater);
    return runner;
}

bool start(NetTask *runner, QObject *receiver, std::function<void()> job, std::function<void()> finished,
           NetTask::Preparation preparation) {
    if (!runner || runner->isRunning())
        return false;
    runner->setUp(
        reinterpret_cast<quintptr>(receiver), [job = std::move(job)](quintptr) { job(); },
        std::move(preparation));
    // Queued to the receiver: Qt drops the call when the receiver is destroyed first.
    QObject::connect(runner, &QThread::finished, receiver, std::move(finished),
                     static_cast<Qt::ConnectionType>(Qt::QueuedConnection | Qt::SingleShotConnection));
    runner->start();
    return true;
}

} // namespace NetJob
