#include "pages/settings/serversettings.h"

#include "api/client/settingvalue.h"

#include <QCoreApplication>

#include <nlohmann/json.hpp>

#include <algorithm>

namespace ServerSettings {

namespace {

constexpr qsizetype maxShownValueLength = 60;
constexpr auto logDaysKey = "log_keepdays";
constexpr auto logDaysAlias = "days";
constexpr auto uploadLimitSwitchKey = "svr_fw_upload_limit_enabled";

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(ServerSettings)
};

const JSON *find(const JSON &object, const char *key) {
    auto found = object.find(key);
    if (found == object.end() && key == std::string_view(logDaysKey))
        found = object.find(logDaysAlias);
    return found == object.end() ? nullptr : &*found;
}

QString rawText(const JSON &value) {
    const QString text = QString::fromStdString(dumpJson(value));
    return text.size() > maxShownValueLength ? text.left(maxShownValueLength) + QChar(0x2026) : text;
}

template <typename Value>
QVariant variantOf(const std::optional<Value> &value) {
    return value ? QVariant(*value) : QVariant();
}

/// What the controls show of a value; nothing where its type makes no sense.
QVariant shownValue(const JSON &value, const Setting &setting) {
    switch (setting.kind) {
    case Kind::Switch:
        return variantOf(SettingValue::toSwitch(value));
    case Kind::Number:
        return variantOf(SettingValue::toNumber(value, setting.least, setting.most));
    case Kind::Text:
        break;
    }
    if (value.is_string())
        return QString::fromStdString(value.get<std::string>());
    return value.is_primitive() && !value.is_null() ? QVariant(rawText(value)) : QVariant();
}

JSON jsonValue(const QVariant &value, Kind kind) {
    switch (kind) {
    case Kind::Switch:
        return value.toBool();
    case Kind::Number:
        return value.toInt();
    case Kind::Text:
        break;
    }
    return value.toString().toStdString();
}

/// True where the page shows the very value that the service has.
bool isAsSent(const JSON &raw, const QVariant &shown, Kind kind) {
    // 30 and 30.0 are the same number and not the same type.
    return shown.isValid() && jsonValue(shown, kind) == raw &&
           (kind != Kind::Number || raw.is_number_integer());
}

QString remark(const Setting &setting, const JSON &raw, const QVariant &shown) {
    const QString name = Texts::tr(setting.name);
    if (!shown.isValid())
        return Texts::tr("%1: the server's value %2 cannot be shown.").arg(name, rawText(raw));
    return Texts::tr("%1: the server has %2, shown is %3.").arg(name, rawText(raw), valueText(shown));
}

} // namespace

const std::vector<Setting> &all() {
    static const std::vector<Setting> settings = {
        {"nf_alarms", Kind::Switch, QT_TRANSLATE_NOOP("ServerSettings", "Notification banners for alarms")},
        {"nf_tasks", Kind::Switch, QT_TRANSLATE_NOOP("ServerSettings", "Notification banners for tasks")},
        {"ui_lang", Kind::Text, QT_TRANSLATE_NOOP("ServerSettings", "Language")},
        {logDaysKey, Kind::Number, QT_TRANSLATE_NOOP("ServerSettings", "Number of days to keep logs"), 1,
         1095},
        {"rp_download_path", Kind::Text, QT_TRANSLATE_NOOP("ServerSettings", "Default File Location")},
        {"rp_auto", Kind::Switch, QT_TRANSLATE_NOOP("ServerSettings", "Automatic restore points")},
        {"rp_keepnum", Kind::Number,
         QT_TRANSLATE_NOOP("ServerSettings", "Number of automatic restore points to keep"), 1, 9999},
        {uploadLimitSwitchKey, Kind::Switch,
         QT_TRANSLATE_NOOP("ServerSettings", "Limit of firmware uploads")},
        {"svr_fw_upload_limit", Kind::Number,
         QT_TRANSLATE_NOOP("ServerSettings", "Number of simultaneous firmware uploads"),
         SettingValue::minUploads, SettingValue::maxUploads}};
    return settings;
}

const Setting &setting(const QString &key) {
    return *std::find_if(all().begin(), all().end(),
                         [&](const Setting &each) { return key == QLatin1String(each.key); });
}

QString name(const QString &key) {
    return Texts::tr(setting(key).name);
}

Reading read(const JSON &object) {
    Reading reading;
    // An older service has no such switch, and no limit then.
    reading.values[QLatin1String(uploadLimitSwitchKey)] = false;
    if (!object.is_object())
        return reading;
    for (const Setting &each : all()) {
        const JSON *raw = find(object, each.key);
        if (!raw)
            continue;
        reading.offersNone = false;
        const QVariant shown = shownValue(*raw, each);
        if (shown.isValid())
            reading.values[QLatin1String(each.key)] = shown;
        if (!isAsSent(*raw, shown, each.kind))
            reading.remarks += remark(each, *raw, shown);
    }
    return reading;
}

JSON toJson(const QVariantMap &values) {
    JSON object = JSON::object();
    for (auto value = values.begin(); value != values.end(); ++value)
        object[value.key().toStdString()] = jsonValue(value.value(), setting(value.key()).kind);
    return object;
}

QString valueText(const QVariant &value) {
    if (value.typeId() == QMetaType::Bool)
        return value.toBool() ? Texts::tr("on") : Texts::tr("off");
    const QString text = value.toString();
    return text.isEmpty() ? Texts::tr("(empty)") : text;
}

QStringList differences(const QVariantMap &first, const QVariantMap &second) {
    QStringList keys;
    for (const Setting &each : all()) {
        const QString key = QLatin1String(each.key);
        if (first.contains(key) && second.contains(key) && first.value(key) != second.value(key))
            keys += key;
    }
    return keys;
}

} // namespace ServerSettings
