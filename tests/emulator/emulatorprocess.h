#pragma once

#include <QProcess>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

/// One run of the emulator, or several one after the other on the same folder.
class EmulatorProcess {
public:
    EmulatorProcess();
    ~EmulatorProcess();

    QString root() const { return m_root.path() + "/service"; }

    /// Starts it with a small fleet that holds still, unless the arguments say otherwise; true when it
    /// listens.
    bool start(const QStringList &arguments = {});
    int port() const { return m_port; }
    qint64 processId() const { return m_process.processId(); }
    QString readyLine() const { return m_readyLine; }
    /// What it has written to standard error that is not a response to a command.
    QString diagnostics() const { return m_diagnostics; }

    /// Sends a command and returns its response; empty when there is none in time.
    QString command(const QString &line);
    void closeInput() { m_process.closeWriteChannel(); }
    /// How it stands with the process, for the report of a failure.
    QString describe();
    bool isRunning() const { return m_process.state() == QProcess::Running; }

    /// Ends it politely and gives its exit status, -1 when it does not end in time.
    int stop();
    void kill();
    bool waitForEnd() {
        return m_process.state() == QProcess::NotRunning || m_process.waitForFinished(10000);
    }

    struct Outcome {
        int status = -1;
        QString output;
        QString errors;
    };
    /// Runs the program to its end.
    static Outcome run(const QStringList &arguments);

private:
    QTemporaryDir m_root;
    QProcess m_process;
    QString m_readyLine;
    QString m_diagnostics;
    int m_port = 0;
};
