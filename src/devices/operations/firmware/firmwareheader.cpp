#include "devices/operations/firmware/firmwareheader.h"

#include <QRegularExpression>

#include <algorithm>

namespace {

constexpr const char *mark = "NVLFW1 ";
constexpr qsizetype maxLineLength = 4096;

bool isVersion(const QString &text) {
    static const QRegularExpression form(QStringLiteral("^\\d{1,6}(\\.\\d{1,6}){1,3}\\z"));
    return form.match(text).hasMatch();
}

} // namespace

FirmwareHeader FirmwareHeader::parse(const QByteArray &firstBytes) {
    FirmwareHeader head;
    if (!firstBytes.startsWith(mark))
        return head;
    head.kind = Kind::Broken;
    const qsizetype end = firstBytes.left(maxLineLength).indexOf('\n');
    const QByteArray line = firstBytes.left(end < 0 ? std::min(firstBytes.size(), maxLineLength) : end);
    const QStringList words = QString::fromUtf8(line).simplified().split(u' ');
    if (line.size() >= maxLineLength || words.size() < 3)
        return head;
    head.models = words[1].split(u',');
    head.version = words[2];
    if (!head.models.contains(QString()) && isVersion(head.version))
        head.kind = Kind::Good;
    return head;
}

FirmwareHeader::Fit FirmwareHeader::fitOf(const QString &model) const {
    if (kind != Kind::Good || model == QLatin1String("--"))
        return Fit::Unknown;
    const bool fits = std::any_of(models.begin(), models.end(),
                                  [&](const QString &prefix) { return model.startsWith(prefix); });
    return fits ? Fit::Fits : Fit::OtherModel;
}
