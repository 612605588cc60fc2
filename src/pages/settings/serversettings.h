#pragma once

#include "platform/json.h"

#include <QStringList>
#include <QVariantMap>

#include <vector>

/// The service's settings as the settings page knows them: what there is, and how values travel.
///
/// Values stand under their keys: a bool for a switch, an int for a number, a QString for a text.
namespace ServerSettings {

enum class Kind { Switch, Number, Text };

struct Setting {
    const char *key;
    Kind kind;
    const char *name; ///< source text of its name in sentences
    int least = 0;
    int most = 0;
};

const std::vector<Setting> &all();
const Setting &setting(const QString &key);
QString name(const QString &key);

struct Reading {
    QVariantMap values;
    bool offersNone = true; ///< the service has nothing that the page knows
    QStringList remarks;    ///< for the user: values that could not be shown as they are
};

/// Reads the settings of the service's object that the page knows. Numbers out of range are brought into it,
/// values of another type converted where that makes sense and left out where not; both are remarked.
Reading read(const JSON &object);
/// The object with which the values are saved.
JSON toJson(const QVariantMap &values);

/// A value in words.
QString valueText(const QVariant &value);

/// The settings that two readings do not agree about, of those that the first one has.
QStringList differences(const QVariantMap &first, const QVariantMap &second);

} // namespace ServerSettings
