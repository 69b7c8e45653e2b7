#include "StandardText.h"

#include "BracketTranslator.h"
#include "PrintQt.h"

#include <QCoreApplication>

#include <gtest/gtest.h>

namespace
{

using kareport::standardText;

TEST(StandardText, IsFoundByItsNumber)
{
    struct Row
    {
        unsigned number;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {kareport::allFilesTitle, u"All Files (*.*)", "title of the last file kind"},
        {61442, u"All Files (*.*)", "the number is a fixed one"},
        {kareport::fileTooLarge, u"The file is too large to open.", "message"},
        {61701, u"The file is too large to open.", "the number is a fixed one"},
        {0, u"", "not known"},
        {61443, u"", "not known"},
        {0xFFFFFFFF, u"", "not known"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(standardText(row.number), row.expected.toString()) << row.reason;
    }
}

TEST(StandardText, IsInTheCurrentLanguage)
{
    {
        const BracketTranslator translator;
        EXPECT_EQ(standardText(61442), QStringLiteral("[All Files (*.*)]"));
        EXPECT_EQ(standardText(61701), QStringLiteral("[The file is too large to open.]"));
    }
    EXPECT_EQ(standardText(61442), QStringLiteral("All Files (*.*)")) << "asked anew every time";
}

} // namespace
