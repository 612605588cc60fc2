#pragma once

#include <QWidget>

/// What this client's own queues have to tell, above the service's list: operations that did not begin, and
/// the upload that is on its way.
class QueueBanners : public QWidget {
    Q_OBJECT

public:
    explicit QueueBanners(QWidget *parent = nullptr);
};
