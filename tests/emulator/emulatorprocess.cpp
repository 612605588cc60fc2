#include "emulatorprocess.h"

#include <QDeadlineTimer>

namespace {

constexpr int patienceMs = 15000;

QString program() {
    return qEnvironmentVariable("NVLDM_EMULATOR");
}

QString readLine(QProcess &process, const QDeadlineTimer &deadline) {
    while (!process.canReadLine() && !deadline.hasExpired())
        if (!process.waitForReadyRead(static_cast<int>(deadline.remainingTime())))
            return {};
    return QString::fromUtf8(process.readLine()).trimmed();
}

} // namespace

EmulatorProcess::EmulatorProcess() = default;

EmulatorProcess::~EmulatorProcess() {
    kill();
}

bool EmulatorProcess::start(const QStringList &arguments) {
    QStringList all = {"--root", root()};
    const QStringList small = {"--devices", "20", "--sites", "12", "--seed", "7", "--life", "0"};
    for (int i = 0; i < small.size(); i += 2)
        if (!arguments.contains(small[i]))
            all << small[i] << small[i + 1];
    m_process.start(program(), all + arguments);
    m_process.setReadChannel(QProcess::StandardOutput);
    m_readyLine = readLine(m_process, QDeadlineTimer(patienceMs));
    m_port = m_readyLine.section(':', -1).toInt();
    return m_port > 0;
}

QString EmulatorProcess::command(const QString &line) {
    m_process.setReadChannel(QProcess::StandardError);
    m_process.write(line.toUtf8() + '\n');
    const QDeadlineTimer deadline(patienceMs);
    while (!deadline.hasExpired() && isRunning()) {
        const QString response = readLine(m_process, deadline);
        if (response.startsWith("ok") || response.startsWith("error"))
            return response;
        m_diagnostics += response + '\n';
    }
    return {};
}

QString EmulatorProcess::describe() {
    m_process.waitForReadyRead(0);
    m_diagnostics += QString::fromUtf8(m_process.readAllStandardError());
    const QString state = isRunning() ? QString("runs") : QString("ended with %1").arg(m_process.exitCode());
    const bool crashed = !isRunning() && m_process.exitStatus() == QProcess::CrashExit;
    return QString("emulator on port %1 %2%3; it says: %4")
        .arg(m_port)
        .arg(state, crashed ? " by a signal" : "", m_diagnostics);
}

int EmulatorProcess::stop() {
    m_process.terminate();
    if (!m_process.waitForFinished(patienceMs))
        return -1;
    m_diagnostics += QString::fromUtf8(m_process.readAllStandardError());
    return m_process.exitStatus() == QProcess::NormalExit ? m_process.exitCode() : -1;
}

void EmulatorProcess::kill() {
    if (m_process.state() != QProcess::NotRunning) {
        m_process.kill();
        m_process.waitForFinished(patienceMs);
    }
}

EmulatorProcess::Outcome EmulatorProcess::run(const QStringList &arguments) {
    QProcess process;
    process.start(program(), arguments);
    Outcome outcome;
    if (process.waitForFinished(patienceMs) && process.exitStatus() == QProcess::NormalExit)
        outcome.status = process.exitCode();
    outcome.output = QString::fromUtf8(process.readAllStandardOutput());
    outcome.errors = QString::fromUtf8(process.readAllStandardError());
    return outcome;
}
