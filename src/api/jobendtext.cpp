#include "jobendtext.h"

#include <QCoreApplication>

namespace {
struct Texts {
    Q_DECLARE_TR_FUNCTIONS(JobEnd)
};
} // namespace

QString jobEndText(JobEnd end) {
    switch (end) {
    case JobEnd::Delivered:
        break;
    case JobEnd::NotRun:
        return Texts::tr("the client is busy, try again");
    case JobEnd::Failed:
        return Texts::tr("something went wrong in the client, its log says what");
    case JobEnd::SessionGone:
        return Texts::tr("the session has ended");
    }
    return {};
}
