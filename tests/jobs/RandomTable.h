#pragma once

#include "RandomSequence.h"
#include "TemplateMarkup.h"

#include <QByteArray>

namespace jobs
{

using namespace markup;

struct Variable
{
    const char *name;
    const char *type;
};

inline constexpr Variable variables[] = {
    {"Count", "INTEGER"},   {"Factor", "DOUBLE"},    {"Remark", "TEXT"},   {"Turn", "ANGLE"},
    {"Azimuth", "BEARING"}, {"North", "COORDINATE"}, {"Length", "LENGTH"}, {"Dist", "DISTANCE"},
    {"Z", "ELEVATION"},     {"Chainage", "STATION"}, {"Offset", "OFFSET"}, {"Area", "AREA"},
    {"Name", "NAME"},       {"Number", "NUMBER"},    {"Zenith", "VANGLE"}, {"Done", "BOOLEAN"},
    {"Flag", "FLAG"},       {"Depth", "THICKNESS"},
};
inline constexpr int variableCount = 18;

/// One table with its job, made of a seed.
class RandomTable
{
public:
    explicit RandomTable(quint64 seed) : random_(seed) {}

    /// A template with a table of some of the variables.
    QByteArray templateFile();
    /// The same with all of them, each once.
    QByteArray wholeTemplateFile();
    /// @param rows  -1 for some
    QByteArray csv(int rows = -1);
    /// The job with the data of a file. @param kind  csv or json
    QByteArray job(const QByteArray &kind, const QByteArray &file, const QByteArray &output) const
    {
        return R"("header": false, "template": {"file": "t.xml", "name": "T"}, )" + settings_ + R"("data": {"p": {")" +
               kind + R"(": ")" + file + R"(", "units": )" + units_ +
               R"(}}, "report": [{"table": "P", "data": "p"}], "output": [)" + output + "]";
    }
    /// @param mostDecimals  of lengths, stations and plain numbers
    void chooseUnits(int mostDecimals = 15);

private:
    static QByteArray templateOf(const QByteArray &table);
    bool oneIn(int many) { return random_.below(many) == 0; }
    template <std::size_t count>
    QByteArray oneOf(const char *const (&words)[count])
    {
        return words[random_.below(static_cast<int>(count))];
    }
    QByteArray number();
    QByteArray text();
    QByteArray angle(bool isBearing);
    QByteArray cell(int variable);

    RandomNumbers random_;
    QByteArray units_;
    QByteArray settings_;
    bool isSexagesimal_ = false;
    bool isModest_ = false; ///< numbers have no more digits than a spreadsheet holds
};

inline void RandomTable::chooseUnits(int mostDecimals)
{
    const QByteArray angle = oneOf({"deg", "gon", "rad", "dms"});
    isSexagesimal_ = angle == "dms";
    isModest_ = mostDecimals < 15;
    units_ = R"({"length": ")" + oneOf({"m", "mm", "km", "ft", "usft"}) + R"(", "area": ")" +
             oneOf({"m2", "ha", "km2", "ft2", "ac"}) + R"(", "angle": ")" + angle + R"("})";
    settings_ = R"("settings": {"lengthUnit": ")" + oneOf({"m", "mm", "km", "ft", "usft"}) + R"(", "areaUnit": ")" +
                oneOf({"m2", "ha", "km2", "ft2", "ac"}) + R"(", "angleUnit": ")" + oneOf({"deg", "gon", "rad"}) +
                R"(", "lengthDecimals": )" + QByteArray::number(random_.below(mostDecimals + 1)) +
                R"(, "stationDecimals": )" + QByteArray::number(random_.below(mostDecimals + 1)) +
                R"(, "numberDecimals": )" + QByteArray::number(random_.below(mostDecimals + 1)) +
                R"(, "bearingDecimals": )" + QByteArray::number(random_.below(5)) + R"(, "stationFormat": ")" +
                oneOf({"plain", "0+00", "0+000"}) + R"("}, "options": {"zeroBlank": )" + oneOf({"true", "false"}) +
                R"(, "printHash": )" + oneOf({"true", "false"}) + R"(}, )";
}

inline QByteArray RandomTable::wholeTemplateFile()
{
    std::vector<QByteArray> fields;
    for (const Variable &each : variables) {
        fields.push_back(field(each.name, each.name, "12.3", "RIGHT"));
    }
    return templateOf(output("Table", "P", "D", fields));
}

/// A template with a table and a dictionary of all variables.
inline QByteArray RandomTable::templateOf(const QByteArray &table)
{
    std::vector<QByteArray> records;
    for (int i = 0; i < variableCount; ++i) {
        records.push_back(variable(i + 1, variables[i].name, variables[i].type));
    }
    return element("ReportTemplate",
                   element("Name", "T") + element("Title", "T") + element("Tables", table) +
                       element("Dictionaries", element("Dictionary", element("DictionaryName", "D") +
                                                                         element("VariableList", joined(records)))) +
                       element("Options", separatorOption("124")));
}

inline QByteArray RandomTable::templateFile()
{
    std::vector<QByteArray> fields;
    const int count = 1 + random_.below(8);
    for (int i = 0; i < count; ++i) {
        if (oneIn(6)) {
            fields.push_back(field(oneOf({"FILLER", "SUFFIX_R", "SUFFIX_+", "Nothing"}).constData(), "", "2"));
        }
        const QByteArray format = QByteArray::number(random_.below(16)) + '.' + QByteArray::number(random_.below(8));
        fields.push_back(field(variables[random_.below(variableCount)].name, "L", format.constData(),
                               oneOf({"LEFT", "RIGHT", "CENTER"}).constData()));
    }
    const char *const first = variables[random_.below(variableCount)].name;
    const char *const second = variables[random_.below(variableCount)].name;
    const QByteArray table = oneIn(3)   ? output("Table", "P", "D", fields)
                             : oneIn(2) ? output("Table", "P", "D", fields, {first})
                                        : output("Table", "P", "D", fields, {first, second});
    return templateOf(table);
}

inline QByteArray RandomTable::number()
{
    if (isModest_) {
        return QByteArray::number((random_.below(20'000'000) - 10'000'000) / 1000.0, 'f', random_.below(4));
    }
    if (oneIn(12)) {
        return oneOf({"0", "-0", "0.0", "INF", "-INF", "NAN", "1e300", "-1e-300", "0.5", "-0.0005", "1e17"});
    }
    QByteArray digits = QByteArray::number(random_.below(1'000'000));
    for (int i = random_.below(14); i > 0; --i) {
        digits += static_cast<char>('0' + random_.below(10));
    }
    digits.insert(random_.below(static_cast<int>(digits.size()) + 1), '.');
    return (oneIn(3) ? "-" : "") + digits + (oneIn(10) ? "e-3" : "");
}

inline QByteArray RandomTable::text()
{
    QByteArray text;
    for (int i = random_.below(9); i > 0; --i) {
        text += oneOf(
            {"a",  "B", "7",  " ", "\"", ",", ";",    "\n", "\r\n", "\xC3\xA4", "\xE6\xB8\xAC", "\xF0\x9D\x84\x9E",
             "\t", "=", "\\", "#", "<",  "'", "\x01", "-"});
    }
    return text;
}

inline QByteArray RandomTable::angle(bool isBearing)
{
    if (isSexagesimal_ || oneIn(5)) {
        const QByteArray parts = QByteArray::number(random_.below(90)) + "\xC2\xB0" +
                                 QByteArray::number(random_.below(60)) + "'" +
                                 QByteArray::number(random_.below(6000) / 100.0) + "\"";
        return isBearing && oneIn(2) ? oneOf({"N", "S"}) + parts + oneOf({"E", "W"}) : parts;
    }
    QByteArray plain = number();
    return plain.contains('N') || plain.contains('e') ? QByteArray("12.25") : plain;
}

inline QByteArray RandomTable::cell(int index)
{
    if (oneIn(8)) {
        return {};
    }
    const QByteArray type = variables[index].type;
    if (type == "INTEGER") {
        return QByteArray::number(random_.below(100'000) - 50'000);
    }
    if (type == "TEXT" || type == "NAME" || type == "NUMBER") {
        return text();
    }
    if (type == "BOOLEAN" || type == "FLAG") {
        return oneOf({"yes", "no", "1", "0", "*"});
    }
    if (type == "ANGLE" || type == "VANGLE" || type == "BEARING") {
        return angle(type == "BEARING");
    }
    if (type == "THICKNESS") {
        return oneIn(4) ? "ByLayer" : QByteArray::number(random_.below(30000));
    }
    return number();
}

inline QByteArray RandomTable::csv(int count)
{
    QByteArray rows;
    for (int i = 0; i < variableCount; ++i) {
        rows += QByteArray(i == 0 ? "" : ",") + variables[i].name;
    }
    rows += '\n';
    for (int row = count < 0 ? random_.below(12) : count; row > 0; --row) {
        for (int i = 0; i < variableCount; ++i) {
            rows += QByteArray(i == 0 ? "" : ",") + '"' + cell(i).replace("\"", "\"\"") + '"';
        }
        rows += '\n';
    }
    return rows;
}

} // namespace jobs
