#pragma once

#include "JsonSource.h"

#include <QJsonObject>
#include <QString>
#include <QStringList>

#include <optional>

namespace kareport
{

/// What the command line says about the data of the short form: keys of the data set as options.
struct DataOptions
{
    std::optional<QString> delimiter; ///< "tab" means one
    QStringList columns;              ///< names in their order, or VARIABLE=COLUMN, with commas between them
    std::optional<QString> order;
    QStringList units; ///< QUANTITY=UNIT, with commas between them
    std::optional<QString> decimal;
    std::optional<QString> thousands;
    std::optional<QString> encoding;
    std::optional<QString> comment;
    std::optional<int> skip;
    bool hasNoHeader = false;
    bool skipsBlankLines = false;

    bool isEmpty() const { return toJson().isEmpty(); }
    /// What is wrong with the options themselves; nothing when the data set can be asked about their values.
    std::optional<QString> usageError() const;
    /// The keys of the data set.
    QJsonObject toJson() const;
    /// Has messages about the keys name the options. @param set  the key of the data set, with dots
    void nameIn(JsonSource &source, const QString &set) const;
};

} // namespace kareport
