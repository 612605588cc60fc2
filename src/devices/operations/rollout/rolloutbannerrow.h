#pragma once

#include <QPointer>
#include <QWidget>

class QLabel;
class QToolButton;
class Rollout;

/// One rollout: the image, where it stands, and the buttons "Continue", "Stop" and "Dismiss", those that make
/// sense at the moment.
class RolloutBannerRow : public QWidget {
    Q_OBJECT

public:
    explicit RolloutBannerRow(Rollout *rollout, QWidget *parent = nullptr);

    const Rollout *rollout() const;
    /// Shows where it stands by now.
    void showStanding();

private:
    QToolButton *addButton(const char *name, const QString &text);

    QPointer<Rollout> m_rollout;
    QLabel *m_icon;
    QLabel *m_name;
    QLabel *m_standing;
    QToolButton *m_goOn;
    QToolButton *m_stop;
    QToolButton *m_dismiss;
};
