#include "devices/operations/quicksetup/timesyncfields.h"

#include "devices/inventory/devicerecord.h"

#include <QComboBox>
#include <QDateTime>
#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>
#include <QRegularExpression>

#include <nlohmann/json.hpp>

#include <algorithm>

namespace {

constexpr int maxServerLength = 253;
constexpr int hour = 60;
constexpr int intervals[] = {15, 30, hour, 6 * hour, 12 * hour, 24 * hour};
constexpr int maxInterval = 7 * 24 * hour;
enum Mode { Manual, Servers };
constexpr const char *modeWords[] = {"manual", "ntp"};

QString intervalText(int minutes) {
    return minutes % hour == 0 ? TimeSyncFields::tr("Every %n hour(s)", nullptr, minutes / hour)
                               : TimeSyncFields::tr("Every %n minute(s)", nullptr, minutes);
}

/// A host name or an address. Four numbers are an address, and have to be a good one.
bool isServer(const QString &text) {
    static const QRegularExpression numbers(QStringLiteral(R"(\A[\d.]+\z)"));
    static const QRegularExpression names(QStringLiteral(
        R"(\A[A-Za-z0-9]([A-Za-z0-9-]{0,61}[A-Za-z0-9])?(\.[A-Za-z0-9]([A-Za-z0-9-]{0,61}[A-Za-z0-9])?)*\z)"));
    static const QRegularExpression longAddresses(
        QStringLiteral(R"(\A[0-9A-Fa-f]{0,4}(:[0-9A-Fa-f]{0,4}){2,7}\z)"));
    if (numbers.match(text).hasMatch())
        return DeviceRecords::ipSortKey(text) != DeviceRecord::unknownKey;
    return names.match(text).hasMatch() || longAddresses.match(text).hasMatch();
}

/// A number that may have come as a text, as settings do.
int numberOf(const JSON &record, const char *name) {
    const auto found = record.find(name);
    if (found != record.end() && found->is_number_integer())
        return static_cast<int>(std::clamp<std::int64_t>(found->get<std::int64_t>(), 0, maxInterval));
    return std::clamp(stringMember(record, name).toInt(), 0, maxInterval);
}

} // namespace

TimeSyncFields::TimeSyncFields(QWidget *parent) : QWidget(parent), m_mode(new QComboBox(this)) {
    m_mode->setObjectName(QStringLiteral("timeSyncComboBox"));
    m_mode->setAccessibleName(tr("Time synchronization"));
    m_mode->addItems({tr("Set once from this computer"), tr("NTP servers")});
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->addWidget(m_mode);
    layout->addWidget(buildServers());
    connect(m_mode, &QComboBox::currentIndexChanged, this, &TimeSyncFields::showMode);
    showMode();
}

QWidget *TimeSyncFields::buildServers() {
    m_serverPart = new QWidget(this);
    auto *layout = new QGridLayout(m_serverPart);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->setColumnStretch(0, 1);
    layout->setColumnStretch(1, 1);
    for (std::size_t i = 0; i < m_servers.size(); ++i) {
        const auto number = static_cast<int>(i) + 1;
        m_servers[i] = new QLineEdit(m_serverPart);
        m_servers[i]->setObjectName(QStringLiteral("server%1Edit").arg(number));
        m_servers[i]->setAccessibleName(tr("NTP server %1").arg(number));
        m_servers[i]->setPlaceholderText(tr("NTP server %1").arg(number));
        m_servers[i]->setMaxLength(maxServerLength);
        connect(m_servers[i], &QLineEdit::textChanged, this, &TimeSyncFields::edited);
        layout->addWidget(m_servers[i], static_cast<int>(i) / 2, static_cast<int>(i) % 2);
    }
    m_interval = new QComboBox(m_serverPart);
    m_interval->setObjectName(QStringLiteral("intervalComboBox"));
    m_interval->setAccessibleName(tr("Update interval"));
    for (const int minutes : intervals)
        m_interval->addItem(intervalText(minutes), minutes);
    proposeInterval(hour);
    layout->addWidget(m_interval, 2, 1);
    return m_serverPart;
}

void TimeSyncFields::proposeInterval(int minutes) {
    int place = m_interval->findData(minutes);
    if (place < 0) {
        place = m_interval->count();
        m_interval->addItem(intervalText(minutes), minutes);
    }
    m_interval->setCurrentIndex(place);
}

bool TimeSyncFields::isByServers() const {
    return m_mode->currentIndex() == Servers;
}

void TimeSyncFields::showMode() {
    m_serverPart->setVisible(isByServers());
    emit edited();
}

void TimeSyncFields::propose(const JSON &record) {
    if (textMember(record, "d_timesync") == modeWords[Servers])
        m_mode->setCurrentIndex(Servers);
    const auto servers = record.find("d_timeservers");
    if (servers != record.end() && servers->is_array()) {
        for (std::size_t i = 0; i < std::min(servers->size(), m_servers.size()); ++i) {
            const JSON &server = (*servers)[i];
            m_servers[i]->setText(server.is_string() ? QString::fromStdString(server.get<std::string>())
                                                     : QString());
        }
    }
    if (const int minutes = numberOf(record, "d_syncinterval"); minutes > 0)
        proposeInterval(minutes);
}

QString TimeSyncFields::complain(QLineEdit *field, const QString &problem) {
    field->setFocus();
    field->selectAll();
    return problem;
}

QString TimeSyncFields::complain() {
    if (!isByServers())
        return {};
    QStringList named;
    for (QLineEdit *field : m_servers) {
        const QString server = field->text().trimmed().toLower();
        if (server.isEmpty())
            continue;
        if (!isServer(server))
            return complain(field, tr("“%1” is no name or address of a server.").arg(server));
        if (named.contains(server))
            return complain(field, tr("The server “%1” is named twice.").arg(server));
        named += server;
    }
    return named.isEmpty() ? complain(m_servers[0], tr("Name at least one NTP server.")) : QString();
}

void TimeSyncFields::addTo(JSON &settings, const QDateTime &clock) const {
    settings["timesync"] = modeWords[m_mode->currentIndex()];
    if (!isByServers()) {
        settings["date"] = clock.toString(QStringLiteral("yyyy/MM/dd")).toStdString();
        settings["time"] = clock.toString(QStringLiteral("HH:mm:ss")).toStdString();
        return;
    }
    // All five are sent, those without a name last: no server of before stays.
    std::array<std::string, 5> names;
    std::size_t count = 0;
    for (const QLineEdit *field : m_servers) {
        if (const QString server = field->text().trimmed(); !server.isEmpty())
            names[count++] = server.toStdString();
    }
    for (std::size_t i = 0; i < names.size(); ++i)
        settings["server" + std::to_string(i + 1)] = names[i];
    settings["updateInterval"] = m_interval->currentData().toInt();
}
