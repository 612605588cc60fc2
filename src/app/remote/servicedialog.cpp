#include "app/remote/servicedialog.h"

void ServiceDialog::beginChange(const QString &text) {
    m_change = text;
    showChange();
}

void ServiceDialog::endChange() {
    if (m_change.isEmpty())
        return;
    m_change.clear();
    TransientMessage::clear(isClosed() ? parentWidget() : this);
    if (isClosed())
        deleteLater();
}

void ServiceDialog::reject() {
    if (m_change.isEmpty() || !parentWidget())
        return FramelessDialog::reject();
    // The outcome still has to be told by somebody.
    setAttribute(Qt::WA_DeleteOnClose, false);
    hide();
    showChange();
}

void ServiceDialog::comeBack() {
    setAttribute(Qt::WA_DeleteOnClose);
    TransientMessage::clear(parentWidget());
    open();
}

void ServiceDialog::tell(const QString &text, TransientMessage::Kind kind) {
    TransientMessage::show(isClosed() ? parentWidget() : this, text, kind);
}

void ServiceDialog::showChange() {
    tell(m_change, TransientMessage::Kind::Loading);
}
