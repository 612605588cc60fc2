#include "emulatorprocess.h"

#include <QDeadlineTimer>

namespace {

constexpr int patienceMs = 20000;

QString readLine(QProcess &process, const QDeadlineTimer &deadline) {
    while (!process.canReadLine()) {
        if (!process.waitForReadyRead(static_cast<int>(deadline.remainingTime())))
            return {};
    }
    return QString::fromUtf8(process.readLine()).trimmed();
}

} // namespace

EmulatorProcess::EmulatorProcess(const QString &root) : m_root(root) {}

EmulatorProcess::~EmulatorProcess() {
    kill();
}

bool EmulatorProcess::start(const QStringList &arguments) {
    QStringList all = {"--root", m_root};
    const QStringList usual = {"--devices", "20", "--sites", "5", "--life", "0"};
    for (qsizetype i = 0; i < usual.size(); i += 2) {
        if (!arguments.contains(usual[i]))
            all << usual[i] << usual[i + 1];
    }
    m_process.start(qEnvironmentVariable("NVLDM_EMULATOR"), all + arguments);
    m_process.setReadChannel(QProcess::StandardOutput);
    m_port = readLine(m_process, QDeadlineTimer(patienceMs)).section(QLatin1Char(':'), -1).toUInt();
    return m_port != 0;
}

QString EmulatorProcess::command(const QString &line) {
    m_process.setReadChannel(QProcess::StandardError);
    m_process.write(line.toUtf8() + '\n');
    const QDeadlineTimer deadline(patienceMs);
    while (m_process.state() == QProcess::Running && !deadline.hasExpired()) {
        const QString answer = readLine(m_process, deadline);
        if (answer.startsWith(QLatin1String("ok")) || answer.startsWith(QLatin1String("error")))
            return answer;
    }
    return {};
}

bool EmulatorProcess::stop() {
    m_process.terminate();
    return m_process.waitForFinished(patienceMs) && m_process.exitStatus() == QProcess::NormalExit &&
           m_process.exitCode() == 0;
}

void EmulatorProcess::kill() {
    m_process.kill();
    m_process.waitForFinished(patienceMs);
}
