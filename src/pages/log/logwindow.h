#pragma once

#include "api/session/nettask.h"
#include "pages/log/loghistogram.h"

#include <QWidget>

#include <functional>

class LogChart;
class LogPager;
class LogSidebar;
class LogTable;
class QLabel;
class QLineEdit;
class QPlainTextEdit;
class QPushButton;
class QStackedWidget;
class QToolButton;
class ServiceSession;
class WaitingSpinner;

/// The log page: asks the service for the entries of a time frame and shows those that pass the filters.
class LogWindow : public QWidget {
    Q_OBJECT

public:
    explicit LogWindow(QWidget *parent = nullptr);
    ~LogWindow() override;

    /// Forgets the result and the filters, as at the end of a session.
    void reset();

    /// Shows the entries of a time frame as if they were just read.
    void showResult(const TimeRange &frame, const LogListPtr &list);

    /// Lets tests stand in for the file dialog.
    using AskSavePath = std::function<void(const std::function<void(const QString &path)> &chosen)>;
    void setAskSavePath(AskSavePath ask) { m_askSavePath = std::move(ask); }

public slots:
    /// Asks for the log of the time frame, unless a search runs already.
    void on_searchButton_clicked();
    void on_exportButton_clicked();
    /// limit: "25", "50" or "100" results on a page.
    void updateLimit(const QString &limit);
    /// Shows what passes the filters.
    void updateUI();

signals:
    void logsUpdated();
    /// An export has begun; the text tells it to the user.
    void export_button_clicked(const QString &message);
    /// It has ended, well or not.
    void export_file_generated(const QString &message, bool success);

protected:
    void showEvent(QShowEvent *event) override;

private:
    struct Answer {
        unsigned result = 0;
        LogListPtr list;
    };
    enum class Content { None, Read, Failed };

    static Answer browse(ServiceSession &session, const TimeRange &frame);

    QWidget *buildContent();
    QWidget *buildHead();
    QWidget *buildTableArea();
    void buildStates();
    void connectParts();
    void search(const TimeRange &frame);
    void onAnswer(const TimeRange &frame, const Answer &answer);
    void fail(const QString &reason);
    void onFilterChanged();
    void clearFilters();
    void onSpanChosen(const TimeRange &span);
    void clearRange();
    void sortEntries();
    int currentRow() const;
    void showPage();
    void showEntry();
    void showCount();
    void showState();
    void exportTo(const QString &path);

    NetTask::Owner m_runner;
    AskSavePath m_askSavePath;
    LogListPtr m_list;
    TimeRange m_frame; ///< that the result is of
    std::optional<TimeRange> m_span;
    std::vector<char> m_matches; ///< which entries pass the filters, the span apart
    std::vector<int> m_places;   ///< what is shown, in its order
    LogHistogram m_bins;
    Content m_content = Content::None;
    bool m_searching = false;
    bool m_exporting = false;
    bool m_clearing = false; ///< the filters, which is one change

    LogSidebar *m_sidebar;
    QLabel *m_count = nullptr;
    WaitingSpinner *m_spinner = nullptr;
    QToolButton *m_wholeFrame = nullptr;
    QLineEdit *m_search = nullptr;
    QPushButton *m_export = nullptr;
    LogChart *m_chart = nullptr;
    QStackedWidget *m_states = nullptr;
    QWidget *m_tableArea = nullptr;
    LogTable *m_table = nullptr;
    QPlainTextEdit *m_detail = nullptr;
    QWidget *m_loadingPage = nullptr;
    QWidget *m_emptyPage = nullptr;
    QWidget *m_noMatchPage = nullptr;
    QWidget *m_failedPage = nullptr;
    QLabel *m_failure = nullptr;
    LogPager *m_pager = nullptr;
};
