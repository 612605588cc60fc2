#pragma once

#include "devices/operations/certificates/certificatefile.h"

#include <QObject>
#include <QStringList>

#include <deque>
#include <functional>
#include <vector>

/// Reads certificate files on a runner, some at a time, so that thousands of them show progress and stop with
/// the reader. User-interface thread.
class CertificateReader : public QObject {
    Q_OBJECT

public:
    using Files = std::vector<CertificateFilePtr>;
    using Take = std::function<void(const Files &)>;

    using QObject::QObject;

    /// Hands the files over as they are read, those that are of no use too. Orders are worked off in turn.
    void read(const QStringList &paths, const QString &passPhrase, Take take);

    bool isReading() const { return m_running || !m_orders.empty(); }
    /// How many files are still to be read.
    int left() const { return m_left; }

signals:
    /// Some files were read, or are to be read.
    void progressed();

private:
    struct Order {
        QStringList paths;
        QString passPhrase;
        Take take;
    };

    void readSome();
    void onRead(const Files &files);
    void drop(qsizetype count);

    std::deque<Order> m_orders;
    int m_left = 0;
    bool m_running = false;
};
