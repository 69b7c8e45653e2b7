#pragma once

#include <QByteArray>
#include <QTemporaryDir>

/// A locale with a decimal comma, which this process has for numbers while this lives: one of the system or, where it has none,
/// one that is made for it. Programs that this one starts find it by its name.
class CommaLocale
{
public:
    CommaLocale();
    ~CommaLocale();
    CommaLocale(const CommaLocale &) = delete;
    CommaLocale &operator=(const CommaLocale &) = delete;

    /// Whether there is one.
    bool isThere() const { return !name_.isEmpty(); }
    const QByteArray &name() const { return name_; }

private:
    bool take(const char *name);

    QTemporaryDir folder_;
    QByteArray before_;
    QByteArray pathBefore_;
    QByteArray name_;
};
