#pragma once

#include "api/session/jobendtext.h"
#include "api/session/servicerequest.h"
#include "devices/inventory/devicerecord.h"

#include <QElapsedTimer>
#include <QObject>
#include <QTimer>

#include <deque>
#include <memory>
#include <vector>

/// Has the service look for devices. A search starts a scan on the service, gives it five seconds, and reads
/// once what was found. User-interface thread; the calls run on runners.
class DeviceDiscovery : public QObject {
    Q_OBJECT

public:
    enum class Method { Address, Range, Network };

    struct Search {
        Method method = Method::Network;
        QString from; ///< an address, with its port behind a colon if need be, or the first one of a range
        QString to;   ///< the last address of a range
    };

    static constexpr int scanSeconds = 5;

    explicit DeviceDiscovery(QObject *parent = nullptr);
    ~DeviceDiscovery() override;

    /// Searches of the network may overlap. The service forgets a scan when the next one starts, so a search
    /// of another kind waits for those before it.
    void start(const Search &search);
    bool isSearching() const { return !m_running.empty(); }
    /// How long the latest search has been waiting for its scan, at most scanSeconds.
    int passedSeconds() const;

    /// Posts a request on a runner of its own; one that brings no result ends in failed, with the reason as
    /// the part of a sentence that follows "could not be done: ".
    template <typename Work, typename Result = std::invoke_result_t<Work, ServiceSession &>>
    static void request(QObject *receiver, const char *purpose, Work work,
                        std::type_identity_t<std::function<void(const Result &)>> done,
                        const std::function<void(const QString &reason)> &failed) {
        const auto ended = [failed](JobOutcome end) {
            if (end != JobOutcome::Delivered)
                failed(jobEndText(end));
        };
        if (!ServiceRequest::post(NetJob::createRunner(purpose), receiver, std::move(work), std::move(done),
                                  ended))
            ended(JobOutcome::NotRun);
    }
signals:
    /// What a search has found, whether it was known before or not.
    void found(const DeviceDiscovery::Search &search, const std::vector<DeviceRecordPtr> &devices);
    void failed(const QString &reason);
    /// A search has begun or ended, or a second of one has passed.
    void progressed();

private:
    struct Running;
    using RunningPtr = std::shared_ptr<Running>;

    void begin(const Search &search);
    void startScan(const RunningPtr &running);
    void onScanStarted(const RunningPtr &running, const QString &error);
    void refreshDiscoveredDevices(const RunningPtr &running);
    void end(const RunningPtr &running);

    std::vector<RunningPtr> m_running;
    std::deque<Search> m_waiting;
    QTimer m_beat;
};
