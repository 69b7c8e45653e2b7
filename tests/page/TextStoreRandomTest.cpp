#include "RandomRuns.h"
#include "TestSize.h"
#include "TextStoreModel.h"

#include <gtest/gtest.h>

namespace
{

using textstore::Letters;
using textstore::Op;
using textstore::Step;

TEST(TextStoreRandom, BehavesAsAPlainString)
{
    constexpr std::size_t stepsPerRun = 150;
    for (RandomRuns runs("TextStoreRandom", 1, testSize(250, 700)); runs.next();) {
        const std::vector<Step> steps = textstore::RandomSteps(runs.seed()).make(stepsPerRun);
        if (textstore::violationOf(steps)) {
            ADD_FAILURE() << "seed " << runs.seed() << ":\n" << textstore::reportOf(textstore::shortest(steps));
            break;
        }
    }
}

TEST(TextStoreRandom, SequencesThatWereFoundOnceStayMended)
{
    struct Row
    {
        std::vector<Step> steps;
        const char *reason;
    };
    const Row rows[] = {
        {{{Op::Write, 0, 0, 31990, Letters::OneByte, 0},
          {Op::Replace, 5, 1, 2, Letters::OneByte, 0},
          {Op::Write, 0, 0, 100, Letters::OneByte, 0}},
         "what came after an edit was gone when the text grew"},
    };
    for (const Row &row : rows) {
        EXPECT_FALSE(textstore::violationOf(row.steps)) << row.reason << ":\n" << textstore::reportOf(row.steps);
    }
}

TEST(TextStoreRandom, ASequenceIsShortenedToWhatIsNeeded)
{
    // As if a text could not be read after an edit that follows a long piece.
    const auto shows = [](const std::vector<Step> &steps) {
        bool isLong = false;
        bool isEdited = false;
        for (const Step &step : steps) {
            isLong = isLong || (step.op == Op::Write && step.count > 100);
            isEdited = isEdited || (isLong && step.op == Op::Replace);
            if (isEdited && step.op == Op::ReadWhole) {
                return true;
            }
        }
        return false;
    };
    const std::vector<Step> steps = textstore::RandomSteps(1).make(1000);
    ASSERT_TRUE(shows(steps));
    const std::vector<Step> few = simplified(shortened(steps, shows), shows, textstore::simplerSteps);
    ASSERT_EQ(few.size(), 3U);
    EXPECT_EQ(few[0].op, Op::Write);
    EXPECT_GT(few[0].count, 100);
    EXPECT_EQ(few[0].refused, 0);
    EXPECT_EQ(textstore::rowOf(few[1]), "{Op::Replace, 0, 0, 1, Letters::OneByte, 0},\n");
    EXPECT_EQ(textstore::rowOf(few[2]), "{Op::ReadWhole, 0, 0, 1, Letters::OneByte, 0},\n");
}

} // namespace
