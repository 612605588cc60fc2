#include "tasks/panels/queuebanners.h"

#include "tasks/panels/failedtaskbanner.h"
#include "tasks/panels/transferbanner.h"
#include "tasks/queue/exetaskmgr.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "widgets/dialogs/transientmessage.h"

#include <QVBoxLayout>

QueueBanners::QueueBanners(QWidget *parent) : QWidget(parent) {
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
    layout->addWidget(new FailedTaskBanner(this));
    layout->addWidget(new TransferBanner(&UploadTaskMgr::instance(), this));
}
