#pragma once

#include "CellDecimal.h"
#include "Differences.h"
#include "UDataObject.h"

#include <optional>
#include <vector>

namespace kareport
{

/// A variable that is computed of others of its row.
struct RowFormula
{
    enum class Kind
    {
        Sum,        ///< of any number of operands
        Difference, ///< the first without the second
        Product,    ///< of two
        Distance,   ///< northing, easting and perhaps elevation of one point, then those of another one
        Bearing     ///< northing and easting of the point that it begins at, then those of the other one
    };
    struct Operand
    {
        quint32 id;
        CellReader reader;
    };
    Kind kind = Kind::Sum;
    std::vector<Operand> operands;
    quint32 target = 0;
    bool isWhole = false;          ///< the target holds whole numbers
    double productFactor = 1;      ///< what a product of numbers of the data is multiplied by to become internal
    int productPerUnit = 1;        ///< what a product of units of the data is counted as
    CellReader result;             ///< of the target
    std::optional<Turn> turn;      ///< of a difference of directions
    std::optional<Turn> direction; ///< of a target that is a direction: what is beyond a whole turn is taken off

    /// Gives a row its value. It has none where an operand is missing.
    void setValue(UDataObject &object);
};

/// Stores a number under an identifier. A whole number that 32 bits do not hold is taken away.
void storeNumber(UDataObject &object, quint32 id, double number, bool isWhole);

} // namespace kareport
