#pragma once

#include "JobRunnerFixture.h"

namespace jobs
{

/// A template "T" with the tables "Sorted" (by layer and number), "Free" (not sorted) and "Wide" (with all variables).
inline QByteArray layersTemplate(const char *separator = "124")
{
    using namespace markup;
    const std::vector<QByteArray> fields = {field("Layer", "Layer", "6"), field("Number", "Pt", "4"),
                                            field("Volume", "Volume", "9.3", "RIGHT"),
                                            field("Area", "Area", "8.3", "RIGHT")};
    const QByteArray dictionary = element(
        "Dictionary",
        element("DictionaryName", "Layers") +
            element(
                "VariableList",
                joined({variable(1, "Layer", "TEXT"), variable(2, "Number", "NUMBER"), variable(3, "Volume", "DOUBLE"),
                        variable(4, "Area", "AREA"), variable(5, "Length", "LENGTH"), variable(6, "Width", "LENGTH"),
                        variable(7, "Step", "LENGTH"), variable(8, "Mark", "FLAG"), variable(9, "Note", "TEXT"),
                        variable(10, "Row", "INTEGER"), variable(11, "Bearing", "BEARING"),
                        variable(12, "Site", "TEXT"), variable(13, "Turn", "ANGLE"), variable(14, "Other", "BEARING"),
                        variable(15, "Side", "OFFSET"), variable(16, "Depth", "ELEVATION")})));
    const QByteArray tables =
        output("Table", "Sorted", "Layers", fields, {"Layer", "Number"}) + output("Table", "Free", "Layers", fields) +
        output("Table", "Wide", "Layers",
               {field("Number", "Pt", "3"), field("Length", "Length", "8.3", "RIGHT"),
                field("Width", "Width", "8.3", "RIGHT"), field("Step", "Step", "8.3", "RIGHT"),
                field("Area", "Area", "8.3", "RIGHT"), field("Mark", "M", "1"), field("Note", "Note", "4"),
                field("Row", "Row", "3", "RIGHT")}) +
        output("Table", "Angles", "Layers",
               {field("Number", "Pt", "3"), field("Turn", "Turn", "10.1", "RIGHT"),
                field("Bearing", "Bearing", "14", "RIGHT"), field("Note", "Note", "4")}) +
        output("Table", "Sides", "Layers",
               {field("Number", "Pt", "3"), field("SUFFIX_+", "", "1"), field("Side", "Side", "8.1", "RIGHT")});
    return element("ReportTemplate", element("Name", "T") + element("Title", "Title") + element("Tables", tables) +
                                         element("Dictionaries", dictionary) +
                                         element("Options", separatorOption(separator)));
}

inline const char *const fiveRows = R"("v": {"values": [
    {"Layer": "B", "Number": "3", "Volume": 2, "Area": 4},
    {"Layer": "A", "Number": "1", "Volume": 0.1, "Area": 1},
    {"Layer": "b", "Number": "4", "Volume": 1, "Area": 5},
    {"Layer": "A", "Number": "2", "Volume": 0.2, "Area": 2},
    {"Layer": "A", "Number": "5", "Volume": 0.3, "Area": 3}]})";

/// What a table step makes of the rows.
inline QString run(TestJob &test, const QByteArray &step, const QByteArray &data = fiveRows,
                   const QByteArray &more = {})
{
    test.folder.put("t.xml", layersTemplate());
    test.run(templateJob(data, R"({"line": "-"}, {)" + step + "}", more));
    return test.text();
}

} // namespace jobs
