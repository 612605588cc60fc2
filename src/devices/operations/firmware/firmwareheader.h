#pragma once

#include <QByteArray>
#include <QString>
#include <QStringList>

/// What a firmware image says of itself in its first line:
///     NVLFW1 <model prefix>[,<model prefix>...] <version>
/// An image that does not begin like that is none the worse; only the devices can judge it.
struct FirmwareHeader {
    enum class Kind { None, Good, Broken };
    enum class Fit { Unknown, Fits, OtherModel };

    Kind kind = Kind::None;
    QStringList models; ///< beginnings of the names of the models that it is for
    QString version;

    static FirmwareHeader parse(const QByteArray &firstBytes);
    Fit fitOf(const QString &model) const;
};
