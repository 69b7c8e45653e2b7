#include "ReportAllocations.h"

#include "ReportWindowFixture.h"
#include "UXmlReportTable.h"
#include "UXmlReportTpl.h"

#include <QTemporaryDir>

// What is written with placeholders and looked at for remarks, as jobs do it, and saving under another name.

namespace
{

using Text = ReportOperation::Text;

constexpr Shape placeholders = {.isLoaded = true, .hasPlaceholders = true};

/// Whether the remarks are on all of the data: its bearing is the widest value of the second column.
bool areRemarksWhole(const ReportSubject &s, quint64 rows)
{
    return s.remarks.rows == rows && s.remarks.columns.size() == 2 && s.remarks.columns[1].widest.width > 10 &&
           s.remarks.columns[1].widestLine > 0;
}

constexpr ReportOperation operations[] = {
    {"LoadTemplateXml, placeholders",
     Text::Same,
     [](auto &s, auto &) {
         return s.report.LoadTemplateXml(QStringLiteral("placeholders.xml"), QStringLiteral("T"),
                                         QStringLiteral("Points"), QStringLiteral("Site"));
     },
     {.hasPlaceholders = true}},
    {"WriteDataTable, remarks and placeholders", Text::Written,
     [](auto &s, auto &) { return s.report.WriteDataTable(&s.list, 1, 1, -1) && areRemarksWhole(s, 3); }, placeholders},
    {"WriteDataTable, over several pages", Text::Written,
     [](auto &s, auto &) {
         s.report.FixPage(8, 80);
         return s.report.WriteDataTable(&s.list, 1, 1, -1) && areRemarksWhole(s, 3);
     },
     placeholders},
    {"WriteDataTable by name, remarks and placeholders", Text::Written,
     [](auto &s, auto &) {
         return s.report.WriteDataTable(QStringLiteral("Points"), &s.list, 0, 0, 1) && areRemarksWhole(s, 3);
     },
     placeholders},
    {"WriteDataBlock, remarks and placeholders", Text::Written,
     [](auto &s, auto &) { return s.report.WriteDataBlock(s.list.GetAt(0), 1, 1) && areRemarksWhole(s, 1); },
     placeholders},
    {"WriteDataBlock by name, remarks and placeholders", Text::Written,
     [](auto &s, auto &) {
         return s.report.WriteDataBlock(QStringLiteral("Site"), s.list.GetAt(0), 0, 0) && areRemarksWhole(s, 1);
     },
     placeholders},
    {"WriteLine, placeholders", Text::Written,
     [](auto &s, auto &) {
         s.report.WriteLine(s.marked, 1, 2, 2);
         return lostNothing(s);
     },
     placeholders},
    {"WriteLine, a new page with placeholders", Text::Written,
     [](auto &s, auto &) {
         s.report.SetHeading(s.marked, 1, 1);
         s.report.WriteLine(s.marked, -1, 1, 0);
         return lostNothing(s);
     },
     placeholders},
    {"WriteHeading, placeholders", Text::Written,
     [](auto &s, auto &) {
         s.report.SetHeading(s.marked, 1, 1);
         s.report.WriteHeading();
         return lostNothing(s);
     },
     placeholders},
    {"NewPage, placeholders", Text::Written,
     [](auto &s, auto &) {
         s.report.SetHeading(s.marked, 1, 1);
         return s.report.NewPage(-1) && lostNothing(s);
     },
     placeholders},
    {"FormatXmlStringToDisplay, a bearing", Text::Same,
     [](auto &s, auto &) {
         const double value = 1.25;
         s.answer = s.report.FormatXmlStringToDisplay(
             &s.report.GetTemplate()->GetTable(QStringLiteral("Points"))->Fields[1], 8, &value, QString());
         return !s.answer.isEmpty();
     },
     placeholders},
    {"DoFileSave",
     Text::Same,
     [](auto &s, auto &around) {
         s.report.SetPathName(around.reportPath, false);
         return !s.report.GetPathName().isEmpty() && s.report.DoFileSave();
     },
     {},
     true},
};

INSTANTIATE_TEST_SUITE_P(Data, ReportAllocations, testing::ValuesIn(operations), nameOf);

TEST(DataAllocations, PlaceholdersAndBearingsAreInWhatIsWritten)
{
    const Surroundings around;
    ReportSubject subject(placeholders);
    subject.report.FixPage(8, 80);
    ASSERT_TRUE(subject.report.WriteDataTable(&subject.list, 1, 1, -1));
    const QString text = subject.report.CopyText();
    EXPECT_TRUE(text.contains(QStringLiteral("Point of page   2"))) << text.toStdString();
    EXPECT_TRUE(text.contains(QStringLiteral("Point of page   4"))) << text.toStdString();
    EXPECT_TRUE(text.contains(QString::fromUtf8("Course in \xC2\xB0"))) << text.toStdString();
    EXPECT_TRUE(text.contains(QString::fromUtf8("N 71\xC2\xB0"
                                                "37'11\" E")))
        << text.toStdString();
}

TEST(DataAllocations, AReportWithoutMemoryForItsNewNameCountsAsModified)
{
    const Surroundings around;
    const QTemporaryDir folder;
    for (const char *name : {"a.rep", "a.rtf"}) {
        const QString path = folder.filePath(QString::fromUtf8(name));
        AnsweredSaving saving(path);
        bool isEverUnnamed = false;
        failingEachAllocation([&](qint64 number) {
            QFile::remove(path);
            ReportSubject subject({.hasView = true});
            subject.report.SetModifiedFlag(true);
            bool isSaved = false;
            // Once the name is there: the folders that it is looked for in are those of QStandardPaths, which does not survive.
            std::optional<FailingAllocation> failing;
            saving.meanwhile = [&failing, number] { failing.emplace(number); };
            EXPECT_NO_THROW(isSaved = subject.report.DoSave(QString(), true)) << number;
            const bool hasFailed = failing && failing->hasFailed();
            failing.reset();
            EXPECT_EQ(subject.report.GetPathName(), isSaved ? path : QString()) << name << ' ' << number;
            EXPECT_EQ(subject.report.IsModified(), !isSaved) << name << ' ' << number;
            isEverUnnamed = isEverUnnamed || (!isSaved && QFile::exists(path));
            return hasFailed && !testing::Test::HasFailure();
        });
        EXPECT_TRUE(isEverUnnamed) << name << ": the memory for its path is asked for after the file is written";
    }
}

TEST(DataAllocations, ATemplateWithOtherTextsForItsLabelsIsLoadedWholeOrNotAtAll)
{
    const Surroundings around;
    const ReportSubject subject({.hasPlaceholders = true});
    const auto labelText = [&subject](const QString &label, const QString &title) {
        return subject.placeholders->labelOf(label, title);
    };
    const auto headingOf = [](const UXmlReportTpl &tpl) {
        UXmlReportTable table;
        return table.LoadTable(QStringLiteral("Points"), &tpl) ? table.GetHeading() : QString();
    };
    UXmlReportTpl whole;
    whole.SetLabelText(labelText);
    ASSERT_TRUE(whole.LoadTemplate(around.placeholdersPath, QStringLiteral("T")));
    ASSERT_TRUE(headingOf(whole).contains(QString::fromUtf8("Course in \xC2\xB0"))) << headingOf(whole).toStdString();
    EXPECT_GT(failingEachAllocation([&](qint64 number) {
                  UXmlReportTpl tpl;
                  UXmlReportTpl::LabelText textOf = labelText;
                  bool isLoaded = false;
                  bool hasFailed = false;
                  {
                      const FailingAllocation failing(number);
                      EXPECT_NO_THROW({
                          tpl.SetLabelText(std::move(textOf));
                          isLoaded = tpl.LoadTemplate(around.placeholdersPath, QStringLiteral("T"));
                      }) << number;
                      hasFailed = failing.hasFailed();
                  }
                  EXPECT_EQ(headingOf(tpl), isLoaded ? headingOf(whole) : QString()) << number;
                  return hasFailed && !testing::Test::HasFailure();
              }),
              50);
}

} // namespace
