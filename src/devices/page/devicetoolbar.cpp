#include "devices/page/devicetoolbar.h"

#include "devices/operations/operations.h"
#include "widgets/controls/popupmenu.h"
#include "widgets/style/icons.h"
#include "widgets/style/theme.h"

#include <QHBoxLayout>
#include <QPainter>
#include <QStyleOptionToolButton>
#include <QStylePainter>
#include <QToolButton>

namespace {

constexpr QSize buttonIconSize{18, 18};
constexpr int minButtonWidth = 54;
constexpr int buttonPadding = 6;
constexpr int buttonHeight = 58;
constexpr int textHeight = 28;
constexpr int buttonGap = 1;
constexpr int groupGap = 8;

/// A button whose text stands under the icon in up to two lines, with a small arrow when it has a menu.
class OperationButton : public QToolButton {
public:
    using QToolButton::QToolButton;

    QSize sizeHint() const override {
        int width = minButtonWidth;
        for (const QString &word : text().split(QLatin1Char(' ')))
            width = std::max(width, fontMetrics().horizontalAdvance(word) + 2 * buttonPadding);
        return {width, buttonHeight};
    }
    QSize minimumSizeHint() const override { return sizeHint(); }

protected:
    void paintEvent(QPaintEvent *) override {
        QStyleOptionToolButton option;
        initStyleOption(&option);
        option.text.clear();
        option.icon = {};
        option.features &= ~QStyleOptionToolButton::HasMenu;
        // A menu that closes elsewhere leaves the button believing that the pointer is still on it.
        if (!rect().contains(mapFromGlobal(QCursor::pos())))
            option.state &= ~QStyle::State_MouseOver;
        QStylePainter painter(this);
        painter.drawComplexControl(QStyle::CC_ToolButton, option);
        const QRect iconRect((width() - buttonIconSize.width()) / 2, 8, buttonIconSize.width(),
                             buttonIconSize.height());
        const QIcon::Mode mode = !isEnabled()   ? QIcon::Disabled
                                 : underMouse() ? QIcon::Active
                                                : QIcon::Normal;
        icon().paint(&painter, iconRect, Qt::AlignCenter, mode);
        if (menu())
            paintArrow(painter, iconRect);
        painter.setPen(isEnabled() ? Theme::textStrong : Theme::textOff);
        painter.drawText(QRect(2, height() - textHeight - 2, width() - 4, textHeight),
                         Qt::AlignHCenter | Qt::AlignTop | Qt::TextWordWrap, text());
    }

private:
    void paintArrow(QPainter &painter, const QRect &iconRect) const {
        const QPointF tip(iconRect.right() + 9.0, iconRect.center().y() + 2.5);
        const QPointF points[] = {tip, tip + QPointF(-3, -3.5), tip + QPointF(3, -3.5)};
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(Qt::NoPen);
        painter.setBrush(isEnabled() ? Theme::textDim : Theme::textOff);
        painter.drawPolygon(points, 3);
    }
};

/// Stands for a button that does not fit, in the menu of those.
void addSubstitute(QMenu *menu, QToolButton *button) {
    if (button->menu()) {
        menu->addMenu(button->menu())->setText(button->text());
    } else {
        QAction *entry = menu->addAction(button->icon(), button->text());
        QObject::connect(entry, &QAction::triggered, button, &QToolButton::click);
    }
    menu->actions().constLast()->setEnabled(button->isEnabled());
    menu->actions().constLast()->setToolTip(button->toolTip());
}

bool isPlanned(const Operation *operation) {
    return operation->needs == Operation::Needs::LaterVersion;
}

} // namespace

DeviceToolBar::DeviceToolBar(QWidget *parent) : QFrame(parent) {
    setObjectName(QStringLiteral("deviceToolBar"));
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 6);
    layout->setSpacing(buttonGap);
    for (const Operation *operation : Operations::all()) {
        if (!operation->isButton())
            continue;
        if (beginsGroup(operation))
            layout->addSpacing(groupGap);
        QToolButton *button = addButton(*operation);
        layout->addWidget(button);
        m_buttons.push_back({operation, button});
    }
    buildMoreButton();
    layout->addStretch();
    for (const Operation *operation : Operations::all()) {
        if (operation->group == Operation::Group::RowMenu)
            m_rowActions.push_back(makeAction(*operation, this));
    }
}

/// Whether a button stands apart from those before it; asked for the one that is added next.
bool DeviceToolBar::beginsGroup(const Operation *operation) const {
    return !m_buttons.empty() && m_buttons.back().operation->group != operation->group;
}

QToolButton *DeviceToolBar::addButton(const Operation &operation) {
    auto *button = new OperationButton(this);
    button->setText(operation.title());
    button->setAccessibleName(button->text());
    button->setIcon(
        Icons::icon(QStringLiteral(":/images/%1.svg").arg(QLatin1String(operation.icon)), buttonIconSize));
    button->setPopupMode(QToolButton::InstantPopup);
    button->setFocusPolicy(Qt::TabFocus);
    if (operation.menu)
        button->setMenu(buildMenu(*operation.menu, this));
    setUp(button, operation);
    connect(button, &QToolButton::clicked, this, [this, &operation] {
        if (operation.open)
            emit operationChosen(operation);
    });
    return button;
}

QMenu *DeviceToolBar::buildMenu(Operation::Group group, QWidget *parent) {
    auto *menu = new PopupMenu(parent);
    for (const Operation *operation : Operations::all()) {
        if (operation->group != group)
            continue;
        QAction *action = makeAction(*operation, menu);
        menu->addAction(action);
        if (operation->menu)
            action->setMenu(buildMenu(*operation->menu, menu));
    }
    return menu;
}

QAction *DeviceToolBar::makeAction(const Operation &operation, QObject *parent) {
    auto *action = new QAction(operation.title(), parent);
    setUp(action, operation);
    connect(action, &QAction::triggered, this, [this, &operation] {
        if (operation.open)
            emit operationChosen(operation);
    });
    return action;
}

/// What a button and an action have in common.
template <typename Trigger>
void DeviceToolBar::setUp(Trigger *trigger, const Operation &operation) {
    trigger->setObjectName(QLatin1String(operation.objectName));
    trigger->setToolTip(isPlanned(&operation) ? Operation::tr("Not available in this version yet.")
                                              : QString());
    trigger->setEnabled(operation.needs == Operation::Needs::Nothing);
    trigger->setProperty("helpPage", QString::fromLatin1(operation.helpPage));
    connect(this, &DeviceToolBar::fulfilledChanged, trigger,
            [trigger, needs = operation.needs](Operation::Needs changed, bool fulfilled) {
                if (needs == changed)
                    trigger->setEnabled(fulfilled);
            });
}

void DeviceToolBar::setFulfilled(Operation::Needs needs, bool fulfilled) {
    emit fulfilledChanged(needs, fulfilled);
}

void DeviceToolBar::buildMoreButton() {
    m_more = new OperationButton(this);
    m_more->setObjectName(QStringLiteral("moreButton"));
    m_more->setText(Operation::tr("More"));
    m_more->setAccessibleName(m_more->text());
    m_more->setIcon(Icons::icon(QStringLiteral(":/images/icon_general_more_line.svg"), buttonIconSize));
    m_more->setPopupMode(QToolButton::InstantPopup);
    m_more->setFocusPolicy(Qt::TabFocus);
    m_more->hide();
    auto *menu = new PopupMenu(this);
    connect(menu, &QMenu::aboutToShow, this, [this, menu] {
        menu->clear();
        for (const Button &each : m_buttons) {
            if (each.button->isHidden())
                addSubstitute(menu, each.button);
        }
    });
    m_more->setMenu(menu);
    layout()->addWidget(m_more);
}

void DeviceToolBar::addOperations(QMenu *menu) const {
    for (const auto &[operation, each] : m_buttons) {
        const QList<QAction *> entries = each->menu() ? each->menu()->actions() : QList<QAction *>();
        const bool usable =
            entries.isEmpty() || std::any_of(entries.begin(), entries.end(), [](const QAction *entry) {
                return entry->isEnabled() && !entry->menu();
            });
        if (each->isEnabled() && usable)
            addSubstitute(menu, each);
    }
    menu->addSeparator();
    menu->addActions(m_rowActions);
}

QSize DeviceToolBar::minimumSizeHint() const {
    return {m_more->sizeHint().width() * 3, QFrame::minimumSizeHint().height()};
}

void DeviceToolBar::resizeEvent(QResizeEvent *event) {
    QFrame::resizeEvent(event);
    fitButtons();
}

/// Shows as many buttons as there is room for; the others move to the menu at the end, those first that do
/// nothing yet.
void DeviceToolBar::fitButtons() {
    const auto widthOf = [this](std::size_t i) {
        const bool hasGap = i > 0 && m_buttons[i].operation->group != m_buttons[i - 1].operation->group;
        return m_buttons[i].button->sizeHint().width() + buttonGap + (hasGap ? groupGap : 0);
    };
    int wanted = 0;
    for (std::size_t i = 0; i < m_buttons.size(); ++i)
        wanted += widthOf(i);
    const bool overflow = wanted > width();
    wanted += overflow ? m_more->sizeHint().width() : 0;
    std::vector<bool> shown(m_buttons.size(), true);
    for (const bool planned : {true, false}) {
        for (std::size_t i = m_buttons.size(); i-- > 0 && wanted > width();) {
            if (isPlanned(m_buttons[i].operation) != planned)
                continue;
            shown[i] = false;
            wanted -= widthOf(i);
        }
    }
    for (std::size_t i = 0; i < m_buttons.size(); ++i)
        m_buttons[i].button->setVisible(shown[i]);
    m_more->setVisible(overflow);
}

QToolButton *DeviceToolBar::button(const QString &objectName) const {
    return findChild<QToolButton *>(objectName);
}
