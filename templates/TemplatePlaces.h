#pragma once

#include "KaReportExport.h"
#include "TemplateFile.h"
#include "TextPlace.h"

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

/// Where a template of a file names a variable for the first time in a table, in a block or among the sort keys of a table.
/// @param templateName  without regard to case; of several templates of the name the last one, as for loading
/// @param record        the table or block
/// @return nothing when the variable is not named there
/// @throws std::bad_alloc
KAREPORT_EXPORT std::optional<TextPlace> placeOfVariable(const TemplateFile &file, const QString &templateName,
                                                         TemplatePart part, const QString &record,
                                                         const QString &variable);

} // namespace kareport
