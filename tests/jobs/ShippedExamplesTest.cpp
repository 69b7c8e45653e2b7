#include "ShippedExamples.h"

#include "JobFolder.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace
{

using namespace kareport;

TEST(ShippedExamples, AreFoundBesideTheBuild)
{
    EXPECT_EQ(QDir(examplesFolder()), QDir(QStringLiteral(KAREPORT_EXAMPLES_DIR)));
    const auto examples = shippedExamples(examplesFolder());
    ASSERT_GE(examples.size(), 20U);
    EXPECT_TRUE(std::is_sorted(examples.begin(), examples.end(), [](const auto &one, const auto &other) {
        return one.title.compare(other.title, Qt::CaseInsensitive) < 0;
    }));
    const auto stakeout = std::find_if(examples.begin(), examples.end(), [](const ShippedExample &example) {
        return example.path.endsWith(u"/stakeout.json");
    });
    ASSERT_NE(stakeout, examples.end());
    EXPECT_EQ(stakeout->title, QStringLiteral("Stakeout, -0+075 to 1+500"));
    EXPECT_TRUE(isShippedExample(stakeout->path));
    EXPECT_TRUE(isShippedExample(examplesFolder() + QStringLiteral("/data/control.csv")));
    EXPECT_FALSE(isShippedExample(QStringLiteral(KAREPORT_TEST_DIR "/CMakeLists.txt")));
}

TEST(ShippedExamples, WhatIsNoJobIsLeftOut)
{
    const JobFolder folder;
    folder.put("b.json", R"({"report": []})");
    folder.put("a.json", R"({"title": "Zone"})");
    folder.put("broken.json", "{");
    folder.put("list.json", "[]");
    const auto examples = shippedExamples(folder.path());
    ASSERT_EQ(examples.size(), 2U);
    EXPECT_EQ(examples[0].title, QStringLiteral("b")) << "a job without a title is called as its file";
    EXPECT_EQ(examples[1].title, QStringLiteral("Zone"));
    EXPECT_TRUE(shippedExamples(QString()).empty());
    EXPECT_TRUE(shippedExamples(QStringLiteral("/no/such/folder")).empty());
}

} // namespace
