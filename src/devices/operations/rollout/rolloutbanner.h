#pragma once

#include <QFrame>
#include <QTimer>

#include <vector>

class QVBoxLayout;
class RolloutBannerRow;

/// The rollouts of the session, a line each: where they stand, and what can be done about them. Takes no room
/// while there is none.
class RolloutBanner : public QFrame {
    Q_OBJECT

public:
    explicit RolloutBanner(QWidget *parent = nullptr);

private:
    void onChanged();
    void showRows();
    void showTexts();

    QVBoxLayout *m_layout;
    std::vector<RolloutBannerRow *> m_rows;
    QTimer m_timer;
};
