#pragma once

#include "DataUnits.h"
#include "InputError.h"
#include "JsonSource.h"
#include "ShownRows.h"
#include "TableShape.h"
#include "UJobSettings.h"
#include "UXmlReportTpl.h"

#include <QStringList>

#include <optional>
#include <vector>

namespace kareport
{

/// What a table step asks for, with the names looked up.
struct BoundShape
{
    RowShape rows;
    std::vector<unsigned> sortIds; ///< of the step's own sort keys; none where it has no such keys
    QStringList needed;            ///< the variables of the data that the step names
};

/// What the names of a table step are looked up in.
struct ShapeSurroundings
{
    const JsonSource &source; ///< the job, for the places of errors
    const UXmlReportTpl &reportTemplate;
    const sXmlReportTable &table;
    const DataUnits &units; ///< of the data's numbers
    const UJobSettings &settings;
};

/// Looks up the names of a table step. @return what is wrong with one of them, or with what is asked of it
Expected<BoundShape> bindShape(const TableShape &shape, const ShapeSurroundings &surroundings);

} // namespace kareport
