#include "devices/page/mainconsolemenu.h"

#include <QCheckBox>
#include <QHeaderView>
#include <QVBoxLayout>
#include <QWidgetAction>

MainConsoleMenu::MainConsoleMenu(QHeaderView *header, QWidget *parent)
    : PopupMenu(parent), m_header(header), m_all(addBox(tr("All"), QStringLiteral("columnCheckBoxAll"))) {
    setObjectName(QStringLiteral("MainConsoleMenu"));
    connect(m_all, &QCheckBox::clicked, this, &MainConsoleMenu::setAllVisible);
    addSeparator();
    for (int column = 0; column < header->count(); ++column) {
        const QString title = header->model()->headerData(column, Qt::Horizontal).toString();
        QCheckBox *box = addBox(title, QStringLiteral("columnCheckBox%1").arg(column));
        connect(box, &QCheckBox::clicked, this, [this, column](bool checked) {
            m_header->setSectionHidden(column, !checked);
            showState();
        });
        m_boxes.push_back(box);
    }
    addSeparator();
    QAction *reset = addAction(tr("Reset columns"));
    reset->setObjectName(QStringLiteral("resetColumnsAction"));
    connect(reset, &QAction::triggered, this, &MainConsoleMenu::resetRequested);
    connect(this, &QMenu::aboutToShow, this, &MainConsoleMenu::showState);
}

QCheckBox *MainConsoleMenu::addBox(const QString &text, const QString &name) {
    auto *frame = new QWidget(this);
    auto *box = new QCheckBox(text, frame);
    box->setObjectName(name);
    auto *layout = new QVBoxLayout(frame);
    layout->setContentsMargins(14, 5, 24, 5);
    layout->addWidget(box);
    auto *action = new QWidgetAction(this);
    action->setDefaultWidget(frame);
    addAction(action);
    return box;
}

void MainConsoleMenu::showState() {
    for (std::size_t column = 0; column < m_boxes.size(); ++column)
        m_boxes[column]->setChecked(!m_header->isSectionHidden(static_cast<int>(column)));
    m_all->setChecked(m_header->hiddenSectionCount() == 0);
}

void MainConsoleMenu::setAllVisible(bool visible) {
    // Without any column, the button beside the tabs still opens this menu.
    for (int column = 0; column < m_header->count(); ++column)
        m_header->setSectionHidden(column, !visible);
    showState();
}
