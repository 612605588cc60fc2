#include "store/configstore.h"

#include "platform/files/apppaths.h"
#include "platform/json.h"

#include <nlohmann/json.hpp>

CConfigStore::CConfigStore()
    : m_store(AppPaths::serviceStoreFile(), QStringLiteral("svcMainT"), CBaseStore::Access::ReadOnly) {}

quint32 CConfigStore::serverPort() const {
    const QString text = m_store.query(QStringLiteral("kSvcAndTrayServerPort"));
    const JSON value = JSON::parse(text.toStdString(), nullptr, false);
    const auto port = value.is_object() ? value.find("port") : value.end();
    if (port == value.end() || !port->is_number_integer())
        return 0;
    const auto number = port->get<std::int64_t>();
    return number > 0 && number <= 65535 ? static_cast<quint32>(number) : 0;
}
