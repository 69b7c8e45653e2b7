#pragma once

#include "CellDecimal.h"
#include "Differences.h"
#include "ShapeBinding.h"
#include "ValueParser.h"
#include "sXmlReportField.h"

#include <QString>

#include <optional>
#include <vector>

namespace kareport
{

/// A variable of the dictionary of a table.
struct FoundVariable
{
    QString name;
    quint32 id = 0;
    int type = 0;
    CellReader reader;        ///< of its values
    std::optional<Turn> turn; ///< of directions
};

/// Finds the variables that a table step names, and keeps the first thing that is wrong.
class VariableLookup
{
public:
    explicit VariableLookup(const ShapeSurroundings &surroundings) : surroundings_(surroundings) {}

    const ShapeSurroundings &surroundings() const { return surroundings_; }
    /// A variable by its name. One that is not in the dictionary is an error; what comes back then is not used.
    FoundVariable find(const TableShape::Name &name);
    /// Says that the step sets a variable. @param stage  of what is carried out, from 0: the first of them counts
    void addSet(const QString &variable, int stage);
    /// Says which stage asks for variables next.
    void goTo(int stage) { stage_ = stage; }
    /// Fails where the step sets a variable in this stage or later only: it has no value yet.
    void expectSet(const TableShape::Name &name, const FoundVariable &variable);
    /// Whether the step sets a variable.
    bool isSet(quint32 id) const { return setAt(id) != nullptr; }
    /// The variables that were asked for and that the step does not set, each once.
    QStringList needed() const;
    /// The first column of the table that shows a variable; null for none.
    const sXmlReportField *columnOf(const FoundVariable &variable) const;
    /// That column, or one without a width for a variable that the table does not show.
    sXmlReportField fieldOf(const FoundVariable &variable) const;
    /// What a marker before that column says of offsets: "R", "+", or nothing.
    QString suffixOf(const FoundVariable &variable) const;
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
    struct Set
    {
        quint32 id;
        int stage;
    };

    std::optional<FoundVariable> known(const QString &name) const;
    const Set *setAt(quint32 id) const;

    const ShapeSurroundings &surroundings_;
    std::vector<Set> sets_;
    std::vector<FoundVariable> found_; ///< each once
    int stage_ = 0;
    std::optional<InputError> error_;
};

} // namespace kareport
