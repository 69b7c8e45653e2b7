#pragma once

#include "CellDecimal.h"
#include "ShapeBinding.h"
#include "ValueParser.h"
#include "sXmlReportField.h"

#include <QString>

#include <optional>

namespace kareport
{

/// A variable of the dictionary of a table.
struct FoundVariable
{
    QString name;
    quint32 id = 0;
    int type = 0;
    CellReader reader; ///< of its values
};

/// Finds the variables that a table step names, and keeps the first thing that is wrong.
class VariableLookup
{
public:
    explicit VariableLookup(const ShapeSurroundings &surroundings) : surroundings_(surroundings) {}

    const ShapeSurroundings &surroundings() const { return surroundings_; }
    /// A variable by its name. One that is not in the dictionary is an error; what comes back then is not used.
    FoundVariable find(const TableShape::Name &name);
    /// The first column of the table that shows a variable; null for none.
    const sXmlReportField *columnOf(const FoundVariable &variable) const;
    /// That column, or one without a width for a variable that the table does not show.
    sXmlReportField fieldOf(const FoundVariable &variable) const;
    /// A value of the job as one of a variable. One that does not fit is an error.
    std::optional<UDictEntry> valueOf(const FoundVariable &variable, const TableShape::Value &value);

    void fail(const JsonPath &path, const QString &text)
    {
        if (!error_) {
            error_ = surroundings_.source.errorAt(path, text);
        }
    }
    const std::optional<InputError> &error() const { return error_; }

private:
    const ShapeSurroundings &surroundings_;
    std::optional<InputError> error_;
};

} // namespace kareport
