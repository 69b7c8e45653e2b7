#include "JobSteps.h"

#include "TextFolding.h"
#include "UXmlReportTpl.h"
#include "Xlate.h"

#include <algorithm>

// What the steps of a job note on the values that they wrote.

namespace kareport
{

namespace
{

/// What is said of a value, and of several.
struct ValueSentences
{
    QString one;
    QString several;
};

ValueSentences wideSentences()
{
    return {Xlate("%1 value is wider than the field \"%2\" of the %3 \"%4\", in row %5, line %6 of the report"),
            Xlate("%1 values are wider than the field \"%2\" of the %3 \"%4\", the first one in row %5, line %6 of the "
                  "report")};
}

ValueSentences hashSentences()
{
    return {Xlate("%1 value is wider than the field \"%2\" of the %3 \"%4\" and shows as #, in row %5, line %6 of the "
                  "report"),
            Xlate("%1 values are wider than the field \"%2\" of the %3 \"%4\" and show as #, the first one in row %5, "
                  "line %6 of the report")};
}

ValueSentences wideTotalSentences()
{
    return {Xlate("%1 total is wider than the field \"%2\" of the %3 \"%4\", under row %5, line %6 of the report"),
            Xlate("%1 totals are wider than the field \"%2\" of the %3 \"%4\", the first one under row %5, line %6 of "
                  "the report")};
}

ValueSentences hashTotalSentences()
{
    return {Xlate("%1 total is wider than the field \"%2\" of the %3 \"%4\" and shows as #, under row %5, line %6 of "
                  "the report"),
            Xlate("%1 totals are wider than the field \"%2\" of the %3 \"%4\" and show as #, the first one under row "
                  "%5, line %6 of the report")};
}

ValueSentences infiniteSentences()
{
    return {
        Xlate("%1 value of the field \"%2\" of the %3 \"%4\" is infinite or not a number, in row %5, line %6 of the "
              "report"),
        Xlate("%1 values of the field \"%2\" of the %3 \"%4\" are infinite or not a number, the first one in row %5, "
              "line %6 of the report")};
}

ValueSentences zeroSentences()
{
    return {Xlate("%1 value of the field \"%2\" of the %3 \"%4\" is missing and shows as 0, in row %5, line %6 of the "
                  "report"),
            Xlate("%1 values of the field \"%2\" of the %3 \"%4\" are missing and show as 0, the first one in row %5, "
                  "line %6 of the report")};
}

ValueSentences blankSentences()
{
    return {
        Xlate("%1 value of the field \"%2\" of the %3 \"%4\" is missing and shows as blanks, in row %5, line %6 of the "
              "report"),
        Xlate("%1 values of the field \"%2\" of the %3 \"%4\" are missing and show as blanks, the first one in row "
              "%5, line %6 of the report")};
}

ValueSentences missingInTotals()
{
    return {
        Xlate("%1 value of the variable \"%2\" is missing and in no total of the table \"%3\", in row %4"),
        Xlate(
            "%1 values of the variable \"%2\" are missing and in no total of the table \"%3\", the first one in row %4")};
}

ValueSentences infiniteInTotals()
{
    return {
        Xlate("%1 value of the variable \"%2\" is infinite or not a number and in no total of the table \"%3\", in row "
              "%4"),
        Xlate("%1 values of the variable \"%2\" are infinite or not a number and in no total of the table \"%3\", the "
              "first one in row %4")};
}

ValueSentences missingInRunningSums()
{
    return {Xlate("%1 value of the variable \"%2\" is missing and in no running sum of the table \"%3\", in row %4"),
            Xlate("%1 values of the variable \"%2\" are missing and in no running sum of the table \"%3\", the first "
                  "one in row %4")};
}

ValueSentences infiniteInRunningSums()
{
    return {Xlate("%1 value of the variable \"%2\" is infinite or not a number and in no running sum of the table "
                  "\"%3\", in row %4"),
            Xlate("%1 values of the variable \"%2\" are infinite or not a number and in no running sum of the table "
                  "\"%3\", the first one in row %4")};
}

} // namespace

/// Notes which values of a table or block that was written do not show as they are.
JobSteps::Wrong JobSteps::noteValues(RowList &rows, const std::optional<SourceColumns> &columns,
                                     const WrittenRecord &record)
{
    const QStringList variables = columns ? columns->variables : QStringList();
    const QSet<QString> read(variables.begin(), variables.end());
    Wrong wrong;
    for (const ColumnRemarks &column : notes_.remarks.columns) {
        const bool isRead = !columns || read.contains(foldedKey(column.variable));
        wrong = firstOf(wrong, noteValue(column, isRead, rows, record));
    }
    return wrong;
}

JobSteps::Wrong JobSteps::noteValue(const ColumnRemarks &column, bool isRead, RowList &rows,
                                    const WrittenRecord &record)
{
    using Kind = JobNote::Kind;
    Wrong wrong;
    const auto add = [&](Kind kind, const ValueCount &values, const QString &text) {
        JobNote found = {kind, source_.errorAt(record.path, text), values.firstLine, values.count, values.firstRow};
        if (&values != &column.wideTotals) { // a total has no place in the data
            const auto place = rows.placeOf(static_cast<std::size_t>(values.firstRow) - 1, column.variable);
            found.dataFile = place.file;
            found.dataPlace = place.place;
        }
        wrong = firstOf(wrong, notes_.add({found}));
    };
    const auto note = [&](Kind kind, const ValueCount &values, const ValueSentences &sentences) {
        if (values.count > 0) {
            const QString &sentence = values.count == 1 ? sentences.one : sentences.several;
            add(kind, values,
                sentence.arg(QString::number(values.count), column.variable, record.what, record.name,
                             QString::number(values.firstRow), QString::number(values.firstLine)));
        }
    };
    const bool hasHash = job_.options.printHash;
    note(Kind::WideValue, column.tooWide, hasHash ? hashSentences() : wideSentences());
    note(Kind::WideValue, column.wideTotals, hasHash ? hashTotalSentences() : wideTotalSentences());
    note(Kind::NotFinite, column.notFinite, infiniteSentences());
    // Of a field that no column fills there is a note already.
    if (isRead) {
        note(Kind::MissingValue, column.missing, zeroSentences());
        note(Kind::BlankValue, column.blank, blankSentences());
        if (column.unwritten.count > 0) {
            add(column.isBlankAsked ? Kind::BlankValue : Kind::MissingValue, column.unwritten,
                Xlate("the field \"%1\" of the %2 \"%3\" has no value: its line is left out")
                    .arg(column.variable, record.what, record.name));
        }
    }
    return wrong;
}

/// Notes which values are in no total, and in no running sum, of a table that was written.
JobSteps::Wrong JobSteps::noteLeftOut(ShownRows &rows, const WrittenRecord &record)
{
    Wrong wrong;
    const auto note = [&](const QString &variable, quint64 count, quint64 firstRow, const ValueSentences &sentences) {
        if (count == 0) {
            return;
        }
        const QString text = (count == 1 ? sentences.one : sentences.several)
                                 .arg(QString::number(count), variable, record.name, QString::number(firstRow));
        JobNote found = {JobNote::Kind::NotInTotal, source_.errorAt(record.path, text), 0, count, firstRow};
        const auto place = rows.placeOf(static_cast<std::size_t>(firstRow) - 1, variable);
        found.dataFile = place.file;
        found.dataPlace = place.place;
        wrong = firstOf(wrong, notes_.add({found}));
    };
    const auto &variables = rows.groups().variables;
    for (std::size_t i = 0; i < rows.leftOut().size(); ++i) {
        const LeftOut &out = rows.leftOut()[i];
        if (variables[i].isNumber) {
            const QString &name = variables[i].field.VariableName;
            note(name, out.missing, out.firstMissing, missingInTotals());
            note(name, out.notFinite, out.firstNotFinite, infiniteInTotals());
        }
    }
    const auto &dictionary = report_.GetTemplate()->GetDictionary(record.use)->Variables;
    for (const RunningValue &value : rows.running()) {
        const auto source = std::find_if(dictionary.begin(), dictionary.end(), [&](const sXmlReportVariable &variable) {
            return static_cast<quint32>(variable.ID) == value.source();
        });
        if (source != dictionary.end()) {
            const LeftOut &out = value.leftOut();
            note(source->VariableName, out.missing, out.firstMissing, missingInRunningSums());
            note(source->VariableName, out.notFinite, out.firstNotFinite, infiniteInRunningSums());
        }
    }
    return wrong;
}

} // namespace kareport
