#include "certificatereader.h"

#include "netjob.h"

#include <algorithm>

namespace {

constexpr qsizetype filesAtOnce = 200;

CertificateReader::Files readFiles(const QStringList &paths, const QString &passPhrase) {
    CertificateReader::Files files;
    for (const QString &path : paths)
        files.push_back(std::make_shared<CertificateFile>(CertificateFiles::read(path, passPhrase)));
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
    Order &order = m_orders.front();
    const QStringList paths = order.paths.first(std::min(filesAtOnce, order.paths.size()));
    order.paths.remove(0, paths.size());
    m_running = true;
    const auto ended = [this, count = static_cast<int>(paths.size())](JobEnd) {
        m_running = false;
        m_left -= count;
        readSome();
        emit progressed();
    };
    const bool started = NetJob::post(
        NetJob::createRunner("reading certificate files", NetTask::Turn::Beside), this,
        [paths, passPhrase = order.passPhrase] { return readFiles(paths, passPhrase); }, order.take, ended);
    // The last piece of an order is on its way with all that it needs.
    if (order.paths.isEmpty())
        m_orders.pop_front();
    if (!started)
        ended(JobEnd::NotRun);
}
