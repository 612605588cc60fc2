#pragma once

#include <QFrame>

/// The bar above the tables that tells of site changes which the service does not know yet.
class NoticeBar : public QFrame {
    Q_OBJECT

public:
    explicit NoticeBar(QWidget *parent = nullptr);

signals:
    void msgButtonClicked();
};
