#pragma once

#include "DataUnits.h"
#include "NumberStyle.h"
#include "UDictionary.h"

#include <QString>

#include <functional>
#include <optional>
#include <string_view>

namespace kareport
{

/// Reads values of one variable out of texts.
class ValueParser
{
public:
    /// @param type  a value type code, @param id  where the values are stored
    ValueParser(int type, unsigned id, const DataUnits &units);

    unsigned id() const { return id_; }
    /// The value type code that it was made with.
    int type() const { return type_; }

    /// Says how the numbers of the texts are written. Angles have no thousands.
    void setNumberStyle(const NumberStyle &style);

    /// Whether every text fits the type.
    bool takesAnyText() const { return form_ == Form::Text || form_ == Form::PointNumber; }

    /// Whether a text stands for no value: an empty one, and blanks where a text is not what is wanted.
    bool isNone(std::string_view text) const
    {
        // Asked of every cell: nearly all are answered by their first character.
        return text.empty() || ((text.front() == ' ' || text.front() == '\t') && isBlankNumber(text));
    }
    /// Stores the value of a UTF-8 text. One that stands for none leaves the object as it is: another variable may have
    /// the same identifier.
    /// @return whether the text fits the type
    bool store(std::string_view text, UDictionary &object) const { return isNone(text) || storeValue(text, object); }
    /// Stores the value of a text that stands for one.
    bool storeValue(std::string_view text, UDictionary &object) const;
    /// Stores a number that is one already. @return whether it fits the type
    bool storeNumber(double number, UDictionary &object) const;
    /// The same for a whole number, which a text shows with all its digits.
    bool storeInteger(qint64 number, UDictionary &object) const;
    bool storeInteger(quint64 number, UDictionary &object) const;
    bool storeBoolean(bool value, UDictionary &object) const;

    /// What a text of the type looks like, for a message that says what was expected.
    QString expected() const;

private:
    enum class Form
    {
        Whole,
        Text,
        PointNumber,
        Boolean,
        Number,
        Station,
        Offset,
        Thickness,
        Angle,
        Bearing,
        SexagesimalAngle, ///< numbers are degrees, minutes and seconds
        SexagesimalBearing
    };

    bool isBlankNumber(std::string_view text) const;
    bool isAngle() const { return form_ >= Form::Angle; }
    bool storePlain(std::string_view text, UDictionary &object) const;
    bool storeAngle(std::string_view text, UDictionary &object) const;
    template <typename Integer>
    bool storeDigits(Integer number, UDictionary &object) const;

    Form form_;
    int type_;
    unsigned id_;
    double factor_;
    double quarter_;      ///< of a circle in the unit of the data's numbers
    bool isPlain_ = true; ///< numbers, if it reads any, have a decimal point and no thousands
    NumberStyle style_;
};

/// Finds the variable of a column: its parser, or nothing when the dictionary does not know the name.
using FindVariable = std::function<std::optional<ValueParser>(const QString &name)>;

} // namespace kareport
