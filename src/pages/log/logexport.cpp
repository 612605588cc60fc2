#include "pages/log/logexport.h"

#include "base/spreadsheetcell.h"

#include <QDebug>
#include <QSaveFile>

namespace LogExport {

namespace {

// Not the order of the table's columns, but what other programs have learnt to read.
constexpr LogColumn fields[] = {LogColumn::Time, LogColumn::Source, LogColumn::Type, LogColumn::Description,
                                LogColumn::User};
constexpr const char *header = "Date/Time,Source,Type,Description,User,\n";
constexpr qsizetype blockSize = 1 << 20;

void append(QByteArray &lines, QString field) {
    field.replace(QLatin1String("\r\n"), QLatin1String(" "));
    field.replace(QLatin1Char('\n'), QLatin1Char(' ')).replace(QLatin1Char('\r'), QLatin1Char(' '));
    field = QString::fromStdString(SpreadsheetCell::harmless(field.toStdString()));
    if (field.contains(QLatin1Char(',')) || field.contains(QLatin1Char('"')))
        field =
            QLatin1Char('"') + field.replace(QLatin1String("\""), QLatin1String("\"\"")) + QLatin1Char('"');
    lines += field.toUtf8() + ',';
}

bool flush(QSaveFile &file, QByteArray &lines) {
    const bool written = file.write(lines) == lines.size();
    lines.clear();
    return written;
}

bool writeLines(QSaveFile &file, const LogList &list, const std::vector<int> &places) {
    QByteArray lines = header;
    for (const int place : places) {
        for (const LogColumn field : fields)
            append(lines, list.at(place).text(field));
        lines += '\n';
        if (lines.size() > blockSize && !flush(file, lines))
            return false;
    }
    return flush(file, lines);
}

} // namespace

bool write(const QString &path, const LogList &list, const std::vector<int> &places,
           const std::function<void()> &opened) {
    QSaveFile file(path);
    if (file.open(QIODevice::WriteOnly)) {
        if (opened)
            opened();
        if (writeLines(file, list, places) && file.commit())
            return true;
    }
    qWarning("The log could not be exported: %s", qUtf8Printable(file.errorString()));
    return false;
}

} // namespace LogExport
