#include "RunningValues.h"

#include "EntryOrder.h"
#include "RowFormulas.h"
#include "VariableType.h"

#include <cmath>

namespace kareport
{

void RunningValue::restart()
{
    sum_.clear();
    before_.reset();
    row_ = 0;
}

void RunningValue::setValue(UDataObject &object, bool beginsGroup)
{
    if (beginsGroup && perGroup_) {
        restart();
    }
    switch (kind_) {
    case Kind::Sum: setSum(object); break;
    case Kind::Difference: setDifference(object); break;
    case Kind::RowNumber: setRowNumber(object); break;
    }
}

void RunningValue::setSum(UDataObject &object)
{
    const auto number = numberOf(object.Find(source_));
    if (number && std::isfinite(*number)) {
        sum_.add(reader_.read(*number));
    }
    storeNumber(object, target_.id, sum_.toDouble() * reader_.factor(), target_.type == VARIABLE_INTEGER);
}

void RunningValue::setDifference(UDataObject &object)
{
    const auto number = numberOf(object.Find(source_));
    if (!number || !before_) {
        object.Remove(target_.id);
    } else if (!std::isfinite(*number) || !std::isfinite(*before_)) {
        storeNumber(object, target_.id, *number - *before_, target_.type == VARIABLE_INTEGER);
    } else {
        DecimalSum difference;
        difference.add(reader_.read(*number));
        CellDecimal before = reader_.read(*before_);
        before.digits = -before.digits;
        difference.add(before);
        storeNumber(object, target_.id, difference.toDouble() * reader_.factor(), target_.type == VARIABLE_INTEGER);
    }
    before_ = number;
}

void RunningValue::setRowNumber(UDataObject &object)
{
    ++row_;
    switch (target_.type) {
    case VARIABLE_TEXT:
    case VARIABLE_NAME: object.Set(target_.id, QString::number(row_)); break;
    case VARIABLE_NUMBER: object.Set(target_.id, UPointNumber(QString::number(row_))); break;
    default: storeNumber(object, target_.id, static_cast<double>(row_), target_.type == VARIABLE_INTEGER); break;
    }
}

} // namespace kareport
