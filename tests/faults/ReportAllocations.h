#pragma once

#include "ReportSubject.h"

#include <gtest/gtest.h>

#include <iosfwd>
#include <string>

/// Something that a host does with a report.
struct ReportOperation
{
    /// What becomes of the text when memory ends in it.
    enum class Text
    {
        Same,     ///< it stays
        Written,  ///< it stays, with a part of what was to be written after it; what is missing is known
        Replaced, ///< it stays or is edited, nothing between
        Set       ///< it is the new one, or empty and lost
    };

    const char *name;
    Text text;
    bool (*act)(ReportSubject &subject, const Surroundings &around); ///< whether it says that all was done
    Shape shape;
    bool isSave = false; ///< to s.rep or s.rtf
};

void PrintTo(const ReportOperation &operation, std::ostream *out);
/// A test's name for an operation: its words without what no name holds.
std::string nameOf(const testing::TestParamInfo<ReportOperation> &info);

/// Whether a report has all that was written into it.
inline bool lostNothing(const ReportSubject &subject)
{
    return !subject.report.HasLostText();
}

/// Does an operation on reports of all kinds, each time with another of its requests for memory failing. The operations of
/// several files are tried with it.
class ReportAllocations : public testing::TestWithParam<ReportOperation>
{
protected:
    ReportAllocations();

    /// The operation on plain and on rich-text reports, with a window and without.
    void tryAll();

private:
    /// What an operation leaves of a report.
    struct Result
    {
        QString text;
        QString answer;
        QByteArray bytes;
    };

    static Result resultOf(const ReportSubject &subject);
    bool attempt(const Shape &shape, qint64 number, const Result &whole);
    static void checkText(const UReportDoc &report, const QString &before, const QString &whole, bool isDone);
    void checkUsable(UReportDoc &report);
    void checkNotSaved(UReportDoc &report);
    void closeConverted();

    Surroundings around_;
};
