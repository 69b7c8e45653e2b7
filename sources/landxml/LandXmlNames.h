#pragma once

#include "InputError.h"

#include <QString>
#include <QStringList>

#include <optional>
#include <string>

namespace kareport
{

/// A name that a query asks for, while the names of a file go by. A name that is misspelt would otherwise give a list without
/// rows, and without a reason.
class LandXmlNames
{
public:
    /// @param wanted  empty where all names are
    explicit LandXmlNames(QString wanted) : wanted_(std::move(wanted)) {}

    /// Whether a name of the file is wanted.
    bool matches(const std::string &name);
    /// What is wrong when all names went by and none was the one.
    /// @param path  of the file
    std::optional<InputError> error(const QString &path) const;

private:
    static constexpr qsizetype most = 10; ///< names in a message

    QString wanted_;
    bool isFound_ = false;
    QStringList others_; ///< one more than are told, where there are more
};

} // namespace kareport
