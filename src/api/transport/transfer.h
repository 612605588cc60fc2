#pragma once

#include <QString>

#include <atomic>
#include <cstdint>
#include <functional>
#include <mutex>
#include <string>

/// Why a file did not get to the service, or not from it.
enum class TransferFailure {
    None,
    Cancelled,       ///< by cancel()
    FileUnreadable,  ///< missing, no plain file, or not readable
    FileEmpty,       ///< there is nothing to send
    FileChanged,     ///< written to, shortened or replaced while it was sent
    FileGone,        ///< vanished while it was sent
    RefusedOrLost,   ///< the connection ended without an answer: either of the two, nobody can tell which
    Stalled,         ///< no byte got through for the time that a transfer may stand still
    TooLarge,        ///< the service takes no file of this size (status 413)
    TargetNotWritten ///< a download: the target exists already, or cannot be written
};

/// A transfer of files under way, as whoever waits for it sees it. Given to a client before its call and
/// shared with it; any thread. One call at a time; a later call begins the counting anew.
class Transfer {
public:
    /// Bytes of the whole request body, or of the answer's body where a file is fetched.
    std::uint64_t bytesDone() const { return m_done; }
    /// 0 while it is not known yet.
    std::uint64_t bytesTotal() const { return m_total; }

    /// Ends the transfer, also one that waits for its service or has not begun. It cannot be taken back.
    void cancel();
    bool isCancelled() const { return m_cancelled; }

    /// Why the call failed; None after a success, and where the result of the call says all there is to say.
    TransferFailure failure() const;
    /// The name of the file at fault; empty where none is.
    std::string failedFile() const;
    /// The reason as a whole sentence; empty for None.
    QString failureText() const;

    /// The rest is for the client that carries it out.

    void begin(std::uint64_t total);
    void advance(std::uint64_t done) { m_done = done; }
    /// The first reason stays; a cancelled transfer has that one alone.
    void fail(TransferFailure failure, const std::string &file = {});

    /// For as long as it lives, cancel() calls the function to end what the transfer waits for.
    class CutOnCancel {
    public:
        CutOnCancel(Transfer &transfer, std::function<void()> cut);
        ~CutOnCancel();
        CutOnCancel(const CutOnCancel &) = delete;
        CutOnCancel &operator=(const CutOnCancel &) = delete;

    private:
        Transfer &m_transfer;
    };

private:
    std::atomic<std::uint64_t> m_done = 0;
    std::atomic<std::uint64_t> m_total = 0;
    std::atomic<bool> m_cancelled = false;
    mutable std::mutex m_mutex;
    std::function<void()> m_cut;
    TransferFailure m_failure = TransferFailure::None;
    std::string m_failedFile;
};
