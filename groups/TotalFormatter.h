#pragma once

#include "ColumnTotal.h"
#include "FieldFormatter.h"
#include "TableGroups.h"
#include "TextBuffer.h"
#include "UDictEntry.h"

#include <QStringView>

#include <optional>

namespace kareport
{

/// Shows the totals of a variable in a field, with the decimals and the unit of the values in it.
class TotalFormatter
{
public:
    /// @param field    of the variable, @param options  must outlive the object
    /// @param ratio    from the unit that was added to the one that is shown
    TotalFormatter(const sXmlReportField &field, const FormatOptions &options, UnitRatio ratio);

    /// Appends a total. Where there are no values, a sum and a count are 0 and any other total is blank.
    /// @param suffix  as for `FieldFormatter::append`
    Shown append(TextBuffer &out, const ColumnTotal &total, TotalKind kind, QStringView suffix) const;
    /// Appends the blanks of an empty cell.
    void appendBlank(TextBuffer &out) const;
    /// Appends a line under the column.
    void appendRule(TextBuffer &out) const;

private:
    Shown appendExtreme(TextBuffer &out, double value, QStringView suffix) const;
    Shown appendCount(TextBuffer &out, quint64 count) const;
    Shown appendRounded(TextBuffer &out, const RoundedDecimal &number, QStringView suffix) const;
    Shown appendText(TextBuffer &out, const QString &text) const;
    QString longText(const RoundedDecimal &number, QStringView suffix) const;

    sXmlReportField field_;
    const FormatOptions &options_;
    UnitRatio ratio_;
    UJobSettings shownSettings_; ///< for numbers that are in the shown units already
    FieldFormatter values_;
    FieldFormatter texts_;
    FieldFormatter counts_;
    int decimals_;
};

/// Adds the values of a row to totals, as exact numbers.
class TotalledCell
{
public:
    /// @param addsPrinted  the digits that the field shows are added, in the unit that is shown
    TotalledCell(const TotalledVariable &variable, const FormatOptions &options, bool addsPrinted);

    /// What a value is for a total.
    enum class State
    {
        Missing,
        NotFinite,
        Number,
        Text, ///< anything that only counts
        Long  ///< a number with more printed digits than a `CellDecimal` has
    };
    struct Value
    {
        State state = State::Missing;
        double value = 0; ///< internal
        CellDecimal number;
    };
    Value read(const UDictEntry *entry);
    void add(ColumnTotal &total, const Value &value) const;
    /// A total as an internal value. Nothing for a count, and where there is no value.
    std::optional<double> internal(const ColumnTotal &total, TotalKind kind) const;

private:
    double shown(double value) const;

    CellReader reader_;
    const FormatOptions &options_;
    int type_;
    bool addsPrinted_;
    int decimals_;
};

/// How many decimals a field shows of the numbers of its type.
int shownDecimals(const sXmlReportField &field, const UJobSettings &settings);

} // namespace kareport
