#include "tasks/panels/transferbanner.h"

#include "api/transport/transfer.h"
#include "tasks/queue/taskqueue.h"
#include "widgets/style/plaintext.h"

#include <QFrame>
#include <QGridLayout>
#include <QLabel>
#include <QLocale>
#include <QProgressBar>
#include <QToolButton>
#include <QVBoxLayout>

namespace {

constexpr int tickMs = 250;
/// The rate is that of the last seconds: quick enough to tell of a stop, slow enough to be read.
constexpr qint64 rateSpanMs = 3000;
constexpr int barSteps = 1000;

QString sizeText(std::uint64_t bytes) {
    return QLocale().formattedDataSize(static_cast<qint64>(bytes), 1);
}

} // namespace

TransferBanner::TransferBanner(TaskQueue *queue, QWidget *parent)
    : QWidget(parent),
      m_queue(queue),
      m_frame(new QFrame(this)),
      m_name(new QLabel(m_frame)),
      m_progressText(new QLabel(m_frame)),
      m_bar(new QProgressBar(m_frame)),
      m_cancel(new QToolButton(m_frame)) {
    buildFrame();
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_frame);
    m_timer.setInterval(tickMs);
    connect(&m_timer, &QTimer::timeout, this, &TransferBanner::onTick);
    connect(m_cancel, &QToolButton::clicked, this, &TransferBanner::cancel);
}

TransferBanner::~TransferBanner() = default;

void TransferBanner::buildFrame() {
    m_frame->setObjectName(QStringLiteral("transferStrip"));
    m_frame->hide();
    m_name->setObjectName(QStringLiteral("transferNameLabel"));
    m_name->setTextFormat(Qt::PlainText);
    // A long name must not widen the panel.
    m_name->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
    m_progressText->setObjectName(QStringLiteral("transferProgressLabel"));
    m_progressText->setTextFormat(Qt::PlainText);
    m_progressText->setProperty("role", QStringLiteral("quiet"));
    m_bar->setObjectName(QStringLiteral("transferBar"));
    m_bar->setAccessibleName(tr("Upload progress"));
    m_bar->setTextVisible(false);
    m_bar->setRange(0, barSteps);
    m_cancel->setObjectName(QStringLiteral("cancelTransferButton"));
    m_cancel->setProperty("role", QStringLiteral("panel"));
    m_cancel->setFocusPolicy(Qt::TabFocus);
    auto *layout = new QGridLayout(m_frame);
    layout->setContentsMargins(12, 8, 12, 10);
    layout->setHorizontalSpacing(8);
    layout->setVerticalSpacing(4);
    layout->addWidget(m_name, 0, 0);
    layout->addWidget(m_progressText, 1, 0);
    layout->addWidget(m_cancel, 0, 1, 2, 1, Qt::AlignVCenter);
    layout->addWidget(m_bar, 2, 0, 1, 2);
    layout->setColumnStretch(0, 1);
}

void TransferBanner::showEvent(QShowEvent *event) {
    QWidget::showEvent(event);
    onTick();
    m_timer.start();
}

void TransferBanner::hideEvent(QHideEvent *event) {
    QWidget::hideEvent(event);
    m_timer.stop();
}

void TransferBanner::onTick() {
    const TaskQueue::Sending sending = m_queue ? m_queue->sending() : TaskQueue::Sending();
    if (sending.transfer != m_transfer)
        beginTransfer(sending.name, sending.transfer);
    // A record at work need not send anything.
    const std::uint64_t total = m_transfer ? m_transfer->bytesTotal() : 0;
    m_frame->setVisible(total > 0);
    if (total > 0)
        showProgress(m_transfer->bytesDone(), total);
}

void TransferBanner::beginTransfer(const QString &name, std::shared_ptr<Transfer> transfer) {
    m_transfer = std::move(transfer);
    m_samples.clear();
    m_clock.start();
    m_fileName = name;
    m_name->setToolTip(PlainText::toolTip(name));
    m_cancel->setText(tr("Cancel"));
    m_cancel->setEnabled(true);
}

void TransferBanner::showProgress(std::uint64_t done, std::uint64_t total) {
    m_name->setText(m_name->fontMetrics().elidedText(m_fileName, Qt::ElideMiddle, m_name->width()));
    m_bar->setValue(static_cast<int>(barSteps * static_cast<double>(done) / static_cast<double>(total)));
    if (done < total)
        m_progressText->setText(
            tr("%1 of %2, %3 per second").arg(sizeText(done), sizeText(total), sizeText(rate(done))));
    else
        m_progressText->setText(tr("%1 sent, waiting for the server.").arg(sizeText(total)));
}

std::uint64_t TransferBanner::rate(std::uint64_t done) {
    const qint64 now = m_clock.elapsed();
    m_samples.push_back({now, done});
    while (m_samples.front().time < now - rateSpanMs)
        m_samples.pop_front();
    const Sample &first = m_samples.front();
    if (now == first.time || done < first.bytes)
        return 0;
    return (done - first.bytes) * 1000 / static_cast<std::uint64_t>(now - first.time);
}

void TransferBanner::cancel() {
    if (!m_transfer)
        return;
    m_transfer->cancel();
    m_cancel->setText(tr("Cancelling..."));
    m_cancel->setEnabled(false);
}
