#include "pages/log/logsidebar.h"

#include "widgets/controls/sectionclick.h"
#include "widgets/style/theme.h"

#include <QCalendarWidget>
#include <QComboBox>
#include <QDateEdit>
#include <QDateTime>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QSignalBlocker>
#include <QTextCharFormat>
#include <QTimeEdit>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>
#include <tuple>
#include <utility>

namespace {

constexpr int sidebarWidth = 248;
constexpr int timeWidth = 82;
constexpr int daysOfWeek = 7;
const QTime dayEnd(23, 59, 59, 999);

QLabel *addCaption(QVBoxLayout *layout, const QString &text, QWidget *buddy) {
    auto *caption = new QLabel(text);
    caption->setProperty("role", QStringLiteral("caption"));
    caption->setBuddy(buddy);
    layout->addWidget(caption);
    return caption;
}

qint64 timeOf(const QDateEdit *date, const QTimeEdit *time) {
    return std::max<qint64>(QDateTime(date->date(), time->time()).toMSecsSinceEpoch(), 0);
}

/// The choice of a filter box; its first entry stands for all.
template <typename Kind>
std::optional<Kind> chosen(const QComboBox *box) {
    if (box->currentIndex() <= 0)
        return std::nullopt;
    return static_cast<Kind>(box->currentIndex() - 1);
}

} // namespace

// Parts are made from the top down, which is the way of the Tab key.
LogSidebar::LogSidebar(QWidget *parent) : QFrame(parent) {
    setObjectName(QStringLiteral("logSidebar"));
    setFixedWidth(sidebarWidth);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(16, 16, 16, 16);
    layout->setSpacing(6);
    auto *heading = new QLabel(tr("Time Frame"), this);
    heading->setProperty("role", QStringLiteral("heading"));
    layout->addWidget(heading);
    layout->addSpacing(4);
    addQuickFrames(layout);
    std::tie(m_startDate, m_startTime) = addTimes(layout, tr("Start Time"), "startDateEdit", "startTimeEdit");
    std::tie(m_endDate, m_endTime) = addTimes(layout, tr("End Time"), "endDateEdit", "endTimeEdit");
    m_problem = new QLabel(this);
    m_problem->setObjectName(QStringLiteral("frameProblemLabel"));
    m_problem->setProperty("role", QStringLiteral("warning"));
    m_problem->setTextFormat(Qt::PlainText);
    m_problem->setWordWrap(true);
    m_problem->hide();
    layout->addWidget(m_problem);
    m_source = addFilter(layout, "sourceComboBox", tr("Source"));
    m_source->addItems({tr("All Sources"), logSourceText(LogEntry::Source::Device),
                        logSourceText(LogEntry::Source::System)});
    m_type = addFilter(layout, "typeComboBox", tr("Type"));
    m_type->addItems({tr("All Types"), logTypeText(LogEntry::Type::Alarm), logTypeText(LogEntry::Type::Event),
                      logTypeText(LogEntry::Type::Audit)});
    m_search = new QPushButton(tr("Search"), this);
    m_search->setObjectName(QStringLiteral("searchButton"));
    m_search->setProperty("role", QStringLiteral("primary"));
    layout->addSpacing(10);
    layout->addWidget(m_search);
    layout->addStretch();
    connect(m_search, &QPushButton::clicked, this, &LogSidebar::searchRequested);
    chooseQuick(Quick::Today);
}

void LogSidebar::addQuickFrames(QVBoxLayout *layout) {
    auto *row = new QHBoxLayout;
    row->setSpacing(4);
    const std::tuple<Quick, const char *, QString> quicks[] = {
        {Quick::LastHour, "lastHourButton", tr("Last hour")},
        {Quick::Today, "todayButton", tr("Today")},
        {Quick::SevenDays, "sevenDaysButton", tr("7 days")}};
    for (const auto &[quick, name, text] : quicks) {
        auto *button = new QToolButton(this);
        button->setObjectName(QLatin1String(name));
        button->setText(text);
        button->setCheckable(true);
        button->setProperty("role", QStringLiteral("quick"));
        button->setFocusPolicy(Qt::StrongFocus);
        connect(button, &QToolButton::clicked, this, [this, quick = quick] {
            chooseQuick(quick);
            emit searchRequested();
        });
        row->addWidget(button);
        m_quickButtons.emplace_back(quick, button);
    }
    row->addStretch();
    layout->addLayout(row);
    layout->addSpacing(4);
}

/// Calendars are large, and made when the page is first seen.
void LogSidebar::showEvent(QShowEvent *event) {
    QFrame::showEvent(event);
    if (std::exchange(m_hasCalendars, true))
        return;
    QTextCharFormat plain;
    plain.setForeground(Theme::text);
    for (const QDateEdit *date : {m_startDate, m_endDate}) {
        for (const Qt::DayOfWeek day : {Qt::Saturday, Qt::Sunday})
            date->calendarWidget()->setWeekdayTextFormat(day, plain);
    }
}

std::pair<QDateEdit *, QTimeEdit *> LogSidebar::addTimes(QVBoxLayout *layout, const QString &caption,
                                                         const char *dateName, const char *timeName) {
    auto *date = new QDateEdit(this);
    auto *time = new QTimeEdit(this);
    addCaption(layout, caption, date);
    date->setObjectName(QLatin1String(dateName));
    date->setDisplayFormat(QStringLiteral("yyyy/MM/dd"));
    date->setCalendarPopup(true);
    // The service counts from there, and knows no time before it.
    date->setMinimumDate(QDate(1970, 1, 1));
    date->setAccessibleName(tr("%1, date").arg(caption));
    time->setObjectName(QLatin1String(timeName));
    time->setDisplayFormat(QStringLiteral("HH:mm"));
    time->setFixedWidth(timeWidth);
    time->setAccessibleName(tr("%1, time of day").arg(caption));
    SectionClick::install(date);
    SectionClick::install(time);
    auto *row = new QHBoxLayout;
    row->setSpacing(6);
    row->addWidget(date, 1);
    row->addWidget(time);
    layout->addLayout(row);
    layout->addSpacing(4);
    const auto edited = [this] {
        showQuick(Quick::None);
        showProblem({});
    };
    connect(date, &QDateEdit::dateChanged, this, edited);
    connect(time, &QTimeEdit::timeChanged, this, edited);
    return {date, time};
}

QComboBox *LogSidebar::addFilter(QVBoxLayout *layout, const char *name, const QString &caption) {
    auto *box = new QComboBox(this);
    box->setObjectName(QLatin1String(name));
    box->setAccessibleName(caption);
    layout->addSpacing(4);
    addCaption(layout, caption, box);
    layout->addWidget(box);
    connect(box, &QComboBox::currentIndexChanged, this, &LogSidebar::filterChanged);
    return box;
}

TimeRange LogSidebar::frame() const {
    return {timeOf(m_startDate, m_startTime), timeOf(m_endDate, m_endTime)};
}

void LogSidebar::setFrame(const TimeRange &frame) {
    setEnds(QDateTime::fromMSecsSinceEpoch(frame.from), QDateTime::fromMSecsSinceEpoch(frame.to));
    showQuick(Quick::None);
}

void LogSidebar::setEnds(const QDateTime &start, const QDateTime &end) {
    const QSignalBlocker blockers[] = {QSignalBlocker(m_startDate), QSignalBlocker(m_startTime),
                                       QSignalBlocker(m_endDate), QSignalBlocker(m_endTime)};
    m_startDate->setDate(start.date());
    m_startTime->setTime(start.time());
    m_endDate->setDate(end.date());
    m_endTime->setTime(end.time());
    showProblem({});
}

void LogSidebar::renewQuickFrame() {
    if (m_quick != Quick::None)
        chooseQuick(m_quick);
}

void LogSidebar::chooseQuick(Quick quick) {
    const QDateTime now = QDateTime::currentDateTime();
    // The whole minute that the field shows, and the whole day, belong to the frame.
    const QDateTime minuteEnd(now.date(), QTime(now.time().hour(), now.time().minute(), 59, 999));
    if (quick == Quick::LastHour)
        setEnds(now.addSecs(-3600), minuteEnd);
    else
        setEnds(now.date().addDays(quick == Quick::SevenDays ? 1 - daysOfWeek : 0).startOfDay(),
                QDateTime(now.date(), dayEnd));
    showQuick(quick);
}

void LogSidebar::showQuick(Quick quick) {
    m_quick = quick;
    for (const auto &[each, button] : m_quickButtons)
        button->setChecked(each == quick);
}

std::optional<LogEntry::Source> LogSidebar::source() const {
    return chosen<LogEntry::Source>(m_source);
}

std::optional<LogEntry::Type> LogSidebar::type() const {
    return chosen<LogEntry::Type>(m_type);
}

void LogSidebar::clearFilters() {
    m_source->setCurrentIndex(0);
    m_type->setCurrentIndex(0);
}

void LogSidebar::reset() {
    clearFilters();
    chooseQuick(Quick::Today);
}

void LogSidebar::showProblem(const QString &problem) {
    m_problem->setText(problem);
    m_problem->setVisible(!problem.isEmpty());
}

void LogSidebar::setSearching(bool searching) {
    m_search->setEnabled(!searching);
    for (const auto &[quick, button] : m_quickButtons)
        button->setEnabled(!searching);
}
