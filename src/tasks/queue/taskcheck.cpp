#include "tasks/queue/taskcheck.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <algorithm>

TaskCheck &TaskCheck::require(bool condition, const char *refusal) {
    if (!m_passed || condition)
        return *this;
    m_passed = false;
    QString message = QLatin1String(refusal);
    if (m_place) {
        if (message.endsWith(QLatin1Char('.')))
            message.chop(1);
        message += QStringLiteral(" when ") + QLatin1String(m_place);
    }
    qWarning("%s", qUtf8Printable(message));
    return *this;
}

TaskCheck &TaskCheck::texts(std::initializer_list<QString> texts) {
    return require(
        std::none_of(texts.begin(), texts.end(), [](const QString &text) { return text.isEmpty(); }));
}

TaskCheck &TaskCheck::fileName(const QString &name) {
    return require(!name.trimmed().isEmpty(), "Inserting new task with the blank file name.");
}

TaskCheck &TaskCheck::devices(const JSON &devices, const char *emptyRefusal) {
    require(devices.is_array(), "Inserting new task with the devices requires the JSON array format.");
    return require(!devices.empty(), emptyRefusal);
}

TaskCheck &TaskCheck::certificates(const JSON &files) {
    return require(files.is_array() && !files.empty(),
                   "Inserting new task requires the certificate information.");
}
