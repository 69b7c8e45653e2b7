#include "Clock.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using kareport::currentTime;
using kareport::fixTime;

TEST(Clock, RunsUnlessItIsFixed)
{
    const QDateTime before = QDateTime::currentDateTime();
    const QDateTime running = currentTime();
    const QDateTime after = QDateTime::currentDateTime();
    EXPECT_TRUE(before <= running && running <= after);
    EXPECT_EQ(running.timeSpec(), Qt::LocalTime);

    const QDateTime fixed(QDate(1999, 12, 31), QTime(23, 59, 59));
    fixTime(fixed);
    EXPECT_TRUE(currentTime() == fixed);
    EXPECT_TRUE(currentTime() == fixed) << "it does not move";
    const QDateTime another(QDate(2024, 2, 29), QTime(0, 0), Qt::UTC);
    fixTime(another);
    EXPECT_TRUE(currentTime() == another) << "fixed again";
    EXPECT_EQ(currentTime().timeSpec(), Qt::UTC) << "as it was given";

    fixTime(std::nullopt);
    const QDateTime again = currentTime();
    EXPECT_TRUE(after <= again && again <= QDateTime::currentDateTime()) << "nothing lets it run again";
}

} // namespace
