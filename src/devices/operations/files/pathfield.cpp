#include "devices/operations/files/pathfield.h"

#include "devices/operations/captioned.h"
#include "widgets/style/plaintext.h"

#include <QDir>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QMimeData>
#include <QPushButton>
#include <QStyle>
#include <QUrl>
#include <QVBoxLayout>

namespace {

/// Lets the style sheet look at the widget again: it does not watch properties.
void setStyled(QWidget *widget, const char *property, const QVariant &value) {
    if (widget->property(property) == value)
        return;
    widget->setProperty(property, value);
    widget->style()->unpolish(widget);
    widget->style()->polish(widget);
}

} // namespace

PathField::PathField(const QString &caption, const QString &placeholder, QWidget *parent)
    : QWidget(parent), m_edit(new QLineEdit(this)), m_state(new QLabel(this)) {
    m_edit->setObjectName(QStringLiteral("fileEdit"));
    m_edit->setAccessibleName(caption);
    m_edit->setReadOnly(true);
    m_edit->setPlaceholderText(placeholder);
    m_state->setObjectName(QStringLiteral("fileStateLabel"));
    m_state->setTextFormat(Qt::PlainText);
    // What a file says of itself may be longer than any dialog.
    m_state->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
    auto *line = new QWidget(this);
    auto *browse = new QPushButton(tr("Browse..."), line);
    browse->setObjectName(QStringLiteral("browseButton"));
    browse->setAccessibleDescription(caption);
    browse->setAutoDefault(false);
    line->setFocusProxy(browse);
    setFocusProxy(browse);
    auto *lineLayout = new QHBoxLayout(line);
    lineLayout->setContentsMargins(0, 0, 0, 0);
    lineLayout->setSpacing(8);
    lineLayout->addWidget(m_edit, 1);
    lineLayout->addWidget(browse);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(4);
    layout->addWidget(captioned(caption, line, this));
    layout->addWidget(m_state);
    connect(browse, &QPushButton::clicked, this, &PathField::browse);
}

QStringList PathField::localPaths(const QMimeData &data) {
    QStringList paths;
    for (const QUrl &url : data.urls()) {
        if (url.isLocalFile())
            paths += url.toLocalFile();
    }
    return paths;
}

void PathField::showPath(const QString &path) {
    m_edit->setText(QDir::toNativeSeparators(path));
    m_edit->setToolTip(PlainText::toolTip(path));
}

void PathField::say(const QString &text, Tone tone) {
    m_state->setText(text);
    m_state->setToolTip(PlainText::toolTip(text));
    setStyled(m_state, "role", tone == Tone::Warning ? "warning" : "quiet");
}

void PathField::setDropping(bool on) {
    setStyled(m_edit, "dropping", on);
}
