#include "queuestrips.h"

#include "exetaskmgr.h"
#include "failedtaskstrip.h"
#include "transferstrip.h"
#include "transientmessage.h"
#include "uploadtaskmgr.h"

#include <QVBoxLayout>

QueueStrips::QueueStrips(QWidget *parent) : QWidget(parent) {
    for (const TaskQueue *queue : {static_cast<TaskQueue *>(&UploadTaskMgr::instance()),
                                   static_cast<TaskQueue *>(&ExeTaskMgr::instance())})
        connect(queue, &TaskQueue::devicesLeftOut, this, [this](const QString &, int count) {
            TransientMessage::show(
                this, tr("Left out: %n device(s) that the server does not manage any more.", nullptr, count),
                TransientMessage::Kind::Error);
        });
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(new FailedTaskStrip(this));
    layout->addWidget(new TransferStrip(&UploadTaskMgr::instance(), this));
}
