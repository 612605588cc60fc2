#pragma once

#include "pages/log/loglist.h"

#include <QFrame>

class QComboBox;
class QDateEdit;
class QDateTime;
class QLabel;
class QPushButton;
class QTimeEdit;
class QToolButton;
class QVBoxLayout;

/// The log page's side bar: the time frame, the filters, and the button that searches.
class LogSidebar : public QFrame {
    Q_OBJECT

public:
    explicit LogSidebar(QWidget *parent = nullptr);

    /// The time frame as it stands in the fields; may end before it starts.
    TimeRange frame() const;
    void setFrame(const TimeRange &frame);
    /// Brings a quick frame that is still chosen up to the present time.
    void renewQuickFrame();

    std::optional<LogEntry::Source> source() const;
    std::optional<LogEntry::Type> type() const;
    void clearFilters();
    /// As it was at the start.
    void reset();

    /// Tells what is wrong with the frame; an empty text takes that back.
    void showProblem(const QString &problem);
    void setSearching(bool searching);

signals:
    void searchRequested();
    void filterChanged();

protected:
    void showEvent(QShowEvent *event) override;

private:
    enum class Quick { None, LastHour, Today, SevenDays };

    void addQuickFrames(QVBoxLayout *layout);
    std::pair<QDateEdit *, QTimeEdit *> addTimes(QVBoxLayout *layout, const QString &caption,
                                                 const char *dateName, const char *timeName);
    QComboBox *addFilter(QVBoxLayout *layout, const char *name, const QString &caption);
    void chooseQuick(Quick quick);
    void showQuick(Quick quick);
    void setEnds(const QDateTime &start, const QDateTime &end);

    bool m_hasCalendars = false;
    QDateEdit *m_startDate = nullptr;
    QTimeEdit *m_startTime = nullptr;
    QDateEdit *m_endDate = nullptr;
    QTimeEdit *m_endTime = nullptr;
    QLabel *m_problem = nullptr;
    QComboBox *m_source = nullptr;
    QComboBox *m_type = nullptr;
    QPushButton *m_search = nullptr;
    std::vector<std::pair<Quick, QToolButton *>> m_quickButtons;
    Quick m_quick = Quick::None;
};
