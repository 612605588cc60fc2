#include "tasks/panels/tasktexts.h"

#include "tasks/service/taskstate.h"
#include "tasks/service/tasktype.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QLocale>

#include <algorithm>
#include <numeric>

namespace TaskTexts {

namespace {

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(TaskTexts)
};

/// "2 A, 1 B", the greatest count first.
QString counted(const QHash<QString, int> &counts) {
    std::vector<std::pair<int, QString>> sorted;
    for (auto each = counts.begin(); each != counts.end(); ++each)
        sorted.emplace_back(-each.value(), each.key());
    std::sort(sorted.begin(), sorted.end());
    QStringList parts;
    for (const auto &[count, text] : sorted)
        parts += QStringLiteral("%1 %2").arg(QLocale().toString(-count), text);
    return parts.join(QStringLiteral(", "));
}

int rank(const TaskDevice &device) {
    if (TaskState::isFailure(device.state))
        return 0;
    return TaskState::isFinal(device.state) ? 2 : 1;
}

bool isScheduled(const TaskRecord &task) {
    return task.status == TaskState::scheduled && task.scheduledAt > 0;
}

QString orDashes(const QString &text) {
    return text.isEmpty() ? QStringLiteral("--") : text;
}

} // namespace

QString summary(const TaskRecord &task) {
    QHash<QString, int> states;
    QHash<QString, int> causes;
    for (const TaskDevice &device : task.devices) {
        if (TaskState::isFailure(device.state))
            ++causes[TaskState::cause(device.state)];
        else
            ++states[TaskState::text(device.state)];
    }
    if (task.failedDevices == 0)
        return Texts::tr("%n device(s): %1", nullptr, static_cast<int>(task.devices.size()))
            .arg(counted(states));
    return Texts::tr("%1 of %2 failed: %3")
        .arg(QLocale().toString(task.failedDevices),
             QLocale().toString(static_cast<int>(task.devices.size())), counted(causes));
}

QString standing(const TaskRecord &task) {
    // The state says little about a failed task; its causes say more.
    if (task.isFinal() && task.failedDevices > 0)
        return summary(task);
    const QString state = isScheduled(task) ? Texts::tr("Scheduled for %1").arg(zonedTime(task.scheduledAt))
                                            : TaskState::text(task.state);
    return Texts::tr("%n device(s) · %1", nullptr, static_cast<int>(task.devices.size())).arg(state);
}

bool showsProgress(const TaskRecord &task) {
    return !task.isFinal() && !isScheduled(task);
}

QString percent(int progress) {
    return QStringLiteral("%1 %").arg(progress);
}

QString spoken(QStringList parts) {
    parts.removeAll(QString());
    return parts.join(QStringLiteral(", "));
}

QString origin(const TaskRecord &task) {
    QStringList lines;
    const QString at = zonedTime(task.createdAt);
    if (task.user.isEmpty())
        lines += Texts::tr("Started at %1").arg(at);
    else
        lines += Texts::tr("Started by %1 at %2").arg(task.user, at);
    if (task.scheduledAt > 0)
        lines += Texts::tr("Scheduled for %1").arg(zonedTime(task.scheduledAt));
    return lines.join(QLatin1Char('\n'));
}

QString shortTime(qint64 unixMs) {
    if (unixMs <= 0)
        return {};
    const QDateTime time = QDateTime::fromMSecsSinceEpoch(unixMs);
    const bool today = time.date() == QDate::currentDate();
    return time.toString(today ? QStringLiteral("hh:mm") : QStringLiteral("MM/dd hh:mm"));
}

QString zonedTime(qint64 unixMs) {
    if (unixMs <= 0)
        return Texts::tr("an unknown time");
    const QDateTime time = QDateTime::fromMSecsSinceEpoch(unixMs);
    const int minutes = time.offsetFromUtc() / 60;
    QString zone = QStringLiteral("UTC%1%2")
                       .arg(minutes < 0 ? QLatin1Char('-') : QLatin1Char('+'))
                       .arg(std::abs(minutes) / 60);
    if (minutes % 60 != 0)
        zone += QStringLiteral(":%1").arg(std::abs(minutes) % 60, 2, 10, QLatin1Char('0'));
    return QStringLiteral("%1 (%2)").arg(time.toString(QStringLiteral("yyyy/MM/dd hh:mm")), zone);
}

QString target(const TaskTarget &target) {
    return QStringList{orDashes(target.model), orDashes(target.ip), orDashes(target.mac)}.join(
        QStringLiteral(" · "));
}

QString copyLine(const TaskDevice &device) {
    return QStringList{device.target->model, device.target->ip, device.target->mac,
                       TaskState::text(device.state), percent(device.progress)}
        .join(QLatin1Char('\t'));
}

QString copyText(const TaskRecord &task) {
    QStringList lines{QStringLiteral("%1\t%2").arg(TaskType::title(task.type), TaskState::text(task.state)),
                      origin(task), summary(task)};
    for (const int place : order(task))
        lines += copyLine(task.devices[static_cast<std::size_t>(place)]);
    return lines.join(QLatin1Char('\n'));
}

std::vector<int> order(const TaskRecord &task) {
    std::vector<int> places(task.devices.size());
    std::iota(places.begin(), places.end(), 0);
    std::stable_sort(places.begin(), places.end(), [&](int a, int b) {
        return rank(task.devices[static_cast<std::size_t>(a)]) <
               rank(task.devices[static_cast<std::size_t>(b)]);
    });
    return places;
}

} // namespace TaskTexts
