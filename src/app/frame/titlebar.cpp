#include "app/frame/titlebar.h"

#include "widgets/controls/popupmenu.h"
#include "widgets/style/icons.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QToolButton>

namespace {
constexpr int barHeight = 40;
constexpr QSize iconSize{16, 16};
constexpr QSize buttonSize{40, 32};
} // namespace

TitleBar::TitleBar(QWidget *parent) : WindowDragger(parent), m_menu(new PopupMenu(this)) {
    setObjectName(QStringLiteral("windowTitlebar"));
    setFixedHeight(barHeight);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(16, 0, 6, 0);
    layout->setSpacing(2);
    auto *logo = new QLabel;
    logo->setObjectName(QStringLiteral("logoLabel"));
    QPixmap picture(QStringLiteral(":/images/logo_product_horizontal_dark.png"));
    picture.setDevicePixelRatio(picture.height() / 20.0);
    logo->setPixmap(picture);
    layout->addWidget(logo);
    layout->addStretch();

    m_help = addButton("helpButton", QStringLiteral("icon_general_help_line"), tr("Help"));
    m_account = addButton("accountButton", QStringLiteral("icon_general_account_line"), tr("Account"));
    m_minimize = addButton("minimizeButton", QStringLiteral("icon_chrome_minimize_line"), tr("Minimize"));
    m_maximize = addButton("maximizeButton", QStringLiteral("icon_chrome_maximize_line"), tr("Maximize"));
    m_restore = addButton("restoreButton", QStringLiteral("icon_chrome_restore_line"), tr("Restore"));
    m_close = addButton("closeButton", QStringLiteral("icon_chrome_close_line"), tr("Close"));
    buildMenu();
    setMaximized(false);
}

QToolButton *TitleBar::addButton(const char *name, const QString &icon, const QString &text) {
    auto *button = new QToolButton;
    button->setObjectName(QLatin1String(name));
    button->setIcon(Icons::icon(QStringLiteral(":/images/%1.svg").arg(icon), iconSize));
    button->setIconSize(iconSize);
    button->setFixedSize(buttonSize);
    button->setToolTip(text);
    button->setAccessibleName(text);
    button->setFocusPolicy(Qt::TabFocus);
    layout()->addWidget(button);
    return button;
}

void TitleBar::buildMenu() {
    m_menu->setObjectName(QStringLiteral("accountMenu"));
    m_accountManagement = m_menu->addAction(tr("Account Management"));
    m_serviceManagement = m_menu->addAction(tr("Norvell Service Management"));
    m_about = m_menu->addAction(tr("About"));
    m_logOff = m_menu->addAction(tr("Log off"));
    m_account->setMenu(m_menu);
    m_account->setPopupMode(QToolButton::InstantPopup);
}

void TitleBar::setServiceAdded(bool added) {
    const QString picture = QStringLiteral(":/images/icon_general_success_solid_green.svg");
    m_serviceManagement->setIcon(added ? Icons::plainIcon(picture, iconSize) : QIcon());
    m_serviceManagement->setToolTip(added ? tr("The service is connected.") : QString());
}

void TitleBar::setMaximized(bool maximized) {
    m_maximize->setVisible(!maximized);
    m_restore->setVisible(maximized);
}
