#include "app/login/serveraddress.h"

#include "base/ipv4.h"

#include <QDebug>
#include <QHostInfo>

namespace {
constexpr qsizetype maxHostLength = 127;
} // namespace

std::optional<ServerAddress> ServerAddress::parse(const QString &text) {
    const QString trimmed = text.trimmed();
    const qsizetype colon = trimmed.indexOf(u':');
    ServerAddress address{colon < 0 ? trimmed : trimmed.left(colon)};
    if (colon >= 0) {
        bool ok = false;
        const int port = trimmed.mid(colon + 1).toInt(&ok);
        if (!ok || port < 1 || port > 65535)
            return std::nullopt;
        address.port = static_cast<quint16>(port);
    }
    const bool blank = address.host.isEmpty() || address.host.contains(u' ') || address.host.contains(u'/');
    if (blank || address.host.size() > maxHostLength)
        return std::nullopt;
    return address;
}

bool ServerAddress::isIpAddress() const {
    return Ipv4::parse(host.toLatin1().toStdString()).has_value();
}

QString ServerAddress::resolved() const {
    if (isIpAddress())
        return host;
    const QHostInfo info = QHostInfo::fromName(host);
    if (info.error() != QHostInfo::NoError) {
        qDebug() << "Lookup failed:" << info.errorString();
        return {};
    }
    const QList<QHostAddress> addresses = info.addresses();
    qDebug() << "-----> IP: " << addresses;
    // The service listens on IPv4; a name may have other addresses in front.
    for (const QHostAddress &address : addresses) {
        if (address.protocol() == QAbstractSocket::IPv4Protocol)
            return address.toString();
    }
    return addresses.isEmpty() ? QString() : addresses.first().toString();
}
