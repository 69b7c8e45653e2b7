#include "Progress.h"

#include <gtest/gtest.h>

#include <vector>

namespace
{

/// Tells how much of all the work is done.
class Parts : public kareport::Progress
{
public:
    Parts() : Progress(false) {}
    int percent(std::size_t done) { return static_cast<int>(partOfAll(done) * 100 + 0.5); }
};

TEST(Progress, AllTheWorkIsMeasured)
{
    Parts one;
    EXPECT_EQ(one.percent(0), 0) << "before it begins";
    one.begin(QString(), 50);
    EXPECT_EQ(one.percent(25), 50) << "one piece, unless said";
    EXPECT_EQ(one.percent(20), 50) << "it does not go back";
    EXPECT_EQ(one.percent(60), 100) << "no further than its end";

    Parts three;
    three.expectPieces(3);
    three.begin(QString(), 10);
    EXPECT_EQ(three.percent(10), 33);
    three.begin(QString(), 0);
    EXPECT_EQ(three.percent(7), 33) << "how far this one is, is not known";
    three.begin(QString(), 2);
    EXPECT_EQ(three.percent(1), 83);
    three.begin(QString(), 4);
    EXPECT_EQ(three.percent(1), 83) << "more pieces than were expected";
    EXPECT_EQ(three.percent(4), 100);

    Parts none;
    none.expectPieces(0);
    none.begin(QString(), 2);
    EXPECT_EQ(none.percent(1), 50);

    Parts shared;
    shared.beginShare(0, 4);
    shared.expectPieces(2);
    shared.begin(QString(), 10);
    EXPECT_EQ(shared.percent(10), 13);
    shared.beginShare(1, 4);
    shared.begin(QString(), 0);
    EXPECT_EQ(shared.percent(0), 25) << "what was left of the first is over";
    shared.beginShare(3, 4);
    shared.begin(QString(), 10);
    EXPECT_EQ(shared.percent(5), 88);
}

} // namespace
