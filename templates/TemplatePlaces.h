#pragma once

#include "TemplateFile.h"
#include "TextPlace.h"

#include <QHash>
#include <QString>

#include <optional>

namespace kareport
{

/// What part of a template names a variable.
enum class TemplatePart
{
    Table,
    Block,
    SortKey ///< of a table
};

/// Where a template of a file names variables: for the first time in a table, in a block or among the sort keys of a table.
class VariablePlaces
{
public:
    /// Reads the template. @param templateName  without regard to case; of several templates of the name the last one, as for
    ///                                         loading. Without such a template there are no places
    /// @throws std::bad_alloc
    VariablePlaces(const TemplateFile &file, const QString &templateName);

    /// The place of a variable. @param record  the table or block; of several of a name the first one
    /// @return nothing when the variable is not named there
    std::optional<TextPlace> of(TemplatePart part, const QString &record, const QString &variable) const;

private:
    QHash<QString, TextPlace> places_;
};

} // namespace kareport
