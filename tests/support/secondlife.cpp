#include "secondlife.h"

#include <QCoreApplication>
#include <QDeadlineTimer>

#include <cstdio>
#include <cstring>

namespace SecondLife {

namespace {
constexpr const char *mark = "--second-life";
constexpr int patienceMs = 20000;
} // namespace

bool isSecondLife(int argc, char *argv[]) {
    return argc > 1 && std::strcmp(argv[1], mark) == 0;
}

QStringList arguments(int argc, char *argv[]) {
    QStringList texts;
    for (int i = 2; i < argc; ++i)
        texts.append(QString::fromLocal8Bit(argv[i]));
    return texts;
}

void reportAndWait(const char *line) {
    std::puts(line);
    std::fflush(stdout);
    std::getchar();
}

void start(QProcess &process, const QStringList &arguments) {
    process.start(QCoreApplication::applicationFilePath(),
                  QStringList{QString::fromLatin1(mark)} + arguments);
}

bool waitForLine(QProcess &process, const QByteArray &line) {
    const QDeadlineTimer deadline(patienceMs);
    while (!deadline.hasExpired()) {
        while (process.canReadLine()) {
            if (process.readLine().trimmed() == line)
                return true;
        }
        if (!process.waitForReadyRead(static_cast<int>(deadline.remainingTime())))
            return false;
    }
    return false;
}

Outcome run(const QStringList &arguments, const QProcessEnvironment &environment) {
    QProcess process;
    if (!environment.isEmpty())
        process.setProcessEnvironment(environment);
    start(process, arguments);
    process.closeWriteChannel();
    const bool ended = process.waitForFinished(patienceMs);
    Outcome outcome;
    outcome.exited = ended && process.exitStatus() == QProcess::NormalExit;
    outcome.status = process.exitCode();
    // Lines end as the system has them.
    outcome.output = process.readAllStandardOutput().replace("\r\n", "\n");
    return outcome;
}

} // namespace SecondLife
