#include "ReportSubject.h"

#include "CompressedFaces.h"
#include "KeptDocument.h"
#include "PdfExport.h"

#include <QBuffer>

#include <gtest/gtest.h>

namespace
{

// What asks for less is fontconfig, which does not look whether it got it.
constexpr std::size_t beyondFontconfig = 8192;

/// @param isKept  whether the process has written such a PDF before
void expectWholeOrSaid(bool isDescribed, bool isKept)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetAutoDelete(false);
    report.FixPage(20, 80);
    ASSERT_EQ(report.SetPageSize(), 1);
    report.SetHeaderFlag(true);
    report.AnnounceEntry(0, QStringLiteral("an entry"));
    for (int line = 0; line < 60; ++line) {
        report.WriteLine(QStringLiteral("%1 a line of a report, %2").arg(line).arg(line * 1.25), 0, 1, 0);
    }
    const QString text = report.CopyText();
    kareport::PdfDetails details;
    details.title = QStringLiteral("a title");
    QBuffer whole;
    whole.open(QIODevice::WriteOnly);
    ASSERT_TRUE(report.WritePdf(whole, nullptr, {}, isDescribed ? &details : nullptr));
    const qint64 allocations = failingEachAllocation([&](qint64 number) {
        if (!isKept) {
            kareport::CompressedFaces::ofProcess().keep(QByteArray(kareport::CompressedFaces::mostBytes - 1, 'x'), "x");
            kareport::KeptDocuments::ofProcess().clear();
        } else { // what failed before has left no document
            QBuffer earlier;
            earlier.open(QIODevice::WriteOnly);
            EXPECT_TRUE(report.WritePdf(earlier, nullptr, {}, isDescribed ? &details : nullptr));
            EXPECT_TRUE(earlier.data() == whole.data()) << number;
        }
        QBuffer device;
        device.open(QIODevice::WriteOnly);
        kareport::PdfNotes notes;
        bool isWritten = false;
        bool hasFailed = false;
        {
            const FailingAllocation failing(number, beyondFontconfig);
            EXPECT_NO_THROW(isWritten = report.WritePdf(device, &notes, {}, isDescribed ? &details : nullptr))
                << number;
            hasFailed = failing.hasFailed();
        }
        EXPECT_EQ(isWritten, device.data() == whole.data()) << number << " of " << device.data().size();
        EXPECT_NE(isWritten, !notes.problem.isEmpty()) << number << ": " << notes.problem.toStdString();
        EXPECT_TRUE(report.CopyText() == text) << number;
        EXPECT_FALSE(report.HasLostText()) << number;
        return hasFailed && !testing::Test::HasFailure();
    });
    EXPECT_GT(allocations, 10);
}

TEST(PdfAllocations, APdfIsWrittenWholeOrItIsSaid)
{
    expectWholeOrSaid(false, false);
}

TEST(PdfAllocations, WhatItSaysOfItselfAsWell)
{
    expectWholeOrSaid(true, false);
}

TEST(PdfAllocations, WithAFaceThatWasKeptAsWell)
{
    expectWholeOrSaid(false, true);
}

} // namespace
