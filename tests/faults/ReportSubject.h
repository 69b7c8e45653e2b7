#pragma once

#include "DataRemarks.h"
#include "DataReport.h"
#include "EditorFixture.h"
#include "FailingAllocation.h"
#include "LoadedText.h"
#include "PageMark.h"
#include "Placeholders.h"
#include "ReportAccess.h"
#include "ReportSurroundings.h"
#include "ReportWindowFixture.h"
#include "TemporaryFolder.h"
#include "UDataObjectList.h"
#include "UPointNumber.h"

#include <QBuffer>

#include <memory>
#include <optional>
#include <vector>

/// A host document that takes the texts that users have written for its objects.
class TakingDocument : public UDocument
{
public:
    bool OnTextReceived(unsigned /*id*/, const QString &text) override
    {
        received = text;
        return true;
    }

    QString received;
};

/// What all reports of these tests share: files, an editor that is only recorded, an application.
class Surroundings
{
public:
    Surroundings() : editor(QStringLiteral("editor"))
    {
        folders_.putIntoLibrary(markup::surveyTemplate(
            markup::output("Table", "Points", "Survey", {markup::field("Number", "Point", "12")}, {"Number"}),
            markup::output("Block", "Site", "Survey",
                           {markup::field("Number", "Point", "12"), markup::field("Note", "Note", "30")}),
            markup::separatorOption("124")));
        folders_.putIntoLibrary(templateWithPlaceholders(), "placeholders.xml");
        SetUsePreferredReportEditorFlag(false);
        kareport::setDefaultPrinter({kareport::PrinterSource::None}); // no font is measured: see "What is not tried"
    }

private:
    /// The same data with a bearing, under labels with placeholders.
    static QByteArray templateWithPlaceholders()
    {
        const std::vector<QByteArray> fields = {markup::field("Number", "Point of page {page}", "12"),
                                                markup::field("Course", "Course in {angleUnit}", "20")};
        return markup::surveyTemplate(markup::output("Table", "Points", "Survey", fields, {"Number"}),
                                      markup::output("Block", "Site", "Survey", fields), markup::separatorOption("124"))
            .replace("</VariableList>", markup::variable(11, "Course", "BEARING") + "</VariableList>");
    }

    FixedSurroundings surroundings_;
    TemplateFolders folders_;
    TemporaryFolder folder_;

public:
    RecordedLaunches launches;
    const PreferredEditor editor;
    const AnsweredBoxes boxes{MessageAnswer::No};
    const QString templatePath = folders_.libraryPath() + QStringLiteral("/t.xml");
    const QString placeholdersPath = folders_.libraryPath() + QStringLiteral("/placeholders.xml");
    const QString loadPath = folder_.at(QStringLiteral("a.rep"));
    const QString richTextLoadPath = folder_.at(QStringLiteral("a.rtf"));
    const QString reportPath = folder_.at(QStringLiteral("s.rep"));
    const QString richTextPath = folder_.at(QStringLiteral("s.rtf"));
    ReportApplication application;
    TakingDocument *const receiver = static_cast<TakingDocument *>(
        application
            .AddDocTemplate(std::make_unique<UDocTemplate>(
                1, [] { return std::make_unique<TakingDocument>(); }, UDocTemplate::PaneFactory(),
                UDocTemplate::ViewFactory(), QStringLiteral("Objects"), 1, 1))
            ->OpenReportDocumentFile(QString(), 0, 0, nullptr, 0, nullptr));
};

/// How a report is made before something is done with it.
struct Shape
{
    bool isRichText = false;
    bool hasWindow = false;
    bool hasView = false;
    bool isLoaded = false;        ///< with its template, table and block
    bool hasPlaceholders = false; ///< in its texts; and what is written is looked at for remarks
};

/// A report that holds a line, and what an operation on it needs.
class ReportSubject
{
public:
    explicit ReportSubject(const Shape &shape)
    {
        report.SetAutoDelete(false);
        report.FixPage(20, 80);
        report.SetHeaderFlag(true);
        report.SetTitle(QStringLiteral("Title of a report"));
        // Each its own, so that its temporary names are free.
        static int number = 0;
        report.SetReportFileName(QStringLiteral("report%1").arg(++number));
        report.SetRTFDataFlag(shape.isRichText);
        if (shape.hasWindow) {
            window_ = new TestReportWindow;
            report.SetReportWindow(window_);
        }
        if (shape.hasView) {
            pane_ = new CountingPane;
            showIn<TestReportView>(*pane_, report)->plainText = "a text that the user has edited\r\n";
        }
        if (shape.hasPlaceholders) {
            placeholders.emplace(UJobSettings(), QStringLiteral("TALVEN"), QDateTime(), std::nullopt);
            remarks.measures = true;
            kareport::ReportSurroundings surroundings;
            surroundings.application = QStringLiteral("TALVEN");
            surroundings.printer = {kareport::PrinterSource::None};
            report.SetSurroundings(surroundings);
            kareport::ReportAccess::setHooks(report, {&*placeholders, &remarks});
        }
        if (shape.isLoaded) {
            EXPECT_TRUE(report.LoadTemplateXml(shape.hasPlaceholders ? QStringLiteral("placeholders.xml")
                                                                     : QStringLiteral("t.xml"),
                                               QStringLiteral("T"), QStringLiteral("Points"), QStringLiteral("Site")));
        }
        for (const char *name : {"first", "second", "third"}) {
            UDataObject &object = list.Add();
            object.Set(1, UPointNumber(QString::fromUtf8(name)));
            object.Set(6, QStringLiteral("a note"));
            object.Set(11, 1.25);
        }
        report.WriteLine(QStringLiteral("before"), 0, 1, 0);
        report.SetHeading(QStringLiteral("Heading"), 1, 1);
        loaded.text.append(QStringView(u"taken over\r\n"));
        loaded.lineEnds = 1;
        bytes.open(QIODevice::ReadWrite);
    }
    ~ReportSubject()
    {
        if (pane_ != nullptr && CViewPane::IsOpen(pane_)) {
            pane_->ClosePane();
        }
    }
    ReportSubject(const ReportSubject &) = delete;
    ReportSubject &operator=(const ReportSubject &) = delete;

    std::optional<kareport::Placeholders> placeholders;
    kareport::DataRemarks remarks;
    const QString marked =
        QStringLiteral("on page ") + QChar(kareport::pageMark) + QStringLiteral(", which has memory");
    UReportDoc report;
    UDataObjectList list;
    QString answer; ///< what an operation gives back
    QBuffer bytes;
    kareport::LoadedText loaded;      ///< that the report can take over
    std::vector<qint64> starts{0, 4}; ///< of pages

private:
    TestReportWindow *window_ = nullptr; ///< the report's
    CountingPane *pane_ = nullptr;
};

/// Does something again and again, with its first request for memory failing, then with its second, until it needs no more
/// of them. @param attempt  is given the number of the request, and says whether it failed
template <typename Attempt>
qint64 failingEachAllocation(Attempt attempt)
{
    constexpr qint64 most = 100000;
    qint64 number = 1;
    while (number < most && attempt(number)) {
        ++number;
    }
    EXPECT_LT(number, most) << "it does not come to an end";
    return number - 1;
}
