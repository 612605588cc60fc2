#include "devices/operations/rollout/rollouttexts.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QLocale>

namespace RolloutTexts {

namespace {

constexpr qint64 minuteMs = 60 * 1000;

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(RolloutTexts)
};

QString number(int value) {
    return QLocale().toString(value);
}

/// "5 of 5 done, 1 failed"
QString figures(int finished, int total, int failed) {
    const QString done = Texts::tr("%1 of %2 done").arg(number(finished), number(total));
    return failed == 0 ? done : Texts::tr("%1, %2 failed").arg(done, number(failed));
}

QString waveName(Rollout::State state) {
    return state == Rollout::State::SecondWave ? Texts::tr("Second wave") : Texts::tr("First wave");
}

QString waveText(Rollout::State state, const Rollout::Wave &wave) {
    if (wave.tid.isEmpty())
        return Texts::tr("%1: %n device(s), waiting to be sent.", nullptr, wave.total()).arg(waveName(state));
    if (wave.scheduledAt > 0)
        return Texts::tr("%1: %n device(s), scheduled for %2.", nullptr, wave.total())
            .arg(waveName(state), QDateTime::fromMSecsSinceEpoch(wave.scheduledAt)
                                      .toString(QStringLiteral("yyyy/MM/dd hh:mm")));
    return Texts::tr("%1: %2.").arg(waveName(state), figures(wave.finished(), wave.total(), wave.failed));
}

QString waitText(const Rollout &rollout) {
    return Texts::tr("Waiting %1 min.")
        .arg(QLocale().toString((rollout.waitLeft() + minuteMs - 1) / minuteMs));
}

QString reasonText(const Rollout &rollout) {
    const Rollout::Progress &progress = rollout.progress();
    switch (progress.reason) {
    case Rollout::Reason::TooManyFailed:
        return Texts::tr("Stopped: more than %1 % of the first wave failed.")
            .arg(rollout.plan().maxFailedPercent);
    case Rollout::Reason::Cancelled:
        return Texts::tr("Stopped: the task of this wave was cancelled.");
    case Rollout::Reason::TaskGone:
        return Texts::tr(
            "Stopped: the task of this wave is no longer in the list. The wave is not sent again.");
    case Rollout::Reason::NotBegun:
        return Texts::tr("Stopped: this wave did not begin. %1").arg(progress.reasonText);
    case Rollout::Reason::User:
    case Rollout::Reason::None:
        break;
    }
    return Texts::tr("Stopped.");
}

QString restText(const Rollout &rollout) {
    if (rollout.progress().stoppedIn == Rollout::State::SecondWave)
        return {};
    return Texts::tr("Waiting for the second wave: %n device(s).", nullptr,
                     static_cast<int>(rollout.plan().rest().size()));
}

QString doneText(const Rollout &rollout) {
    const Rollout::Progress &progress = rollout.progress();
    const int failed = progress.earlierFailed + progress.wave.failed;
    const int done = progress.earlierDone + progress.wave.done;
    return Texts::tr("Finished: %1.")
        .arg(figures(done + failed, static_cast<int>(rollout.plan().deviceIds.size()), failed));
}

} // namespace

QString standing(const Rollout &rollout) {
    const Rollout::Progress &progress = rollout.progress();
    QStringList sentences;
    switch (progress.state) {
    case Rollout::State::FirstWave:
    case Rollout::State::SecondWave:
        sentences = {waveText(progress.state, progress.wave)};
        break;
    case Rollout::State::Waiting:
        sentences = {waveText(Rollout::State::FirstWave, progress.wave), waitText(rollout)};
        break;
    case Rollout::State::Stopped:
        sentences = {waveText(progress.stoppedIn, progress.wave), reasonText(rollout), restText(rollout)};
        break;
    case Rollout::State::Done:
        sentences = {doneText(rollout)};
        break;
    }
    sentences.removeAll(QString());
    return sentences.join(u' ');
}

} // namespace RolloutTexts
