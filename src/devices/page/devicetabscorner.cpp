#include "devices/page/devicetabscorner.h"

#include "store/clientstore.h"
#include "widgets/style/icons.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QToolButton>

#include <nlohmann/json.hpp>

#include <algorithm>

namespace {
constexpr QSize iconSize{16, 16};
constexpr int spaceForTabs = 290;
constexpr int widest = 560;
/// Border, padding and arrow of a combo box.
constexpr int comboFrame = 46;
} // namespace

DeviceTabsCorner::DeviceTabsCorner(QWidget *parent)
    : QWidget(parent),
      m_search(new QLineEdit(this)),
      m_remoteCombo(new QComboBox(this)),
      m_columns(new QToolButton(this)) {
    m_search->setObjectName(QStringLiteral("deviceSearchEdit"));
    m_search->setAccessibleName(tr("Search devices"));
    m_search->setPlaceholderText(tr("Search devices"));
    m_search->setToolTip(
        tr("Model, host name, firmware or site; an IP address, network (10.4.0.0/16) or range "
           "(10.4.0.10-20); a MAC address"));
    m_search->setClearButtonEnabled(true);
    m_search->setMinimumWidth(100);
    m_remoteCombo->setObjectName(QStringLiteral("remoteConnectionComboBox"));
    m_remoteCombo->setAccessibleName(tr("Remote connection"));
    m_remoteCombo->setPlaceholderText(tr("Remote connection"));
    connect(m_remoteCombo, &QComboBox::activated, this, [this](int index) {
        const QString id = m_remoteCombo->itemData(index).toString();
        m_remoteCombo->setCurrentIndex(-1);
        emit serverChosen(id);
    });
    m_columns->setObjectName(QStringLiteral("columnsButton"));
    m_columns->setAccessibleName(tr("Columns"));
    m_columns->setToolTip(tr("Columns"));
    m_columns->setIcon(Icons::icon(QStringLiteral(":/images/icon_general_columns_line.svg"), iconSize));
    m_columns->setProperty("role", QStringLiteral("panel"));
    m_columns->setFixedSize(32, 32);
    m_columns->setFocusPolicy(Qt::TabFocus);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 4);
    layout->setSpacing(6);
    layout->addWidget(m_search, 3);
    layout->addWidget(m_remoteCombo, 2);
    layout->addWidget(m_columns);
}

void DeviceTabsCorner::loadServers() {
    m_remoteCombo->clear();
    JSON servers;
    CClientStore::instance().loadServerList(servers);
    for (const JSON &server : servers)
        m_remoteCombo->addItem(stringMember(server, "svrname"), stringMember(server, "id"));
    m_remoteCombo->setCurrentIndex(-1);
    m_remoteCombo->setEnabled(m_remoteCombo->count() > 0);
}

/// The combo box says what it is for with its placeholder alone, so that is never cut.
void DeviceTabsCorner::showEvent(QShowEvent *event) {
    m_remoteCombo->ensurePolished();
    m_remoteCombo->setMinimumWidth(
        m_remoteCombo->fontMetrics().horizontalAdvance(m_remoteCombo->placeholderText()) + comboFrame);
    QWidget::showEvent(event);
}

QSize DeviceTabsCorner::sizeHint() const {
    const int room = parentWidget() ? parentWidget()->width() - spaceForTabs : widest;
    return {std::clamp(room, minimumSizeHint().width(), widest), QWidget::sizeHint().height()};
}
