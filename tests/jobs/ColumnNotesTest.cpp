#include "NameQuestions.h"

#include "ColumnNotes.h"
#include "JobRunnerFixture.h"
#include "VariableType.h"

#include <gtest/gtest.h>

namespace
{

using kareport::NameQuestions;

TEST(NameQuestions, AreAskedOnceForEachNameOfEachList)
{
    NameQuestions questions;
    int times = 0;
    const auto known = [&times] {
        ++times;
        QStringList names;
        names.append(QStringLiteral("Elevation"));
        return names;
    };
    for (int step = 0; step < 300; ++step) {
        EXPECT_EQ(questions.ask(QStringLiteral("a"), QStringLiteral("Elevaton"), known),
                  QStringLiteral("did you mean \"Elevation\"?"));
        EXPECT_EQ(questions.ask(QStringLiteral("b"), QStringLiteral("Tree"), known), QString()) << "nothing is near";
    }
    EXPECT_EQ(times, 2) << "names are compared once";
    questions.ask(QStringLiteral("b"), QStringLiteral("Elevaton"), known);
    EXPECT_EQ(times, 3) << "another list has other names";
}

sXmlReportVariable variable(const char *name, qint32 id)
{
    sXmlReportVariable made;
    made.VariableName = QString::fromUtf8(name);
    made.ID = id;
    made.Type = VARIABLE_DOUBLE;
    return made;
}

sXmlReportField field(const char *name)
{
    sXmlReportField made;
    made.VariableName = QString::fromUtf8(name);
    return made;
}

TEST(ColumnNotes, AskOnceForTheColumnsOfADataSet)
{
    sXmlReportDictionary dictionary;
    dictionary.DictionaryName = QStringLiteral("Survey");
    dictionary.Variables.push_back(variable("Northing", 1));
    sXmlReportFields fields;
    fields.push_back(field("Northing"));
    kareport::SourceColumns columns;
    columns.columns.push_back({QStringLiteral("Nrothing"), std::nullopt});
    NameQuestions questions;
    const auto questionOf = [&](const char *data) {
        const kareport::ColumnComparison compared(columns, dictionary, QString::fromUtf8(data), questions);
        return compared.unfilledFields(fields).at(0).question.toStdString();
    };
    EXPECT_EQ(questionOf("p"), "did you mean \"Nrothing\"?");
    columns.columns[0].name = QStringLiteral("Northng");
    EXPECT_EQ(questionOf("p"), "did you mean \"Nrothing\"?") << "the columns of a data set stay: nothing is compared";
    EXPECT_EQ(questionOf("q"), "did you mean \"Northng\"?") << "those of another one";
}

TEST(ColumnNotes, NameTheLastOfSeveralColumnsThatShowInstead)
{
    // The dictionary has them in another order than the data, whose last column shows.
    for (const bool isLastFirst : {false, true}) {
        sXmlReportDictionary dictionary;
        dictionary.Variables.push_back(variable("Northing", 1));
        dictionary.Variables.push_back(variable(isLastFirst ? "Last" : "First", 1));
        dictionary.Variables.push_back(variable(isLastFirst ? "First" : "Last", 1));
        sXmlReportFields fields;
        fields.push_back(field("Northing"));
        kareport::SourceColumns columns;
        columns.variables.append(QStringLiteral("first"));
        columns.variables.append(QStringLiteral("last"));
        NameQuestions questions;
        const kareport::ColumnComparison compared(columns, dictionary, QString(), questions);
        const auto unfilled = compared.unfilledFields(fields);
        ASSERT_EQ(unfilled.size(), 1U);
        EXPECT_EQ(unfilled[0].shown.toStdString(), "Last") << isLastFirst;
    }
}

TEST(ColumnNotes, SayOneMoreColumn)
{
    for (const int more : {1, 2}) {
        jobs::TestJob job;
        QByteArray header = "Number,Northing";
        for (int i = 0; i < 100 + more; ++i) {
            header += ",x" + QByteArray::number(i);
        }
        job.folder.put("p.csv", header + "\n");
        job.run(jobs::templateJob(R"("p": {"csv": "p.csv"})", R"({"table": "Points", "data": "p"})"));
        ASSERT_EQ(job.notes.said().size(), 101U);
        EXPECT_EQ(job.notes.said().back().about.text.toStdString(),
                  more == 1 ? "1 more column is not a variable of the dictionary \"Survey\""
                            : "2 more columns are not variables of the dictionary \"Survey\"");
    }
}

TEST(ColumnNotes, ValuesOfOneIdAreADifference)
{
    jobs::TestJob job;
    job.folder.put("t.xml", jobs::pointsTemplate().replace("<ID>3</ID>", "<ID>2</ID>"));
    job.folder.put("p.csv", "Number,Northing,Easting\n1,2,3\n");
    job.run(jobs::templateJob(R"("p": {"csv": "p.csv"})", R"({"table": "Points", "data": "p"})"));
    ASSERT_EQ(job.notes.said().size(), 1U) << job.text().toStdString();
    EXPECT_EQ(job.notes.said()[0].kind, kareport::JobNote::Kind::Difference);
    EXPECT_TRUE(job.notes.said()[0].isMistake());
}

} // namespace
