#include "devices/inventory/passwordpolicy.h"

#include <QCoreApplication>
#include <QRandomGenerator>
#include <QSet>

#include <algorithm>
#include <cmath>

namespace {

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(PasswordPolicy)
};

bool isLower(QChar c) {
    return c >= u'a' && c <= u'z';
}
bool isUpper(QChar c) {
    return c >= u'A' && c <= u'Z';
}
bool isLetter(QChar c) {
    return isLower(c) || isUpper(c);
}
bool isDigit(QChar c) {
    return c >= u'0' && c <= u'9';
}
bool isSymbol(QChar c) {
    return Passwords::symbols.contains(c);
}

template <typename Test>
bool hasAny(const QString &password, Test test) {
    return std::any_of(password.begin(), password.end(), test);
}

bool keeps(PasswordPolicy::Rule rule, const QString &password, const QString &userName) {
    switch (rule) {
    case PasswordPolicy::Alphabetic:
        return hasAny(password, &isLetter);
    case PasswordPolicy::Special:
        return hasAny(password, &isSymbol);
    case PasswordPolicy::Numeric:
        return hasAny(password, &isDigit);
    case PasswordPolicy::Lowercase:
        return hasAny(password, &isLower);
    case PasswordPolicy::Uppercase:
        return hasAny(password, &isUpper);
    case PasswordPolicy::NotUserName:
        return userName.isEmpty() || password.compare(userName, Qt::CaseInsensitive) != 0;
    }
    return false;
}

QString textOf(PasswordPolicy::Rule rule) {
    switch (rule) {
    case PasswordPolicy::Alphabetic:
        return Texts::tr("At least one alphabetic character");
    case PasswordPolicy::Special:
        return Texts::tr("At least one of these special characters: %1").arg(Passwords::symbols);
    case PasswordPolicy::Numeric:
        return Texts::tr("At least one numeric character");
    case PasswordPolicy::Lowercase:
        return Texts::tr("At least one lowercase character");
    case PasswordPolicy::Uppercase:
        return Texts::tr("At least one uppercase character");
    case PasswordPolicy::NotUserName:
        return Texts::tr("Not the same as the username");
    }
    return {};
}

constexpr PasswordPolicy::Rule shownRules[] = {PasswordPolicy::Alphabetic, PasswordPolicy::Numeric,
                                               PasswordPolicy::Special,    PasswordPolicy::Uppercase,
                                               PasswordPolicy::Lowercase,  PasswordPolicy::NotUserName};

/// Those that look like another one are left out: passwords are read aloud and typed at devices.
constexpr auto lowers = "abcdefghijkmnopqrstuvwxyz";
constexpr auto uppers = "ABCDEFGHJKLMNPQRSTUVWXYZ";
constexpr auto digits = "23456789";
constexpr int generatedLength = 16;

QChar oneOf(const QString &characters) {
    return characters.at(QRandomGenerator::system()->bounded(static_cast<int>(characters.size())));
}

} // namespace

PasswordPolicy PasswordPolicy::joinedWith(const PasswordPolicy &other) const {
    return {std::max(length, other.length), rules | other.rules};
}

bool PasswordPolicy::isMetBy(const QString &password, const QString &userName) const {
    return password.size() >= length &&
           std::all_of(std::begin(shownRules), std::end(shownRules),
                       [&](Rule rule) { return (rules & rule) == 0 || keeps(rule, password, userName); });
}

std::vector<PasswordPolicy::Line> PasswordPolicy::check(const QString &password,
                                                        const QString &userName) const {
    std::vector<Line> lines;
    if (length > 0)
        lines.push_back({Texts::tr("At least %n character(s)", nullptr, length), password.size() >= length});
    for (const Rule rule : shownRules) {
        if (rules & rule)
            lines.push_back({textOf(rule), !password.isEmpty() && keeps(rule, password, userName)});
    }
    return lines;
}

/// By the guesses that somebody needs who knows which characters and how many of them there are.
Passwords::Strength Passwords::strengthOf(const QString &password) {
    if (password.isEmpty())
        return Strength::None;
    int pool = 0;
    pool += hasAny(password, &isLower) ? 26 : 0;
    pool += hasAny(password, &isUpper) ? 26 : 0;
    pool += hasAny(password, &isDigit) ? 10 : 0;
    pool += hasAny(password, &isSymbol) ? static_cast<int>(symbols.size()) : 0;
    // A character that comes again, or follows the one before it in the alphabet, adds little.
    double counted = 0;
    for (qsizetype i = 0; i < password.size(); ++i) {
        const int step = i == 0 ? 100 : password[i].unicode() - password[i - 1].unicode();
        counted += std::abs(step) <= 1 || password.left(i).contains(password[i]) ? 0.4 : 1.0;
    }
    const double bits = counted * std::log2(std::max(pool, 2));
    return bits < 45 ? Strength::Weak : bits < 65 ? Strength::Fair : Strength::Strong;
}

QString Passwords::generate(const PasswordPolicy &policy, const QString &userName) {
    const QString groups[] = {QLatin1String(lowers), QLatin1String(uppers), QLatin1String(digits), symbols};
    const int length = std::clamp(policy.length, generatedLength, PasswordPolicy::longest);
    QString password;
    do {
        password.clear();
        for (const QString &group : groups)
            password += oneOf(group);
        while (password.size() < length)
            password += oneOf(groups[0] + groups[1] + groups[2] + symbols);
        std::shuffle(password.begin(), password.end(), *QRandomGenerator::system());
    } while (!policy.isMetBy(password, userName));
    return password;
}
