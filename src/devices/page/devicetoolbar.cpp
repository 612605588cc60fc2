#include "devices/page/devicetoolbar.h"

#include "widgets/controls/popupmenu.h"
#include "widgets/style/icons.h"
#include "widgets/style/theme.h"

#include <QCoreApplication>
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
        const QRect iconRect((width() - buttonIconSize.width()) / 2, 8, buttonIconSize.width(), buttonIconSize.height());
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

struct Operation {
    const char *name;
    const char *text;
    const char *icon;
    bool groupBegins = false;
    /// What it does comes with a later version: it is always off, and the first to give way.
    bool isPlanned = false;
};

constexpr Operation operations[] = {
    {"addDeviceButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Add Device"), "tool_add_device_line"},
    {"authorizeButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Authorize Device"), "tool_authorize_line"},
    {"setPasswordButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Set Password"), "tool_set_password_line"},
    {"ipButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Assign IP Address"), "tool_assign_ip_line"},
    {"uploadButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Upload"), "tool_upload_line", true},
    {"quickSettingButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Quick Setup"), "tool_quick_setup_line"},
    {"setConfigurationButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Set Configuration"),
     "tool_set_configuration_line", false, true},
    {"backupConfigurationButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Backup Configuration"),
     "tool_backup_configuration_line", false, true},
    {"restartButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Restart Device"), "tool_restart_line", true},
    {"restoreButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Restore Device"), "tool_restore_line"},
    {"replaceButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Replace Device"), "tool_replace_line", false, true},
    {"exportButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Export"), "tool_export_line", true},
    {"refreshButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Refresh"), "tool_refresh_line"},
    {"deleteButton", QT_TRANSLATE_NOOP("DeviceToolBar", "Delete Device"), "tool_delete_line"},
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

struct Entry {
    const char *name;
    QString text;
};

/// Entries are enabled by whoever carries them out, like buttons.
void addEntries(QMenu *menu, std::initializer_list<Entry> entries) {
    for (const Entry &entry : entries) {
        QAction *action = menu->addAction(entry.text);
        action->setObjectName(QLatin1String(entry.name));
        action->setEnabled(false);
    }
}

} // namespace

DeviceToolBar::DeviceToolBar(QWidget *parent) : QFrame(parent) {
    setObjectName(QStringLiteral("deviceToolBar"));
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 6);
    layout->setSpacing(buttonGap);
    for (const Operation &operation : operations) {
        if (operation.groupBegins)
            layout->addSpacing(groupGap);
        auto *button = new OperationButton(this);
        button->setObjectName(QLatin1String(operation.name));
        button->setText(QCoreApplication::translate("DeviceToolBar", operation.text));
        button->setAccessibleName(button->text());
        button->setIcon(
            Icons::icon(QStringLiteral(":/images/%1.svg").arg(QLatin1String(operation.icon)), buttonIconSize));
        button->setPopupMode(QToolButton::InstantPopup);
        button->setFocusPolicy(Qt::TabFocus);
        button->setEnabled(false);
        if (operation.isPlanned)
            button->setToolTip(tr("Not available in this version yet."));
        layout->addWidget(button);
        m_buttons.push_back(button);
    }
    buildMoreButton();
    layout->addStretch();

    auto *exportMenu = new PopupMenu(this);
    addEntries(exportMenu, {{"exportDeviceListAction", tr("Export Device List")},
                            {"exportDebugInfoAction", tr("Export Debug Info")}});
    button(QStringLiteral("exportButton"))->setMenu(exportMenu);
    auto *uploadMenu = new PopupMenu(this);
    addEntries(uploadMenu, {{"uploadFirmwareAction", tr("Upload Firmware")},
                            {"uploadPackageAction", tr("Upload Package")},
                            {"uploadConfigurationAction", tr("Upload Configuration File")}});
    auto *certificateMenu = new PopupMenu(uploadMenu);
    certificateMenu->setTitle(tr("Upload Certificate"));
    addEntries(certificateMenu,
               {{"uploadHttpsAction", tr("HTTPS")}, {"uploadIeeeAction", tr("IEEE 802.1x")}});
    uploadMenu->addMenu(certificateMenu);
    button(QStringLiteral("uploadButton"))->setMenu(uploadMenu);
    auto *configurationMenu = new PopupMenu(this);
    addEntries(configurationMenu, {{"createTemplateAction", tr("Create Template")},
                                   {"importTemplateAction", tr("Import Template")}});
    button(QStringLiteral("setConfigurationButton"))->setMenu(configurationMenu);
    auto *restoreMenu = new PopupMenu(this);
    addEntries(restoreMenu, {{"restorePointAction", tr("Restore to Restore Point")},
                             {"factoryDefaultAction", tr("Restore to Factory Default")}});
    entry(QStringLiteral("restorePointAction"))->setToolTip(tr("Not available in this version yet."));
    button(QStringLiteral("restoreButton"))->setMenu(restoreMenu);
    // Certificates are looked at for all devices, so this is in the menu of the table's rows.
    m_certificates = new QAction(tr("Certificates in use"), this);
    m_certificates->setObjectName(QStringLiteral("certificateListAction"));
    m_certificates->setEnabled(false);
}

void DeviceToolBar::buildMoreButton() {
    m_more = new OperationButton(this);
    m_more->setObjectName(QStringLiteral("moreButton"));
    m_more->setText(tr("More"));
    m_more->setAccessibleName(m_more->text());
    m_more->setIcon(Icons::icon(QStringLiteral(":/images/icon_general_more_line.svg"), buttonIconSize));
    m_more->setPopupMode(QToolButton::InstantPopup);
    m_more->setFocusPolicy(Qt::TabFocus);
    m_more->hide();
    auto *menu = new PopupMenu(this);
    connect(menu, &QMenu::aboutToShow, this, [this, menu] {
        menu->clear();
        for (QToolButton *button : m_buttons) {
            if (button->isHidden())
                addSubstitute(menu, button);
        }
    });
    m_more->setMenu(menu);
    layout()->addWidget(m_more);
}

void DeviceToolBar::addOperations(QMenu *menu) const {
    for (QToolButton *each : m_buttons) {
        const QList<QAction *> entries = each->menu() ? each->menu()->actions() : QList<QAction *>();
        const bool usable =
            entries.isEmpty() || std::any_of(entries.begin(), entries.end(), [](const QAction *entry) {
                return entry->isEnabled() && !entry->menu();
            });
        if (each->isEnabled() && usable)
            addSubstitute(menu, each);
    }
    menu->addSeparator();
    menu->addAction(m_certificates);
}

QAction *DeviceToolBar::entry(const QString &objectName) const {
    return findChild<QAction *>(objectName);
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
        return m_buttons[i]->sizeHint().width() + buttonGap + (operations[i].groupBegins ? groupGap : 0);
    };
    int wanted = 0;
    for (std::size_t i = 0; i < m_buttons.size(); ++i)
        wanted += widthOf(i);
    const bool overflow = wanted > width();
    wanted += overflow ? m_more->sizeHint().width() : 0;
    std::vector<bool> shown(m_buttons.size(), true);
    for (const bool planned : {true, false}) {
        for (std::size_t i = m_buttons.size(); i-- > 0 && wanted > width();) {
            if (operations[i].isPlanned != planned)
                continue;
            shown[i] = false;
            wanted -= widthOf(i);
        }
    }
    for (std::size_t i = 0; i < m_buttons.size(); ++i)
        m_buttons[i]->setVisible(shown[i]);
    m_more->setVisible(overflow);
}

QToolButton *DeviceToolBar::button(const QString &objectName) const {
    return findChild<QToolButton *>(objectName);
}
