#include "platform/system/servicecontrol.h"

#include "platform/files/apppaths.h"

#include <QDebug>
#include <QFile>
#include <QProcess>
#include <QRegularExpression>

#include <optional>

namespace ServiceControl {

namespace {

constexpr int processWaitMs = 30000;
constexpr qint64 stateFileLimit = 64 * 1024;
[[maybe_unused]] constexpr int serviceDoesNotExist = 1060;

/// What a service query said: its exit code and what it printed.
struct QueryAnswer {
    int exitCode = 0;
    QString output;
};

std::optional<QueryAnswer> runQuery(const QString &program, const QStringList &arguments) {
    QProcess process;
    process.start(program, arguments);
    if (!process.waitForStarted(processWaitMs)) {
        qDebug("Failed to start process for service query.");
        return std::nullopt;
    }
    if (!process.waitForFinished(processWaitMs)) {
        qDebug("Process did not finish properly.");
        process.kill();
        process.waitForFinished(1000);
    }
    return QueryAnswer{process.exitCode(), QString::fromLocal8Bit(process.readAllStandardOutput())};
}

QueryAnswer answerOfStateFile() {
    QFile file(AppPaths::serviceStateFile());
    if (!file.open(QIODevice::ReadOnly))
        return {serviceDoesNotExist, {}};
    return {0, QString::fromUtf8(file.read(stateFileLimit))};
}

#ifdef Q_OS_WIN

QueryAnswer answerOfSystem() {
    // Only the system folder is looked at: a program of that name elsewhere must not be started.
    const QString program = qEnvironmentVariable("SystemRoot", QStringLiteral("C:\\Windows")) +
                            QStringLiteral("\\System32\\sc.exe");
    return runQuery(program, {QStringLiteral("query"), QStringLiteral("nvldm")}).value_or(QueryAnswer{});
}

#else

/// The service manager's words in the number form of a service query.
QString stateLine(const QString &activeState) {
    const QString form = QStringLiteral("STATE : %1");
    if (activeState == QLatin1String("active") || activeState == QLatin1String("reloading"))
        return form.arg(4);
    if (activeState == QLatin1String("inactive") || activeState == QLatin1String("failed"))
        return form.arg(1);
    if (activeState == QLatin1String("activating"))
        return form.arg(2);
    if (activeState == QLatin1String("deactivating"))
        return form.arg(3);
    return {};
}

QueryAnswer answerOfSystem() {
    const QString program = QStringLiteral("/usr/bin/systemctl");
    if (!QFile::exists(program) || !QFile::exists(QStringLiteral("/run/systemd/system")))
        return {};
    const auto answer = runQuery(program, {QStringLiteral("show"), QStringLiteral("nvldm"),
                                           QStringLiteral("--property=LoadState,ActiveState")});
    if (!answer)
        return {};
    if (answer->output.contains(QLatin1String("LoadState=not-found")))
        return {serviceDoesNotExist, {}};
    static const QRegularExpression active(QStringLiteral("ActiveState=(\\S+)"));
    return {answer->exitCode, stateLine(active.match(answer->output).captured(1))};
}

#endif

} // namespace

LocalServiceState judgeQueryOutput(const QString &output) {
    static const QRegularExpression pattern(QStringLiteral("STATE\\s*:\\s*(\\d+)"));
    QString number;
    for (const QString &line : output.split(QLatin1Char('\n'), Qt::SkipEmptyParts)) {
        if (const QRegularExpressionMatch match = pattern.match(line); match.hasMatch())
            number = match.captured(1);
    }
    if (number == QLatin1String("4")) {
        qDebug("Norvell Device Manager Service is running!");
        return LocalServiceState::Running;
    }
    if (number == QLatin1String("1")) {
        qDebug("Norvell Device Manager Service is stopped!");
        return LocalServiceState::Stopped;
    }
    if (number == QLatin1String("2")) {
        qDebug("Norvell Device Manager Service is starting!");
        return LocalServiceState::Starting;
    }
    if (number == QLatin1String("3")) {
        qDebug("Norvell Device Manager Service is stopping!");
        return LocalServiceState::Stopping;
    }
    qDebug("Norvell device manager service status unknown!%s", qUtf8Printable(output));
    return LocalServiceState::Unknown;
}

LocalServiceState queryLocalService() {
    const QueryAnswer answer = AppPaths::root().isEmpty() ? answerOfSystem() : answerOfStateFile();
    if (answer.exitCode == serviceDoesNotExist) {
        qDebug("Norvell Device Manager Service is not installed!");
        return LocalServiceState::NotInstalled;
    }
    return judgeQueryOutput(answer.output);
}

} // namespace ServiceControl
