#include "RowConditions.h"

#include "EntryOrder.h"
#include "Measures.h"
#include "VariableType.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

bool isOneOf(const UDictEntry *entry, const std::vector<UDictEntry> &values)
{
    return std::any_of(values.begin(), values.end(),
                       [entry](const UDictEntry &value) { return std::is_eq(compareEntries(entry, &value)); });
}

void setFlag(const RowFlag &flag, UDataObject &object)
{
    switch (flag.type) {
    case VARIABLE_BOOLEAN:
    case VARIABLE_FLAG: object.Set(flag.target, true); break;
    case VARIABLE_NUMBER: object.Set(flag.target, UPointNumber(flag.text)); break;
    default: object.Set(flag.target, flag.text); break;
    }
}

} // namespace

bool RowCondition::holds(const UDataObject &object)
{
    const UDictEntry *entry = object.Find(id);
    switch (kind) {
    case Kind::Is: return isOneOf(entry, values);
    case Kind::IsNot: return !isOneOf(entry, values);
    case Kind::Exists: return entry != nullptr;
    case Kind::Missing: return entry == nullptr;
    default: break;
    }
    std::optional<double> number = numberOf(entry);
    if (number && beside) {
        const auto other = numberOf(object.Find(*beside));
        number =
            other ? std::optional(reader.internal(countedDifference(reader, *number, *other, turn))) : std::nullopt;
    }
    if (!number) {
        return false;
    }
    switch (kind) {
    case Kind::Above: return *number > limit;
    case Kind::Below: return *number < limit;
    default: return std::fabs(*number) > limit;
    }
}

void setFlags(std::vector<RowFlag> &flags, UDataObject &object)
{
    for (std::size_t i = 0; i < flags.size(); ++i) {
        const auto first = flags.begin();
        const auto here = first + static_cast<std::ptrdiff_t>(i);
        const auto isSame = [&](const RowFlag &other) { return other.target == here->target; };
        if (std::any_of(first, here, isSame)) {
            continue; // it was set with the first one of the target
        }
        const auto shown = std::find_if(here, flags.end(),
                                        [&](RowFlag &flag) { return isSame(flag) && flag.condition.holds(object); });
        if (shown != flags.end()) {
            setFlag(*shown, object);
        } else if (here->type == VARIABLE_BOOLEAN || here->type == VARIABLE_FLAG) {
            object.Set(here->target, false);
        } else {
            object.Remove(here->target);
        }
    }
}

} // namespace kareport
