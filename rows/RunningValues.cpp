#include "RunningValues.h"

#include "Differences.h"
#include "EntryOrder.h"
#include "RowFormulas.h"
#include "VariableType.h"

#include <cmath>

namespace kareport
{

void RunningValue::restart()
{
    begin();
    leftOut_ = LeftOut();
}

void RunningValue::begin()
{
    sum_.clear();
    before_.reset();
    row_ = 0;
}

void RunningValue::setValue(UDataObject &object, bool beginsGroup, quint64 row)
{
    if (beginsGroup && perGroup_) {
        begin();
    }
    switch (kind_) {
    case Kind::Sum: setSum(object, row); break;
    case Kind::Difference: setDifference(object); break;
    case Kind::RowNumber: setRowNumber(object); break;
    }
}

void RunningValue::setSum(UDataObject &object, quint64 row)
{
    const auto number = numberOf(object.Find(source_));
    if (number && std::isfinite(*number)) {
        sum_.add(reader_.read(*number));
    } else {
        leftOut_.add(!number, row);
    }
    storeNumber(object, target_.id, reader_.internal(sum_.toDouble()), target_.type == VARIABLE_INTEGER);
}

void RunningValue::setDifference(UDataObject &object)
{
    const auto number = numberOf(object.Find(source_));
    if (!number || !before_) {
        object.Remove(target_.id);
    } else {
        const double difference = reader_.internal(countedDifference(reader_, *number, *before_));
        storeNumber(object, target_.id, difference, target_.type == VARIABLE_INTEGER);
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
