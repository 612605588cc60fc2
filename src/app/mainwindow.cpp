#include "mainwindow.h"

#include "devicewindow.h"
#include "icons.h"

#include <QButtonGroup>
#include <QCursor>
#include <QDebug>
#include <QEvent>
#include <QHBoxLayout>
#include <QStackedWidget>
#include <QToolButton>
#include <QToolTip>
#include <QVBoxLayout>

namespace {
constexpr int railWidth = 56;
constexpr QSize pictureSize{20, 20};
constexpr QSize railButtonSize{44, 44};

/// Made before its children: a tree of widgets that moves to another parent is styled all over again.
QWidget *makeCentral(QMainWindow *window) {
    // It lives inside the frame, so it is no window of its own; said while there is nothing to style yet.
    window->setWindowFlags(Qt::Widget);
    auto *central = new QWidget(window);
    central->setAttribute(Qt::WA_TranslucentBackground);
    auto *layout = new QHBoxLayout(central);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    window->setCentralWidget(central);
    return central;
}

} // namespace

MainWindow::MainWindow(QWidget *parent)
    : QMainWindow(parent),
      m_pages(new QStackedWidget(makeCentral(this))),
      m_deviceWindow(new DeviceWindow(m_pages)),
      m_navigation(new QButtonGroup(this)) {
    qDebug("MainWindow constructor");
    setObjectName(QStringLiteral("MainWindow"));
    m_pages->setObjectName(QStringLiteral("pageStack"));
    m_pages->addWidget(m_deviceWindow);
    auto *layout = static_cast<QHBoxLayout *>(centralWidget()->layout());
    layout->addWidget(buildRail());
    layout->addWidget(m_pages, 1);
}

MainWindow::~MainWindow() {
    qDebug("MainWindow destructor");
}

QWidget *MainWindow::buildRail() {
    auto *rail = new QFrame(centralWidget());
    rail->setObjectName(QStringLiteral("navigationRail"));
    rail->setFixedWidth(railWidth);
    auto *layout = new QVBoxLayout(rail);
    layout->setContentsMargins(0, 8, 0, 8);
    layout->setSpacing(4);
    QToolButton *device =
        addRailButton(rail, "deviceButton", QStringLiteral("nav_device_line"), tr("Device"));
    QToolButton *log = addRailButton(rail, "logButton", QStringLiteral("nav_logs_line"), tr("Logs"));
    QToolButton *settings =
        addRailButton(rail, "settingsButton", QStringLiteral("nav_settings_line"), tr("Settings"));
    layout->addStretch();
    QToolButton *alarm = addRailButton(rail, "alarmButton", QStringLiteral("nav_alarm_line"), tr("Alarms"));
    QToolButton *task = addRailButton(rail, "taskButton", QStringLiteral("nav_task_line"), tr("Tasks"));
    // Their pages and panels do not exist yet.
    for (QToolButton *button : {log, settings, alarm, task})
        button->setEnabled(false);
    m_navigation->setExclusive(true);
    m_navigation->addButton(device, 0);
    device->setChecked(true);
    connect(m_navigation, &QButtonGroup::idToggled, this, [this](int page, bool checked) {
        if (checked)
            m_pages->setCurrentIndex(page);
    });
    return rail;
}

QToolButton *MainWindow::addRailButton(QWidget *rail, const char *name, const QString &icon,
                                       const QString &text) {
    auto *button = new QToolButton(rail);
    button->setObjectName(QLatin1String(name));
    button->setAccessibleName(text);
    button->setIcon(Icons::icon(QStringLiteral(":/images/%1.svg").arg(icon), pictureSize));
    button->setIconSize(pictureSize);
    button->setFixedSize(railButtonSize);
    button->setCheckable(true);
    button->setFocusPolicy(Qt::TabFocus);
    button->installEventFilter(this);
    rail->layout()->addWidget(button);
    rail->layout()->setAlignment(button, Qt::AlignHCenter);
    return button;
}

bool MainWindow::eventFilter(QObject *watched, QEvent *event) {
    if (event->type() == QEvent::Enter) {
        const auto *button = static_cast<QWidget *>(watched);
        QToolTip::showText(QCursor::pos(), button->accessibleName());
    }
    return QMainWindow::eventFilter(watched, event);
}
