#pragma once

#include "CellDecimal.h"
#include "Differences.h"
#include "UDataObject.h"

#include <QString>

#include <optional>
#include <vector>

namespace kareport
{

/// What a row is asked: a value of it is one of some, is there, or lies beyond a limit.
struct RowCondition
{
    enum class Kind
    {
        Is,
        IsNot, ///< none of the values; a missing value is none of them
        Above,
        Below,
        Outside, ///< the limit is exceeded on either side
        Exists,
        Missing
    };
    quint32 id = 0; ///< of the value
    Kind kind = Kind::Exists;
    std::vector<UDictEntry> values; ///< of `Is` and `IsNot`
    double limit = 0;               ///< internal, of the other ones
    std::optional<quint32> beside;  ///< what is compared is by how much the value differs from this one
    CellReader reader;              ///< of both values
    std::optional<Turn> turn;       ///< where both are directions

    /// Whether a row fulfils it. A value that is missing or not-a-number is beyond no limit.
    bool holds(const UDataObject &object);
};

/// A text, or a mark, that a row gets where a condition holds.
struct RowFlag
{
    quint32 target = 0;
    int type = 0; ///< of the target
    QString text; ///< not of a target that is true or false
    RowCondition condition;
};

/// Gives a row its flags. Of several with one target the first one counts whose condition holds; a target without any is taken
/// away, or is false.
void setFlags(std::vector<RowFlag> &flags, UDataObject &object);

} // namespace kareport
