#pragma once

#include "InputError.h"

#include <QSet>
#include <QString>
#include <QStringList>

#include <optional>
#include <string>

namespace kareport
{

/// A name that a query asks for, compared with the names of a file as they are read. A misspelt name would otherwise give a
/// list without rows, and without a reason.
class LandXmlNames
{
public:
    /// What has the name.
    enum class Of
    {
        Group,
        Surface,
        Parcel,
        Alignment,
        GradeLine
    };

    /// @param wanted  empty where all names are
    LandXmlNames(Of of, QString wanted) : of_(of), wanted_(std::move(wanted)) {}

    /// Whether a name of the file is wanted.
    bool matches(const std::string &name);
    /// What is wrong when none of all names was the one that is wanted.
    /// @param path  of the file
    std::optional<InputError> error(const QString &path) const;

private:
    static constexpr qsizetype mostShown = 10;      ///< names in a message
    static constexpr qsizetype mostCompared = 1000; ///< names among which the nearest is sought

    QString missing() const;

    Of of_;
    QString wanted_;
    bool isFound_ = false;
    QStringList others_;
    QSet<QString> known_; ///< the others
};

} // namespace kareport
