#pragma once

#include <QProcess>
#include <QStringList>

/// The service emulator as a process on a folder; may be started again on the same folder.
class EmulatorProcess {
public:
    explicit EmulatorProcess(const QString &root);
    ~EmulatorProcess();

    /// Starts it with the arguments and waits until it listens. Unless the arguments say otherwise its fleet
    /// is small and holds still.
    bool start(const QStringList &arguments = {});
    quint32 port() const { return m_port; }

    /// Sends a control command and gives its answer line ("ok …" or "error …"); empty when there is none in
    /// time.
    QString command(const QString &line);

    /// Ends it politely. False when it did not end well in time.
    bool stop();
    void kill();

private:
    QString m_root;
    QProcess m_process;
    quint32 m_port = 0;
};
