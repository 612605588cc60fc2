#include "queuestrips.h"

#include "exetaskmgr.h"
#include "failedtaskstrip.h"
#include "transferstrip.h"
#include "uploadtaskmgr.h"

#include <QVBoxLayout>

QueueStrips::QueueStrips(QWidget *parent) : QWidget(parent) {
    auto *failed = new FailedTaskStrip(this);
    failed->follow(&UploadTaskMgr::instance());
    failed->follow(&ExeTaskMgr::instance());
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(failed);
    layout->addWidget(new TransferStrip(&UploadTaskMgr::instance(), this));
}
