#pragma once

#include <QTranslator>

/// Gives the program's own texts their English plurals: "%n device(s)" reads "1 device" or "2 devices".
class PluralTranslator : public QTranslator {
    Q_OBJECT

public:
    using QTranslator::QTranslator;

    bool isEmpty() const override { return false; }
    QString translate(const char *context, const char *sourceText, const char *disambiguation,
                      int n) const override;
};
