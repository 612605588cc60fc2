#pragma once

#include <QElapsedTimer>
#include <QPointer>
#include <QTimer>
#include <QWidget>

#include <deque>
#include <memory>

class QFrame;
class QLabel;
class QProgressBar;
class QToolButton;
class TaskQueue;
class Transfer;

/// Shows how far the files of a queue are on their way to the service, and cancels them. Takes no room while
/// nothing is sent; looks at the queue only while it can be seen.
class TransferBanner : public QWidget {
    Q_OBJECT

public:
    explicit TransferBanner(TaskQueue *queue, QWidget *parent = nullptr);
    ~TransferBanner() override;

protected:
    void showEvent(QShowEvent *event) override;
    void hideEvent(QHideEvent *event) override;

private:
    struct Sample {
        qint64 time; ///< in ms
        std::uint64_t bytes;
    };

    void buildFrame();
    void onTick();
    void beginTransfer(const QString &name, std::shared_ptr<Transfer> transfer);
    void showProgress(std::uint64_t done, std::uint64_t total);
    std::uint64_t rate(std::uint64_t done);
    void cancel();

    QPointer<TaskQueue> m_queue;
    std::shared_ptr<Transfer> m_transfer;
    QString m_fileName;
    std::deque<Sample> m_samples; ///< of the last seconds
    QElapsedTimer m_clock;
    QTimer m_timer;
    QFrame *m_frame;
    QLabel *m_name;
    QLabel *m_progressText;
    QProgressBar *m_bar;
    QToolButton *m_cancel;
};
