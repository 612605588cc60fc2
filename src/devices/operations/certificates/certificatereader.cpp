#include "devices/operations/certificates/certificatereader.h"

#include "api/session/netjob.h"

#include <QElapsedTimer>

namespace {

/// What is read is shown about as often.
constexpr qint64 sliceMs = 300;

/// Reads as many of the files as a slice of time allows, at least one.
CertificateReader::Files readFiles(const QStringList &paths, const QString &passPhrase) {
    QElapsedTimer timer;
    timer.start();
    CertificateReader::Files files;
    for (const QString &path : paths) {
        files.push_back(std::make_shared<CertificateFile>(CertificateFiles::read(path, passPhrase)));
        if (timer.elapsed() >= sliceMs)
            break;
    }
    return files;
}

} // namespace

void CertificateReader::read(const QStringList &paths, const QString &passPhrase, Take take) {
    if (paths.isEmpty())
        return;
    m_orders.push_back({paths, passPhrase, std::move(take)});
    m_left += static_cast<int>(paths.size());
    emit progressed();
    if (!m_running)
        readSome();
}

void CertificateReader::readSome() {
    if (m_orders.empty())
        return;
    m_running = true;
    const auto ended = [this](JobOutcome end) {
        m_running = false;
        // Files that cannot be read now would not be read the next time either.
        if (end != JobOutcome::Delivered)
            drop(m_orders.front().paths.size());
        readSome();
        emit progressed();
    };
    const Order &order = m_orders.front();
    auto *runner = NetJob::createRunner("reading certificate files", NetTask::Turn::Beside);
    const bool started = NetJob::post(
        runner, this,
        [paths = order.paths, passPhrase = order.passPhrase] { return readFiles(paths, passPhrase); },
        [this](const Files &files) { onRead(files); }, ended);
    if (!started)
        ended(JobOutcome::NotRun);
}

void CertificateReader::onRead(const Files &files) {
    const Take take = m_orders.front().take;
    drop(static_cast<qsizetype>(files.size()));
    take(files);
}

/// Takes files off the first order, and the order with its last one.
void CertificateReader::drop(qsizetype count) {
    m_left -= static_cast<int>(count);
    m_orders.front().paths.remove(0, count);
    if (m_orders.front().paths.isEmpty())
        m_orders.pop_front();
}
