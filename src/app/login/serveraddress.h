#pragma once

#include <QString>

#include <optional>

/// A server as the user names it: "IP:Port/Domain Name" text.
struct ServerAddress {
    static constexpr quint16 defaultPort = 8079;

    QString host; ///< IPv4 address or host name, at most 127 characters
    quint16 port = defaultPort;

    /// Reads such a text. Nothing for an empty or overlong host, a port outside 1 to 65535, or anything
    /// behind the port.
    static std::optional<ServerAddress> parse(const QString &text);

    /// Under which its key is remembered: host and port in lower case, however they were typed.
    QString keyName() const { return host.toLower() + QLatin1Char(':') + QString::number(port); }

    /// True for a dotted IPv4 address, which needs no look-up.
    bool isIpAddress() const;

    /// The address to connect to: the host itself, or the first one that its name has. A failed look-up is
    /// logged and yields nothing, which no request is sent to. Blocks for a name; any thread.
    QString resolved() const;
};
