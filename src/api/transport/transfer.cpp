#include "api/transport/transfer.h"

#include <QCoreApplication>

namespace {

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(Transfer)
};

QString sentence(TransferFailure failure, const QString &file) {
    switch (failure) {
    case TransferFailure::None:
        break;
    case TransferFailure::Cancelled:
        return Texts::tr("It was cancelled.");
    case TransferFailure::FileUnreadable:
        return Texts::tr("The file “%1” cannot be read.").arg(file);
    case TransferFailure::FileEmpty:
        return Texts::tr("The file “%1” is empty.").arg(file);
    case TransferFailure::FileChanged:
        return Texts::tr("The file “%1” was changed while it was being sent.").arg(file);
    case TransferFailure::FileGone:
        return Texts::tr("The file “%1” disappeared while it was being sent.").arg(file);
    case TransferFailure::RefusedOrLost:
        return Texts::tr("The service refused it or the connection was lost.");
    case TransferFailure::Stalled:
        return Texts::tr("Nothing got through to the service for too long.");
    case TransferFailure::TooLarge:
        return Texts::tr("The service does not take files of this size.");
    case TransferFailure::TargetNotWritten:
        return Texts::tr("The file “%1” exists already or cannot be written.").arg(file);
    }
    return {};
}

} // namespace

void Transfer::cancel() {
    const std::lock_guard lock(m_mutex);
    m_cancelled = true;
    if (m_cut)
        m_cut();
}

TransferFailure Transfer::failure() const {
    const std::lock_guard lock(m_mutex);
    return m_failure;
}

std::string Transfer::failedFile() const {
    const std::lock_guard lock(m_mutex);
    return m_failedFile;
}

QString Transfer::failureText() const {
    const std::lock_guard lock(m_mutex);
    return sentence(m_failure, QString::fromStdString(m_failedFile));
}

void Transfer::begin(std::uint64_t total) {
    const std::lock_guard lock(m_mutex);
    m_done = 0;
    m_total = total;
    m_failure = TransferFailure::None;
    m_failedFile.clear();
}

void Transfer::fail(TransferFailure failure, const std::string &file) {
    const std::lock_guard lock(m_mutex);
    if (m_failure != TransferFailure::None)
        return;
    m_failure = m_cancelled ? TransferFailure::Cancelled : failure;
    if (!m_cancelled)
        m_failedFile = file;
}

Transfer::CutOnCancel::CutOnCancel(Transfer &transfer, std::function<void()> cut) : m_transfer(transfer) {
    const std::lock_guard lock(m_transfer.m_mutex);
    if (m_transfer.m_cancelled)
        cut();
    m_transfer.m_cut = std::move(cut);
}

Transfer::CutOnCancel::~CutOnCancel() {
    const std::lock_guard lock(m_transfer.m_mutex);
    m_transfer.m_cut = nullptr;
}
