#include "ModelledReport.h"
#include "RandomRuns.h"
#include "RandomSequence.h"
#include "TestSize.h"

#include <memory>

// Random operations of a host and of users on reports with several views, against a plain model of each. A sequence that
// fails is shortened and printed as the steps of a test.

namespace
{

/// The reports that are open, with one clipboard.
class ModelledReports
{
public:
    ModelledReports() { open(); }

    /// @return what is wrong afterwards, with any of them; empty when nothing is
    QString carryOut(const ReportStep &step)
    {
        constexpr std::size_t most = 3;
        const std::size_t number = std::size_t(step.report) % reports_.size();
        QString wrong;
        if (step.op == ReportOp::OpenReport) {
            if (reports_.size() < most) {
                open();
            }
        } else if (step.op == ReportOp::CloseReport) {
            if (reports_.size() > 1) {
                reports_.erase(reports_.begin() + std::ptrdiff_t(number));
            }
        } else {
            wrong = reports_[number]->carryOut(step);
        }
        for (std::size_t i = 0; i < reports_.size() && wrong.isEmpty(); ++i) {
            wrong = i == number ? QString() : reports_[i]->compare();
        }
        return wrong;
    }

private:
    void open() { reports_.push_back(std::make_unique<ModelledReport>(clipboard_)); }

    QString clipboard_;
    std::vector<std::unique_ptr<ModelledReport>> reports_;
};

/// @param done  receives how many steps were carried out when something was wrong
QString play(const std::vector<ReportStep> &steps, std::size_t *done = nullptr)
{
    ModelledReports reports;
    for (std::size_t i = 0; i < steps.size(); ++i) {
        QString wrong = reports.carryOut(steps[i]);
        if (!wrong.isEmpty()) {
            if (done != nullptr) {
                *done = i + 1;
            }
            return wrong;
        }
    }
    return QString();
}

/// @param longTexts  whether texts come that are loaded in pieces
std::vector<ReportStep> randomSteps(quint64 seed, bool longTexts)
{
    const int length = longTexts ? 40 : 120;
    RandomNumbers random(seed);
    std::vector<ReportStep> steps;
    for (int i = 0; i < length; ++i) {
        // Users have more to do than hosts, and undo most of it.
        auto op = static_cast<ReportOp>(random.below(int(ReportOp::count)));
        if (random.below(3) == 0) {
            op = static_cast<ReportOp>(int(ReportOp::Type) +
                                       random.below(int(ReportOp::Redo) - int(ReportOp::Type) + 1));
        } else if (random.below(4) == 0) {
            constexpr ReportOp often[] = {ReportOp::Undo, ReportOp::Undo, ReportOp::Table, ReportOp::Rows};
            op = often[random.below(int(std::size(often)))];
        } else if ((op == ReportOp::SetData || op == ReportOp::Clear || op == ReportOp::RichText ||
                    op == ReportOp::RichTextOn) &&
                   random.below(4) != 0)
        {
            op = ReportOp::WriteLine;
        }
        if (op == ReportOp::SetLongData && !longTexts) {
            op = ReportOp::SetData;
        }
        steps.push_back({op, random.below(1000), random.below(5000), random.below(1000), random.below(3)});
    }
    return steps;
}

/// @return the shortest sequence that is found for a seed; empty when nothing is wrong
std::string foundWith(quint64 seed, bool longTexts)
{
    std::vector<ReportStep> steps = randomSteps(seed, longTexts);
    std::size_t done = 0;
    if (play(steps, &done).isEmpty()) {
        return {};
    }
    steps.resize(done);
    steps = shortenedSequence<ReportStep>(
        steps, [](const std::vector<ReportStep> &shorter) { return !play(shorter).isEmpty(); });
    QString text;
    for (const ReportStep &step : steps) {
        text += textOf(step);
    }
    return "seed " + std::to_string(seed) + ": " + play(steps).toStdString() + "\n" + text.toStdString();
}

TEST(DocumentAndViewsRandom, AgreeWithThePlainModel)
{
    RandomRuns runs("Document and views", 2024, testSize(40, 150));
    while (runs.next()) {
        ASSERT_EQ(foundWith(runs.seed(), false), "");
    }
}

TEST(DocumentAndViewsRandom, AgreeWithThePlainModelWhileLongTextsAreLoaded)
{
    RandomRuns runs("Long documents and views", 4048, testSize(2, 6));
    while (runs.next()) {
        ASSERT_EQ(foundWith(runs.seed(), true), "");
    }
}

TEST(DocumentAndViewsRandom, SequencesThatWereFound)
{
    struct Row
    {
        std::vector<ReportStep> steps;
        const char *reason;
    };
    const Row rows[] = {
        {{{ReportOp::HeaderFlag, 106, 695, 208},
          {ReportOp::Rows, 100, 4574, 796},
          {ReportOp::WriteLine, 492, 1756, 346},
          {ReportOp::TypeOver, 263, 2394, 279},
          {ReportOp::Rows, 976, 2227, 851},
          {ReportOp::TypeOver, 51, 3135, 471},
          {ReportOp::Undo, 438, 4587, 831}},
         "the end of a header line is not one itself"},
        {{{ReportOp::Rows, 14, 0, 0}, {ReportOp::Cut, 0, 40, 501}, {ReportOp::Undo, 0, 0, 0}},
         "a cut over a page's start, undone"},
        {{{ReportOp::LineFeed, 7, 0, 0}, {ReportOp::NewPage, 0, 0, 0}},
         "blank lines alone are one page, whatever was begun in them"},
        {{{ReportOp::Rows, 624, 4188, 51},
          {ReportOp::Rows, 692, 2011, 425},
          {ReportOp::Cut, 578, 1176, 295},
          {ReportOp::SetData, 251, 3635, 7},
          {ReportOp::Paste, 940, 3942, 859},
          {ReportOp::LineFeed, 717, 4510, 946},
          {ReportOp::Cut, 223, 4640, 216},
          {ReportOp::Undo, 390, 2592, 345}},
         "a header line that begins no page, cut and brought back"},
        {{{ReportOp::TypeOver, 877, 1652, 272, 1},
          {ReportOp::WriteLine, 539, 2722, 175, 1},
          {ReportOp::TakeAll, 946, 1662, 70, 1}},
         "a page that began within a line is lost when the text is taken whole, though the line reads like a header"},
        {{{ReportOp::SetData, 941, 1838, 619},
          {ReportOp::Type, 670, 2508, 137},
          {ReportOp::TypeOver, 749, 1814, 135},
          {ReportOp::Backspace, 260, 1848, 252},
          {ReportOp::TypeOver, 75, 2190, 977},
          {ReportOp::TakeAll, 506, 2294, 895}},
         "a header line that begins no page, in a text that is taken over as a whole"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(play(row.steps).toStdString(), "") << row.reason;
    }
}

} // namespace
