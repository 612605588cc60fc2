#include "api/session/jobendtext.h"

#include <QCoreApplication>

namespace {
struct Texts {
    Q_DECLARE_TR_FUNCTIONS(JobOutcome)
};
} // namespace

QString jobEndText(JobOutcome end) {
    switch (end) {
    case JobOutcome::Delivered:
        break;
    case JobOutcome::NotRun:
        return Texts::tr("the client is busy, try again");
    case JobOutcome::Failed:
        return Texts::tr("something went wrong in the client, its log says what");
    case JobOutcome::SessionGone:
        return Texts::tr("the session has ended");
    }
    return {};
}
