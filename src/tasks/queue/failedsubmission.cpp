#include "tasks/queue/failedsubmission.h"

#include "tasks/service/tasktype.h"

#include <QCoreApplication>

namespace {
struct Texts {
    Q_DECLARE_TR_FUNCTIONS(FailedSubmission)
};
} // namespace

QString FailedSubmission::text() const {
    const QString name = title.isEmpty() ? TaskType::title(serviceType) : title;
    if (!mayHaveBegun)
        return (devices > 0 ? Texts::tr("%1 on %n device(s) did not begin. %2", nullptr, devices)
                            : Texts::tr("%1 did not begin. %2"))
            .arg(name, reason);
    const QString told = (devices > 0 ? Texts::tr("%1 on %n device(s) may have begun. %2", nullptr, devices)
                                      : Texts::tr("%1 may have begun. %2"))
                             .arg(name, reason);
    return tid.isEmpty() ? Texts::tr("%1 Look at the devices before you try again.").arg(told)
                         : Texts::tr("%1 Its task in the list tells whether it has.").arg(told);
}
