#include "ReportSubject.h"

#include "ScanText.h"
#include "TemplateCheck.h"
#include "TemplateNames.h"
#include "UXmlReportBlock.h"
#include "UXmlReportTable.h"
#include "UXmlReportTpl.h"

#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

/// A template file with tables, a block, a sort list and something that is wrong.
QByteArray templateFile()
{
    const QByteArray table =
        markup::output("Table", "Points", "Survey",
                       {markup::field("Number", "Point", "12"), markup::field("Northing", "North", "10.3", "RIGHT"),
                        markup::field("Easting", "East", "10.3", "RIGHT"), markup::field("Lost", "Lost", "4")},
                       {"Number"});
    const QByteArray block = markup::output("Block", "Site", "Survey", {markup::field("Note", "Note", "30")});
    return markup::surveyTemplate(table, block, markup::separatorOption("124")) + "<!-- <Name>no tag</Name> -->";
}

class TemplateAllocations : public testing::Test
{
protected:
    TemplateAllocations()
    {
        QFile file(path);
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(templateFile());
    }

private:
    const QTemporaryDir folder_;

protected:
    const QString path = folder_.filePath(QStringLiteral("t.xml"));
    const QString name = QStringLiteral("T");
};

/// What a host learns of a loaded template.
QStringList contentOf(const UXmlReportTpl &tpl)
{
    QStringList all;
    const auto add = [&all, &tpl](void (UXmlReportTpl::*get)(QStringList &) const) {
        QStringList names;
        (tpl.*get)(names);
        all.append(names.join(u','));
    };
    all.append(tpl.GetTemplateTitle());
    add(&UXmlReportTpl::GetAllTPLsByName);
    add(&UXmlReportTpl::GetAllTPLsByTitle);
    add(&UXmlReportTpl::GetAllTables);
    add(&UXmlReportTpl::GetAllBlocks);
    add(&UXmlReportTpl::GetAllDictionaries);
    all.append(QString(QLatin1Char(tpl.GetSeparatorXmlOption())));
    UXmlReportTable table;
    all.append(table.LoadTable(QStringLiteral("Points"), &tpl) ? table.GetHeading() : QStringLiteral("no table"));
    for (int i = 0; i < table.GetFieldsCount(); ++i) {
        const sXmlReportField field = table.GetField(i);
        all.append(QStringLiteral("%1 %2 %3").arg(field.VariableName).arg(field.ID).arg(field.Type));
    }
    std::vector<quint32> ids;
    table.GetSortList(ids);
    all.append(QString::number(ids.size()));
    return all;
}

TEST_F(TemplateAllocations, ATemplateIsLoadedWholeOrNotAtAll)
{
    UXmlReportTpl whole;
    ASSERT_TRUE(whole.LoadTemplate(path, name));
    const QStringList content = contentOf(whole);
    ASSERT_TRUE(content.contains(QStringLiteral("Points"))) << content.join(u'\n').toStdString();
    const qint64 allocations = failingEachAllocation([&](qint64 number) {
        UXmlReportTpl tpl;
        EXPECT_TRUE(tpl.LoadTemplate(path, name)); // what it held before goes with a load that fails
        bool isLoaded = false;
        bool hasFailed = false;
        {
            const FailingAllocation failing(number);
            EXPECT_NO_THROW(isLoaded = tpl.LoadTemplate(path, name)) << number;
            hasFailed = failing.hasFailed();
        }
        if (isLoaded) {
            EXPECT_EQ(contentOf(tpl), content) << number;
        } else {
            EXPECT_EQ(contentOf(tpl), contentOf(UXmlReportTpl())) << number;
            EXPECT_EQ(tpl.GetTable(QStringLiteral("Points")), nullptr) << number;
        }
        EXPECT_TRUE(tpl.LoadTemplate(path, name)) << number << ": another try";
        EXPECT_EQ(contentOf(tpl), content) << number;
        return hasFailed && !testing::Test::HasFailure();
    });
    EXPECT_GT(allocations, 50);
}

/// What is asked of a loaded template and of a table of it.
struct Question
{
    const char *name;
    QStringList (*ask)(UXmlReportTpl &tpl, UXmlReportTable &table);
};
QStringList names;
std::vector<quint32> ids;
const QString points = QStringLiteral("Points");
const QString northing = QStringLiteral("NORTHING");
const QString survey = QStringLiteral("SURVEY");
// The answers stay empty where there is none; what a test itself asks for is asked for before.
const Question questions[] = {
    {"GetAllTPLsByName",
     [](UXmlReportTpl &tpl, UXmlReportTable &) {
         tpl.GetAllTPLsByName(names);
         return names;
     }},
    {"GetAllTPLsByTitle",
     [](UXmlReportTpl &tpl, UXmlReportTable &) {
         tpl.GetAllTPLsByTitle(names);
         return names;
     }},
    {"GetAllTables",
     [](UXmlReportTpl &tpl, UXmlReportTable &) {
         tpl.GetAllTables(names);
         return names;
     }},
    {"GetAllBlocks",
     [](UXmlReportTpl &tpl, UXmlReportTable &) {
         tpl.GetAllBlocks(names);
         return names;
     }},
    {"GetAllDictionaries",
     [](UXmlReportTpl &tpl, UXmlReportTable &) {
         tpl.GetAllDictionaries(names);
         return names;
     }},
    {"records of a name",
     [](UXmlReportTpl &tpl, UXmlReportTable &) {
         const bool areFound = tpl.GetTable(points) != nullptr && tpl.GetBlock(QStringLiteral("Site")) != nullptr &&
                               tpl.GetDictionary(survey) != nullptr && tpl.GetSortList(points) != nullptr;
         return areFound ? names : QStringList();
     }},
    {"FindVariable",
     [](UXmlReportTpl &tpl, UXmlReportTable &) {
         qint32 id = -1;
         qint32 type = -1;
         const bool isFound = tpl.FindVariable(survey, northing, id, type);
         EXPECT_EQ(isFound, id == 2) << "and nothing is changed where it is not found";
         return isFound ? names : QStringList();
     }},
    {"LoadTable",
     [](UXmlReportTpl &tpl, UXmlReportTable &table) {
         const bool isLoaded = table.LoadTable(points, &tpl);
         EXPECT_EQ(isLoaded, table.IsLoaded());
         return table.IsLoaded() ? names : QStringList();
     }},
    {"ReorderingHeading",
     [](UXmlReportTpl &tpl, UXmlReportTable &table) {
         EXPECT_TRUE(tpl.SetNorthEastTableFieldOrder(points, ORDER_EASTING_NORTHING));
         table.ReorderingHeading();
         return table.IsLoaded() ? names : QStringList();
     }},
    {"GetSortList",
     [](UXmlReportTpl &, UXmlReportTable &table) {
         const bool isListed = table.GetSortList(ids);
         EXPECT_EQ(isListed, !ids.empty());
         return ids.empty() ? QStringList() : names;
     }},
    {"GetColumnSeparator",
     [](UXmlReportTpl &, UXmlReportTable &table) {
         return table.GetColumnSeparator().isEmpty() ? QStringList() : names;
     }},
    {"LoadBlock",
     [](UXmlReportTpl &tpl, UXmlReportTable &) {
         UXmlReportBlock block;
         EXPECT_TRUE(block.LoadBlock(QStringLiteral("Site"), &tpl)) << "which needs no memory";
         return block.GetFieldsCount() == 1 ? names : QStringList();
     }},
};

TEST_F(TemplateAllocations, WhatIsAskedOfATemplateIsAnsweredWholeOrNotAtAll)
{
    for (const Question &question : questions) {
        QStringList whole;
        failingEachAllocation([&](qint64 number) {
            UXmlReportTpl tpl;
            EXPECT_TRUE(tpl.LoadTemplate(path, name));
            UXmlReportTable table;
            EXPECT_TRUE(table.LoadTable(points, &tpl));
            names = QStringList(points);
            ids.clear();
            if (whole.isEmpty()) {
                whole = question.ask(tpl, table);
                EXPECT_FALSE(whole.isEmpty()) << question.name;
                names = QStringList(points);
            }
            QStringList answer;
            bool hasFailed = false;
            {
                const FailingAllocation failing(number);
                EXPECT_NO_THROW(answer = question.ask(tpl, table)) << question.name << ' ' << number;
                hasFailed = failing.hasFailed();
            }
            EXPECT_TRUE(answer == whole || answer.isEmpty()) << question.name << ' ' << number;
            EXPECT_TRUE(hasFailed || !answer.isEmpty()) << question.name << ' ' << number;
            return hasFailed && !testing::Test::HasFailure();
        });
    }
}

TEST_F(TemplateAllocations, AFileIsReadWholeOrNotAtAll)
{
    const auto whole = kareport::TemplateFile::read(path);
    ASSERT_TRUE(whole);
    EXPECT_GT(failingEachAllocation([&](qint64 number) {
                  std::optional<kareport::TemplateFile> file;
                  std::optional<QString> scanned;
                  bool hasFailed = false;
                  {
                      const FailingAllocation failing(number);
                      EXPECT_NO_THROW(file = kareport::TemplateFile::read(path)) << number;
                      EXPECT_NO_THROW(scanned = kareport::TemplateFile::readScanned(path)) << number;
                      hasFailed = failing.hasFailed();
                  }
                  EXPECT_TRUE(!file || file->text() == whole->text()) << number;
                  EXPECT_TRUE(!scanned || *scanned == scanTextOf(*whole).text()) << number;
                  EXPECT_EQ(file && scanned, !hasFailed) << number;
                  return hasFailed && !testing::Test::HasFailure();
              }),
              5);
}

TEST_F(TemplateAllocations, ACheckWithoutMemorySaysThatItIsNotWhole)
{
    const kareport::TemplateFile file(templateFile());
    const auto whole = kareport::checkTemplates(file);
    ASSERT_GE(whole.size(), 2U) << "a variable that is not in the dictionary, and a tag in a comment";
    const kareport::TemplateFile unread("<ReportTemplate><Name>a</Name>");
    ASSERT_TRUE(kareport::firstUnreadTemplate(unread));
    const QString reason = QStringLiteral("there is not enough memory for it");
    const qint64 allocations = failingEachAllocation([&](qint64 number) {
        std::vector<kareport::TemplateRemark> remarks;
        bool hasFailed = false;
        {
            const FailingAllocation failing(number);
            EXPECT_NO_THROW(remarks = kareport::checkTemplates(file)) << number;
            hasFailed = failing.hasFailed();
        }
        const bool isSaid = remarks.size() == 1 && remarks.front().isError && remarks.front().text == reason;
        EXPECT_TRUE(isSaid || remarks.size() == whole.size()) << number << ": half a check is not reported";
        return hasFailed && !testing::Test::HasFailure();
    });
    EXPECT_GT(allocations, 50);
    failingEachAllocation([&](qint64 number) {
        std::optional<kareport::TemplateRemark> remark;
        const FailingAllocation failing(number);
        EXPECT_NO_THROW(remark = kareport::firstUnreadTemplate(unread)) << number;
        EXPECT_TRUE(remark && remark->isError) << number << ": the file must not be taken for a good one";
        return failing.hasFailed() && !testing::Test::HasFailure();
    });
}

} // namespace
