#include "XlsxBook.h"

#include "CommaLocale.h"

#include <gtest/gtest.h>

#include <clocale>
#include <cstdio>
#include <string>
#include <thread>

namespace
{

using kareport::XlsxBook;

std::string written(double number)
{
    char text[400];
    std::snprintf(text, sizeof text, "%.1f", number);
    return text;
}

TEST(XlsxBook, LeavesTheLocaleOfTheProgramAlone)
{
    const CommaLocale comma;
    if (!comma.isThere()) {
        GTEST_SKIP() << "no locale with a decimal comma can be made";
    }
    ASSERT_EQ(written(0.5), "0,5");
    XlsxBook book;
    lxw_worksheet *sheet = book.addSheet(QStringLiteral("Points"));
    XlsxBook::writeNumber(sheet, 0, 0, 0.5, nullptr);
    EXPECT_EQ(std::setlocale(LC_NUMERIC, nullptr), comma.name()) << "while a book is open";
    EXPECT_EQ(written(0.5), "0,5") << "on the thread that writes it";
    std::string other;
    std::thread([&other] { other = written(0.5); }).join();
    EXPECT_EQ(other, "0,5");
    EXPECT_EQ(book.close(), QString());
    EXPECT_EQ(written(0.5), "0,5") << "after it";
}

} // namespace
