#include "devices/page/noticebar.h"

#include "widgets/style/icons.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>

NoticeBar::NoticeBar(QWidget *parent) : QFrame(parent) {
    setObjectName(QStringLiteral("noticeBar"));
    auto *icon = new QLabel(this);
    icon->setPixmap(Icons::pixmap(QStringLiteral(":images/icon_general_tip_solid_blue.svg"), {16, 16}, 2.0));
    auto *text =
        new QLabel(tr("Site changes detected. Update changes to the server promptly by clicking"), this);
    auto *apply = new QPushButton(tr("Apply"), this);
    apply->setObjectName(QStringLiteral("noticeApplyButton"));
    connect(apply, &QPushButton::clicked, this, &NoticeBar::msgButtonClicked);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(12, 6, 12, 6);
    layout->addWidget(icon);
    layout->addWidget(text);
    layout->addWidget(apply);
    layout->addStretch();
    hide();
}
