#pragma once

#include "DataRemarks.h"
#include "InputError.h"
#include "UXmlReportTpl.h"

#include <QHash> // std::hash<QString>
#include <QString>

#include <optional>
#include <unordered_map>
#include <vector>

namespace kareport
{

/// How the values of a field fit the field.
struct FieldFit
{
    QString variable;
    QString label;
    int type = 0;             ///< a `VARIABLE_TYPE`
    qint32 width = 0;         ///< of the column, in characters
    bool isLabelWide = false; ///< the label is wider than the format says
    WidestText widest;        ///< the widest value, without the blanks that fill the column
    quint64 row = 0;          ///< of the widest value in the order that is printed, from 1; 0 for none
    qint64 line = 0;          ///< of the report, from 1
    quint64 tooWide = 0;      ///< how many values are wider than the column

    bool fits() const { return tooWide == 0; }
};

/// How the data of a step fits the table or the block that it is written through.
struct StepFit
{
    bool isTable = false;
    QString name;     ///< of the table or the block
    QString data;     ///< the name of the data set
    InputError place; ///< where the step is, without a text
    quint64 rows = 0;
    std::vector<FieldFit> fields; ///< in the order that they are printed in
};

/// The widths that the formats of a template's fields say: columns that are widened by their labels do not show them.
class FormatWidths
{
public:
    /// Reads the template of a name in a file, as it is loaded. A file that cannot be read has no formats.
    FormatWidths(const QString &path, const QString &name);

    /// The width of the field of a variable; nothing where the field has no format.
    /// @param occurrence  0 for the first field of the variable, 1 for the second one, ...
    std::optional<qint32> widthOf(bool isTable, const QString &output, const QString &variable,
                                  std::size_t occurrence) const;

private:
    using Widths = std::vector<std::pair<QString, std::optional<qint32>>>; ///< by the folded name of the variable

    std::unordered_map<QString, Widths> tables_; ///< by the folded name
    std::unordered_map<QString, Widths> blocks_;
};

/// How the table or block fits that was written last.
/// @param fields   of the table or block, in the order that they were written in
/// @param remarks  on it, with the widest values
std::vector<FieldFit> fieldFits(bool isTable, const QString &name, const sXmlReportFields &fields,
                                const DataRemarks &remarks, const FormatWidths &widths);

} // namespace kareport
