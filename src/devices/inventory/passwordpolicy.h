#pragma once

#include <QString>

#include <vector>

/// The rules that a device holds its accounts' passwords to.
struct PasswordPolicy {
    /// Bits of the mask, in the order of the service and not in that of the dialogs.
    enum Rule { Alphabetic = 1, Special = 2, Numeric = 4, Lowercase = 8, Uppercase = 16, NotUserName = 32 };

    static constexpr int shortest = 8;
    static constexpr int longest = 64;

    int length = 0; ///< the least; 0 where there is no rule about it
    int rules = 0;

    bool operator==(const PasswordPolicy &) const = default;

    bool isEmpty() const { return length == 0 && rules == 0; }
    /// What meets both.
    PasswordPolicy joinedWith(const PasswordPolicy &other) const;
    bool isMetBy(const QString &password, const QString &userName) const;

    /// One of the rules, as a person reads it, and whether a password keeps it.
    struct Line {
        QString text;
        bool met = false;
    };
    /// The rules in the order of the dialogs.
    std::vector<Line> check(const QString &password, const QString &userName) const;
};

namespace Passwords {

/// The characters beside letters and digits that accounts of devices may have in their passwords.
inline const QString symbols = QStringLiteral("!%-.@^_~");

enum class Strength { None, Weak, Fair, Strong };
Strength strengthOf(const QString &password);

/// A password that nobody guesses, of letters, digits and symbols, which meets the policy.
QString generate(const PasswordPolicy &policy, const QString &userName);

} // namespace Passwords
