#include "widgets/controls/iplineedit.h"

#include <QValidator>

#include <algorithm>

namespace {

constexpr qsizetype partCount = 4;

class AddressValidator : public QValidator {
public:
    using QValidator::QValidator;

    State validate(QString &input, int &position) const override {
        const auto isBlank = [](QChar c) { return c.isSpace(); };
        const auto cursor = input.begin() + std::min<qsizetype>(position, input.size());
        position -= static_cast<int>(std::count_if(input.begin(), cursor, isBlank));
        input.removeIf(isBlank);
        const QStringList parts = input.split(QLatin1Char('.'));
        if (parts.size() > partCount || !std::all_of(parts.begin(), parts.end(), &AddressValidator::isPart))
            return Invalid;
        return parts.size() == partCount && !parts.contains(QString()) ? Acceptable : Intermediate;
    }

private:
    /// Whether a number can still be made of the text.
    static bool isPart(const QString &text) {
        const bool digits =
            std::all_of(text.begin(), text.end(), [](QChar c) { return c >= u'0' && c <= u'9'; });
        return digits && text.size() <= 3 && text.toInt() <= 255;
    }
};

} // namespace

IPLineEdit::IPLineEdit(QWidget *parent) : QLineEdit(parent) {
    setValidator(new AddressValidator(this));
    connect(this, &QLineEdit::textChanged, this, [this] {
        if (std::exchange(m_wasValid, isValid()) != isValid())
            emit validityChanged(isValid());
    });
}

QString IPLineEdit::address() const {
    if (!isValid())
        return {};
    QStringList numbers;
    for (const QString &part : text().split(QLatin1Char('.')))
        numbers += QString::number(part.toInt());
    return numbers.join(QLatin1Char('.'));
}
