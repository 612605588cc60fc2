#include "pages/log/logwindow.h"

#include "api/session/jobendtext.h"
#include "api/session/servicerequest.h"
#include "pages/log/logchart.h"
#include "pages/log/logexport.h"
#include "pages/log/logpager.h"
#include "pages/log/logsidebar.h"
#include "pages/log/logtable.h"
#include "store/lastfolder.h"
#include "widgets/controls/statepage.h"
#include "widgets/controls/waitingspinner.h"
#include "widgets/dialogs/filedialogs.h"
#include "widgets/style/icons.h"

#include <QCoreApplication>
#include <QDebug>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QPointer>
#include <QPushButton>
#include <QScopedValueRollback>
#include <QShortcut>
#include <QSignalBlocker>
#include <QSplitter>
#include <QStackedWidget>
#include <QThreadPool>
#include <QToolButton>
#include <QVBoxLayout>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <new>

namespace {

constexpr int searchWidth = 220;
constexpr int detailHeight = 76;
/// Laying a text out takes longer the longer it is; a description beyond this is for the exported file.
constexpr qsizetype maxDetailLength = 20000;

LogListPtr noEntries() {
    static const auto list = std::make_shared<const LogList>();
    return list;
}

} // namespace

LogWindow::LogWindow(QWidget *parent)
    : QWidget(parent),
      // A long log takes its time, which no other request should wait for.
      m_runner(new (std::nothrow) NetTask(NetTask::Turn::Beside)),
      m_list(noEntries()),
      m_sidebar(new LogSidebar(this)) {
    qDebug("LogWindow constructor");
    setObjectName(QStringLiteral("LogWindow"));
    m_askSavePath = [this](const std::function<void(const QString &)> &chosen) {
        const QString suggestion = LastFolder::file(tr("Log") + QStringLiteral(".csv"));
        FileDialogs::askSavePath(this, tr("Save as"), suggestion, tr("CSV files (*.csv)"),
                                 QStringLiteral("csv"), chosen);
    };
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(m_sidebar);
    layout->addWidget(buildContent(), 1);
    connectParts();
    showCount();
    showState();
}

LogWindow::~LogWindow() {
    qDebug("LogWindow destructor");
}

QWidget *LogWindow::buildContent() {
    auto *content = new QWidget(this);
    content->setObjectName(QStringLiteral("logContent"));
    auto *layout = new QVBoxLayout(content);
    layout->setContentsMargins(14, 12, 14, 0);
    layout->setSpacing(8);
    layout->addWidget(buildHead());
    m_chart = new LogChart(content);
    layout->addWidget(m_chart);
    m_states = new QStackedWidget(content);
    m_tableArea = buildTableArea();
    m_states->addWidget(m_tableArea);
    buildStates();
    layout->addWidget(m_states, 1);
    m_pager = new LogPager(content);
    layout->addWidget(m_pager);
    return content;
}

QWidget *LogWindow::buildHead() {
    auto *head = new QWidget;
    auto *layout = new QHBoxLayout(head);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(10);
    m_count = new QLabel(head);
    m_count->setObjectName(QStringLiteral("countLabel"));
    m_count->setProperty("role", QStringLiteral("heading"));
    m_spinner = new WaitingSpinner(head, QStringLiteral(":/images/progress_indicator_md.svg"));
    m_spinner->hide();
    m_wholeFrame = new QToolButton(head);
    m_wholeFrame->setObjectName(QStringLiteral("wholeFrameButton"));
    m_wholeFrame->setText(tr("Show the whole time frame"));
    m_wholeFrame->setProperty("role", QStringLiteral("panel"));
    m_wholeFrame->setFocusPolicy(Qt::StrongFocus);
    m_wholeFrame->hide();
    m_search = new QLineEdit(head);
    m_search->setObjectName(QStringLiteral("logSearchEdit"));
    m_search->setAccessibleName(tr("Search in the result"));
    m_search->setPlaceholderText(tr("Search in the result"));
    m_search->setClearButtonEnabled(true);
    m_search->setMaximumWidth(searchWidth);
    m_export = new QPushButton(tr("Export"), head);
    m_export->setObjectName(QStringLiteral("exportButton"));
    m_export->setIcon(Icons::icon(QStringLiteral(":/images/icon_general_export_solid.svg"), {16, 16}));
    m_export->setAutoDefault(false);
    layout->addWidget(m_count);
    layout->addWidget(m_spinner);
    layout->addWidget(m_wholeFrame);
    layout->addStretch();
    layout->addWidget(m_search, 1);
    layout->addWidget(m_export);
    return head;
}

QWidget *LogWindow::buildTableArea() {
    auto *splitter = new QSplitter(Qt::Vertical);
    splitter->setChildrenCollapsible(false);
    splitter->setHandleWidth(1);
    m_table = new LogTable(splitter);
    m_table->setObjectName(QStringLiteral("logTable"));
    m_table->setAccessibleName(tr("Log entries"));
    m_detail = new QPlainTextEdit(splitter);
    m_detail->setObjectName(QStringLiteral("logDetail"));
    m_detail->setAccessibleName(tr("Description of the selected entry"));
    m_detail->setPlaceholderText(tr("Select an entry to read its whole description."));
    m_detail->setReadOnly(true);
    m_detail->setTabChangesFocus(true);
    m_detail->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    splitter->setStretchFactor(0, 1);
    splitter->setSizes({1000, detailHeight});
    return splitter;
}

void LogWindow::buildStates() {
    auto *clear = new QPushButton(tr("Clear filters"));
    clear->setObjectName(QStringLiteral("clearFiltersButton"));
    connect(clear, &QPushButton::clicked, this, &LogWindow::clearFilters);
    auto *retry = new QPushButton(tr("Retry"));
    retry->setObjectName(QStringLiteral("retryButton"));
    connect(retry, &QPushButton::clicked, this, &LogWindow::on_searchButton_clicked);
    m_failure = StatePage::text({}, "quiet");
    m_failure->setObjectName(QStringLiteral("failureLabel"));
    m_loadingPage = StatePage::make("loadingPage",
                                    {new WaitingSpinner, StatePage::text(tr("Loading the log..."), "quiet")});
    m_emptyPage = StatePage::make("emptyPage",
                                  {StatePage::text(tr("No log entry"), "heading"),
                                   StatePage::text(tr("The log has nothing of this time frame."), "quiet")});
    m_noMatchPage =
        StatePage::make("noMatchPage", {StatePage::picture(QStringLiteral(":/images/empty_search.svg")),
                                        StatePage::text(tr("No log entry matches"), "heading"), clear});
    m_failedPage = StatePage::make(
        "failedPage", {StatePage::text(tr("The log could not be read"), "heading"), m_failure, retry});
    for (QWidget *page : {m_loadingPage, m_emptyPage, m_noMatchPage, m_failedPage})
        m_states->addWidget(page);
}

void LogWindow::connectParts() {
    connect(m_sidebar, &LogSidebar::searchRequested, this, &LogWindow::on_searchButton_clicked);
    connect(m_sidebar, &LogSidebar::filterChanged, this, &LogWindow::onFilterChanged);
    connect(m_search, &QLineEdit::textChanged, this, &LogWindow::onFilterChanged);
    connect(m_export, &QPushButton::clicked, this, &LogWindow::on_exportButton_clicked);
    connect(m_wholeFrame, &QToolButton::clicked, this, &LogWindow::clearRange);
    connect(m_chart, &LogChart::spanChosen, this, &LogWindow::onSpanChosen);
    connect(m_chart, &LogChart::spanGivenUp, this, &LogWindow::clearRange);
    connect(m_table->horizontalHeader(), &QHeaderView::sortIndicatorChanged, this, &LogWindow::sortEntries);
    connect(m_table, &LogTable::currentEntryChanged, this, &LogWindow::showEntry);
    connect(m_pager, &LogPager::limitChosen, this, &LogWindow::updateLimit);
    connect(m_pager, &LogPager::pageChanged, this, &LogWindow::showPage);
    connect(this, &LogWindow::logsUpdated, this, &LogWindow::updateUI);
    const auto addShortcut = [this](const QKeySequence &keys, auto slot) {
        auto *shortcut = new QShortcut(keys, this);
        shortcut->setContext(Qt::WidgetWithChildrenShortcut);
        connect(shortcut, &QShortcut::activated, this, slot);
    };
    addShortcut(QKeySequence::Find, [this] {
        m_search->setFocus();
        m_search->selectAll();
    });
    addShortcut(Qt::Key_F5, [this] { on_searchButton_clicked(); });
}

void LogWindow::showEvent(QShowEvent *event) {
    QWidget::showEvent(event);
    if (m_content != Content::Read && CLocalStore::instance().loginInfo().isComplete())
        on_searchButton_clicked();
}

void LogWindow::reset() {
    m_list = noEntries();
    m_frame = {};
    m_span.reset();
    m_content = Content::None;
    m_bins = {};
    {
        const QSignalBlocker blocker(m_sidebar);
        const QScopedValueRollback clearing(m_clearing, true);
        m_sidebar->reset();
        m_search->clear();
    }
    updateUI();
}

void LogWindow::on_searchButton_clicked() {
    m_sidebar->renewQuickFrame();
    const TimeRange frame = m_sidebar->frame();
    if (frame.to < frame.from)
        return m_sidebar->showProblem(tr("The time frame ends before it starts."));
    search(frame);
}

void LogWindow::search(const TimeRange &frame) {
    if (m_searching)
        return;
    m_searching = ServiceRequest::post(
        m_runner.get(), this, [frame](ServiceSession &session) { return browse(session, frame); },
        [this, frame](const Answer &answer) { onAnswer(frame, answer); },
        [this](JobOutcome end) {
            m_searching = false;
            if (end == JobOutcome::NotRun || end == JobOutcome::Failed)
                fail(jobEndText(end));
            showCount();
            showState();
            // Another session may have begun while the answer for the last one was awaited.
            if (end == JobOutcome::SessionGone && isVisible() &&
                CLocalStore::instance().loginInfo().isComplete())
                on_searchButton_clicked();
        });
    if (!m_searching)
        fail(jobEndText(JobOutcome::NotRun));
    showCount();
    showState();
}

LogWindow::Answer LogWindow::browse(ServiceSession &session, const TimeRange &frame) {
    const std::string from = std::to_string(frame.from);
    const std::string to = std::to_string(frame.to);
    JSON table;
    Answer answer;
    answer.result =
        session.call([&](CApiClient &client) { return client.browseLogs(from.c_str(), to.c_str(), table); });
    try {
        if (answer.result == ApiOk)
            answer.list = LogList::parse(table);
        else
            qWarning("Handling task status removing occurs error: %s",
                     qUtf8Printable(apiResultText(answer.result)));
    } catch (const std::exception &error) {
        qWarning("Handling task status removing occurs error: %s", error.what());
        answer.result = ApiException;
    }
    return answer;
}

void LogWindow::onAnswer(const TimeRange &frame, const Answer &answer) {
    if (answer.result != ApiOk)
        return fail(apiResultText(answer.result));
    showResult(frame, answer.list);
}

void LogWindow::showResult(const TimeRange &frame, const LogListPtr &list) {
    LogListPtr last = std::exchange(m_list, list);
    m_frame = frame;
    m_span.reset();
    m_content = Content::Read;
    m_bins = LogHistogram(frame, *m_list);
    emit logsUpdated();
    // Freeing a long list takes longer than a frame.
    QThreadPool::globalInstance()->start([last = std::move(last)] {});
}

/// The entries of another frame would only look like an answer.
void LogWindow::fail(const QString &reason) {
    m_content = Content::Failed;
    m_failure->setText(reason);
    m_list = noEntries();
    m_span.reset();
    m_bins = {};
    updateUI();
}

void LogWindow::updateUI() {
    m_matches = LogFilter{m_sidebar->source(), m_sidebar->type(), m_search->text()}.matches(*m_list);
    m_bins.count(*m_list, m_list->order(LogColumn::Time, Qt::AscendingOrder, m_matches));
    m_chart->setBins(m_bins);
    m_chart->setSpan(m_span);
    m_wholeFrame->setVisible(m_span.has_value());
    sortEntries();
}

void LogWindow::onFilterChanged() {
    if (!m_clearing)
        updateUI();
}

void LogWindow::clearFilters() {
    {
        const QScopedValueRollback clearing(m_clearing, true);
        m_sidebar->clearFilters();
        m_search->clear();
    }
    clearRange();
    m_table->setFocus();
}

void LogWindow::onSpanChosen(const TimeRange &span) {
    // The outer bars may reach beyond the frame, whose ends need not lie on full hours.
    m_span = TimeRange{std::max(span.from, m_frame.from), std::min(span.to, m_frame.to)};
    m_sidebar->setFrame(*m_span);
    updateUI();
}

void LogWindow::clearRange() {
    if (std::exchange(m_span, std::nullopt))
        m_sidebar->setFrame(m_frame);
    updateUI();
}

void LogWindow::sortEntries() {
    const QHeaderView *header = m_table->horizontalHeader();
    m_places = m_list->order(static_cast<LogColumn>(header->sortIndicatorSection()),
                             header->sortIndicatorOrder(), m_matches, m_span);
    m_pager->setRowCount(static_cast<int>(m_places.size()));
    if (const int row = currentRow(); row >= 0)
        m_pager->showRow(row);
    showPage();
    showCount();
    showState();
}

void LogWindow::updateLimit(const QString &limit) {
    const int row = currentRow();
    m_pager->updateLimit(limit, row >= 0 ? row : m_pager->firstRow());
}

/// Where the entry that is being read stands in the whole result, or -1.
int LogWindow::currentRow() const {
    if (m_table->list() != m_list || m_table->currentPlace() < 0)
        return -1;
    const auto found = std::find(m_places.begin(), m_places.end(), m_table->currentPlace());
    return found == m_places.end() ? -1 : static_cast<int>(found - m_places.begin());
}

void LogWindow::showPage() {
    const auto first = static_cast<std::size_t>(m_pager->firstRow());
    const std::size_t last = std::min(first + static_cast<std::size_t>(m_pager->pageSize()), m_places.size());
    using Distance = std::vector<int>::difference_type;
    m_table->showEntries(m_list, {m_places.begin() + static_cast<Distance>(first),
                                  m_places.begin() + static_cast<Distance>(last)});
}

void LogWindow::showEntry() {
    const LogEntry *entry = m_table->currentEntry();
    QString text = entry ? entry->description : QString();
    if (text.size() > maxDetailLength)
        text = text.left(maxDetailLength) + QChar(0x2026);
    m_detail->setPlainText(text);
}

void LogWindow::showCount() {
    const auto count = m_places.size();
    if (m_searching)
        m_count->setText(tr("Searching..."));
    else if (m_content == Content::Read)
        m_count->setText((count == 1 ? tr("%1 Log Found") : tr("%1 Logs Found")).arg(count));
    else
        m_count->clear();
    m_spinner->setVisible(m_searching);
    m_sidebar->setSearching(m_searching);
    m_export->setEnabled(m_content == Content::Read && !m_searching && !m_exporting);
}

void LogWindow::showState() {
    if (m_content == Content::Failed && !m_searching)
        m_states->setCurrentWidget(m_failedPage);
    else if (m_content != Content::Read)
        m_states->setCurrentWidget(m_loadingPage);
    else if (m_list->size() == 0)
        m_states->setCurrentWidget(m_emptyPage);
    else
        m_states->setCurrentWidget(m_places.empty() ? m_noMatchPage : m_tableArea);
}

void LogWindow::on_exportButton_clicked() {
    m_askSavePath([this](const QString &path) { exportTo(path); });
}

void LogWindow::exportTo(const QString &path) {
    LastFolder::rememberFile(path);
    const auto opened = [window = QPointer(this)] {
        QMetaObject::invokeMethod(qApp, [window] {
            if (window)
                emit window->export_button_clicked(tr("Exporting..."));
        });
    };
    m_exporting = NetJob::post(
        NetJob::createRunner("exporting the log", NetTask::Turn::Beside), this,
        [path, list = m_list, places = m_places, opened] {
            return LogExport::write(path, *list, places, opened);
        },
        [this](bool written) {
            emit export_file_generated(written ? tr("Exported successfully!") : tr("Failed to export."),
                                       written);
        },
        [this](JobOutcome end) {
            m_exporting = false;
            showCount();
            if (end != JobOutcome::Delivered)
                emit export_file_generated(tr("Failed to export."), false);
        });
    showCount();
    if (!m_exporting)
        emit export_file_generated(tr("Failed to export."), false);
}
