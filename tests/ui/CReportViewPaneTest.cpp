#include "CReportViewPane.h"

#include "SaveDialog.h"
#include "UXTPMDIFrameWnd.h"
#include "ViewFixture.h"

#include <QAbstractButton>
#include <QAction>
#include <QTemporaryDir>
#include <QTranslator>

#include <functional>

namespace
{

constexpr unsigned scClose = 61536;

/// A frame with an application whose reports are in panes of their own, and what is said to its user.
class ReportPanes
{
public:
    ReportPanes()
    {
        application->AddDocTemplate(kareport::makeReportTemplate([] { return new CReportViewPane; },
                                                                 [] { return std::make_unique<UReportView>(); }));
        frame.resize(800, 500);
        frame.show();
        kareport::setMessageBox([this](const kareport::Message &message) {
            messages.push_back(message);
            if (meanwhile) {
                meanwhile();
            }
            return answer;
        });
    }
    ~ReportPanes()
    {
        application.reset(); // closes what is still open
        kareport::setMessageBox({});
        kareport::setSaveDialog({});
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }
    ReportPanes(const ReportPanes &) = delete;
    ReportPanes &operator=(const ReportPanes &) = delete;

    /// A report that is called N, shown in a pane.
    static UReportDoc *create(const QString &text, bool modified)
    {
        UReportDoc *report = CreateReport(QStringLiteral("N"), false, false, nullptr, 0, nullptr);
        report->SetData(text);
        report->UpdateAllViews(nullptr);
        report->SetModifiedFlag(modified);
        return report;
    }
    static CReportViewPane &paneOf(const UReportDoc &report, std::size_t view = 0)
    {
        return dynamic_cast<CReportViewPane &>(*report.GetViews().at(view)->GetParentPane());
    }

    FixedSurroundings surroundings;
    UXTPMDIFrameWnd frame;
    std::unique_ptr<UApplication> application = std::make_unique<UApplication>();
    MessageAnswer answer = MessageAnswer::Cancel;
    std::vector<kareport::Message> messages;
    std::function<void()> meanwhile; ///< runs while a message is shown
};

/// A way in which a user closes a pane.
struct Way
{
    void (*close)(CReportViewPane &pane);
    const char *name;
};

constexpr Way ways[] = {
    {[](CReportViewPane &pane) { pane.OnSysCommand(scClose, 0); }, "the system command"},
    {[](CReportViewPane &pane) { pane.GetDock()->close(); }, "the window"},
    {[](CReportViewPane &pane) {
         QTest::mouseClick(pane.GetDock()->findChild<QAbstractButton *>(QStringLiteral("qt_dockwidget_closebutton")),
                           Qt::LeftButton);
     },
     "the close box"},
    {[](CReportViewPane &pane) {
         pane.GetDock()->setFloating(true);
         pane.GetDock()->close();
     },
     "a window of its own"},
    {[](CReportViewPane &pane) {
         QAction *shown = pane.GetDock()->toggleViewAction();
         shown->setChecked(true); // as it is while the pane can be seen
         shown->trigger();
     },
     "the frame's list of panes"},
};

TEST(CReportViewPane, RefusesToCloseWhileAnEditorHoldsTheReport)
{
    for (const Way &way : ways) {
        ReportPanes desk;
        desk.answer = MessageAnswer::Ok;
        UReportDoc *report = ReportPanes::create(QStringLiteral("one\r\ntwo\r\n"), true);
        CReportViewPane &pane = ReportPanes::paneOf(*report);
        auto *view = dynamic_cast<UReportView *>(report->GetViews().front());
        putCursor(view->GetEdit(), 5);
        report->EnableCloseOption(false);
        way.close(pane);
        ASSERT_EQ(desk.messages.size(), 1U) << way.name << ": nothing asks whether to save";
        const kareport::Message &message = desk.messages[0];
        EXPECT_EQ(message.text, QStringLiteral("The Report can only be closed when the associated editor is closed"))
            << way.name;
        EXPECT_EQ(message.caption, QStringLiteral("Error")) << way.name;
        EXPECT_EQ(message.buttons, MessageButtons::Ok) << way.name;
        EXPECT_EQ(message.icon, kareport::MessageIcon::Information) << way.name;

        ASSERT_TRUE(UReportDoc::IsReportAvailable(report)) << way.name;
        ASSERT_TRUE(CViewPane::IsOpen(&pane)) << way.name;
        EXPECT_TRUE(pane.GetDock()->isVisible()) << way.name;
        EXPECT_EQ(pane.GetCaption(), QStringLiteral("N")) << way.name;
        EXPECT_EQ(report->GetViews(), std::vector<UView *>{view}) << way.name;
        EXPECT_EQ(view->GetEdit().toPlainText(), QStringLiteral("one\ntwo\n")) << way.name;
        EXPECT_EQ(view->GetEdit().textCursor().position(), 5) << way.name;
        EXPECT_EQ(textOf(*report), QStringLiteral("one\r\ntwo\r\n")) << way.name;
        EXPECT_TRUE(report->IsModified()) << way.name;
        EXPECT_FALSE(report->EnableCloseOption()) << way.name;

        report->EnableCloseOption(true);
        report->SetModifiedFlag(false);
        way.close(pane);
        EXPECT_FALSE(UReportDoc::IsReportAvailable(report)) << way.name << ": the editor is closed";
        EXPECT_EQ(desk.messages.size(), 1U) << way.name;
    }
}

/// Gives every text back with its note, in brackets.
class Translator : public QTranslator
{
public:
    Translator() { QCoreApplication::installTranslator(this); }
    ~Translator() override { QCoreApplication::removeTranslator(this); }

    QString translate(const char * /*context*/, const char *text, const char *note, int /*number*/) const override
    {
        return QStringLiteral("[%1][%2]").arg(QString::fromUtf8(text), QString::fromUtf8(note));
    }
    bool isEmpty() const override { return false; }
};

TEST(CReportViewPane, RefusesInTheUsersLanguage)
{
    ReportPanes desk;
    UReportDoc *report = ReportPanes::create(QString(), false);
    report->EnableCloseOption(false);
    const Translator translator;
    ReportPanes::paneOf(*report).OnSysCommand(scClose, 0);
    ASSERT_EQ(desk.messages.size(), 1U);
    EXPECT_EQ(desk.messages[0].text,
              QStringLiteral("[The Report can only be closed when the associated editor is closed][]"));
    EXPECT_EQ(desk.messages[0].caption, QStringLiteral("[Error][Alert Message title]")) << "a note for the translator";
}

TEST(CReportViewPane, OtherSystemCommandsNeitherCloseNorRefuse)
{
    struct Row
    {
        unsigned command;
        const char *reason;
    };
    constexpr Row rows[] = {
        {61440, "size"},     {61456, "move"},    {61472, "minimise"},
        {61488, "maximise"}, {61728, "restore"}, {57602, "a menu's Close, which is the view's"},
    };
    for (const bool held : {true, false}) {
        ReportPanes desk;
        UReportDoc *report = ReportPanes::create(QString(), true);
        report->EnableCloseOption(!held);
        for (const Row &row : rows) {
            ReportPanes::paneOf(*report).OnSysCommand(row.command, 0);
            ASSERT_EQ(report->GetViews().size(), 1U) << row.reason;
            EXPECT_TRUE(ReportPanes::paneOf(*report).GetDock()->isVisible()) << row.reason;
            EXPECT_TRUE(desk.messages.empty()) << row.reason;
        }
    }
}

TEST(CReportViewPane, WithoutAViewOfAReportItAlwaysCloses)
{
    ReportPanes desk;
    FrameLog log;
    UReportDoc held; // destroyed after its pane
    held.SetAutoDelete(false);
    held.EnableCloseOption(false);

    auto *empty = new CReportViewPane;
    EXPECT_TRUE(empty->CanClosePane());
    empty->OnSysCommand(scClose, 0);
    EXPECT_FALSE(CViewPane::IsOpen(empty)) << "no view";

    auto *idle = new CReportViewPane;
    idle->AddView(std::make_unique<UReportView>());
    EXPECT_TRUE(idle->CanClosePane());
    idle->OnSysCommand(scClose, 0);
    EXPECT_FALSE(CViewPane::IsOpen(idle)) << "a report view without a document";

    auto *text = new CReportViewPane;
    auto *document = new TextDocument(log);
    showIn<UReportView>(*text, *document);
    document->SetModifiedFlag();
    EXPECT_TRUE(text->CanClosePane());
    text->OnSysCommand(scClose, 0);
    EXPECT_FALSE(CViewPane::IsOpen(text)) << "a document that is not a report is not asked";
    EXPECT_EQ(log.documents, 0);

    auto *other = new CReportViewPane;
    addRecordingView(*other, held);
    other->OnSysCommand(scClose, 0);
    EXPECT_FALSE(CViewPane::IsOpen(other)) << "the editor takes the place of the report's own view alone";
    EXPECT_TRUE(desk.messages.empty());
}

TEST(CReportViewPane, TheReportSaysWhetherItMayBeClosed)
{
    struct Row
    {
        bool modified;
        int canClose;
        MessageAnswer answer;
        bool named; ///< whether the user gives a file name when he is asked for one
        bool closes;
        std::size_t questions;
        const char *reason;
    };
    constexpr Row rows[] = {
        {false, 1, MessageAnswer::Cancel, false, true, 0, "nothing to save"},
        {true, 1, MessageAnswer::No, false, true, 1, "not to be saved"},
        {true, 1, MessageAnswer::Cancel, false, false, 1, "not to be closed"},
        {true, 1, MessageAnswer::Yes, true, true, 1, "saved"},
        {true, 1, MessageAnswer::Yes, false, false, 1, "to be saved, but under no name"},
        {false, 0, MessageAnswer::No, false, false, 0, "forbidden"},
        {true, 0, MessageAnswer::No, false, false, 0, "forbidden without asking"},
    };
    for (const Row &row : rows) {
        const QTemporaryDir folder;
        const QString path = folder.filePath(QStringLiteral("saved.rep"));
        ReportPanes desk;
        desk.answer = row.answer;
        kareport::setSaveDialog([&](const kareport::SaveRequest &) -> std::optional<QString> {
            return row.named ? std::optional(path) : std::nullopt;
        });
        UReportDoc *report = ReportPanes::create(QStringLiteral("text\r\n"), row.modified);
        CReportViewPane &pane = ReportPanes::paneOf(*report);
        report->SetCanClose(row.canClose);
        EXPECT_EQ(pane.CanClosePane(), row.closes) << row.reason;
        EXPECT_TRUE(UReportDoc::IsReportAvailable(report)) << row.reason << ": asking closes nothing";
        EXPECT_EQ(desk.messages.size(), row.questions) << row.reason;
        for (const kareport::Message &message : desk.messages) {
            EXPECT_EQ(message.text, QStringLiteral("Save changes to N?")) << row.reason;
            EXPECT_EQ(message.buttons, MessageButtons::YesNoCancel) << row.reason;
        }
        EXPECT_EQ(QFile::exists(path), row.named) << row.reason;
        EXPECT_EQ(report->IsModified(), row.modified && !row.named) << row.reason;

        pane.OnSysCommand(scClose, 0);
        EXPECT_NE(UReportDoc::IsReportAvailable(report), row.closes) << row.reason << ": closing asks the same";
    }
}

TEST(CReportViewPane, EveryWayOfClosingAsks)
{
    for (const Way &way : ways) {
        ReportPanes desk;
        UReportDoc *report = ReportPanes::create(QStringLiteral("text\r\n"), true);
        CReportViewPane &pane = ReportPanes::paneOf(*report);
        const QPointer<QDockWidget> dock = pane.GetDock();
        const QPointer<QWidget> window = report->GetViews().front()->GetWidget();
        way.close(pane);
        EXPECT_EQ(desk.messages.size(), 1U) << way.name;
        ASSERT_TRUE(UReportDoc::IsReportAvailable(report)) << way.name << ": cancelled";
        EXPECT_TRUE(dock->isVisible()) << way.name;
        EXPECT_TRUE(report->IsModified()) << way.name;

        desk.answer = MessageAnswer::No;
        way.close(pane);
        EXPECT_EQ(desk.messages.size(), 2U) << way.name;
        EXPECT_FALSE(UReportDoc::IsReportAvailable(report)) << way.name;
        EXPECT_FALSE(CViewPane::IsOpen(&pane)) << way.name;
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        EXPECT_TRUE(dock.isNull()) << way.name << ": nothing is left in the frame";
        EXPECT_TRUE(window.isNull()) << way.name;
    }
}

TEST(CReportViewPane, OfSeveralPanesOnlyTheLastAsks)
{
    for (const std::size_t firstClosed : {0U, 1U, 2U}) {
        ReportPanes desk;
        UReportDoc *report = ReportPanes::create(QStringLiteral("text\r\n"), false);
        report->Activate(true);
        report->Activate(true);
        report->SetModifiedFlag(true);
        ASSERT_EQ(report->GetViews().size(), 3U);
        for (std::size_t i = 0; i < 3; ++i) {
            EXPECT_EQ(ReportPanes::paneOf(*report, i).GetDock()->windowTitle(), QStringLiteral("N:%1").arg(i + 1));
        }
        ReportPanes::paneOf(*report, firstClosed).OnSysCommand(scClose, 0);
        ReportPanes::paneOf(*report, 0).GetDock()->close();
        ASSERT_EQ(report->GetViews().size(), 1U) << firstClosed;
        EXPECT_TRUE(desk.messages.empty()) << "another pane keeps the report";
        CReportViewPane &last = ReportPanes::paneOf(*report);
        EXPECT_EQ(last.GetDock()->windowTitle(), QStringLiteral("N")) << "an only pane has no number";
        EXPECT_EQ(textOf(*report), QStringLiteral("text\r\n"));

        last.OnSysCommand(scClose, 0);
        EXPECT_EQ(desk.messages.size(), 1U);
        ASSERT_TRUE(UReportDoc::IsReportAvailable(report));
        desk.answer = MessageAnswer::No;
        last.OnSysCommand(scClose, 0);
        EXPECT_EQ(desk.messages.size(), 2U);
        EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
    }
}

TEST(CReportViewPane, EveryPaneOfAHeldReportRefuses)
{
    ReportPanes desk;
    UReportDoc *report = ReportPanes::create(QString(), false);
    report->Activate(true);
    report->EnableCloseOption(false);
    UReportDoc *other = ReportPanes::create(QString(), false);
    for (std::size_t i = 0; i < 2; ++i) {
        ReportPanes::paneOf(*report, i).OnSysCommand(scClose, 0);
        EXPECT_EQ(report->GetViews().size(), 2U) << "although the other one would keep the report";
        EXPECT_EQ(desk.messages.size(), i + 1);
    }
    ReportPanes::paneOf(*other).OnSysCommand(scClose, 0);
    EXPECT_FALSE(UReportDoc::IsReportAvailable(other)) << "another report closes";
    EXPECT_EQ(desk.messages.size(), 2U);
}

TEST(CReportViewPane, TheReportMayBeClosedWhileItsPaneAsks)
{
    for (const Way &way : ways) {
        for (const MessageAnswer answer : {MessageAnswer::Yes, MessageAnswer::No, MessageAnswer::Cancel}) {
            ReportPanes desk;
            desk.answer = answer;
            int saves = 0;
            kareport::setSaveDialog([&saves](const kareport::SaveRequest &) -> std::optional<QString> {
                ++saves;
                return std::nullopt;
            });
            UReportDoc *report = ReportPanes::create(QStringLiteral("text\r\n"), true);
            desk.meanwhile = [report] { report->OnCloseDocument(); };
            way.close(ReportPanes::paneOf(*report));
            EXPECT_EQ(desk.messages.size(), 1U) << way.name;
            EXPECT_FALSE(UReportDoc::IsReportAvailable(report)) << way.name;
            EXPECT_EQ(saves, 0) << way.name << ": there is nothing left to save";
        }
    }
}

TEST(CReportViewPane, ItsPanesMayBeClosedWhileTheReportStays)
{
    for (const Way &way : ways) {
        ReportPanes desk;
        desk.answer = MessageAnswer::No;
        UReportDoc *report = ReportPanes::create(QStringLiteral("text\r\n"), true);
        report->SetAutoDelete(false);
        desk.meanwhile = [report] { report->OnCloseDocument(); };
        way.close(ReportPanes::paneOf(*report));
        ASSERT_TRUE(UReportDoc::IsReportAvailable(report)) << way.name;
        EXPECT_TRUE(report->GetViews().empty()) << way.name;
        report->SetAutoDelete(true);
        report->OnCloseDocument();
    }
}

TEST(CReportViewPane, TheReportMayBeClosedWhileItsNameIsAskedFor)
{
    for (const Way &way : ways) {
        const QTemporaryDir folder;
        const QString path = folder.filePath(QStringLiteral("a.rep"));
        ReportPanes desk;
        desk.answer = MessageAnswer::Yes;
        UReportDoc *report = ReportPanes::create(QStringLiteral("text\r\n"), true);
        kareport::setSaveDialog([&](const kareport::SaveRequest &) {
            report->OnCloseDocument();
            return std::optional(path);
        });
        way.close(ReportPanes::paneOf(*report));
        EXPECT_FALSE(UReportDoc::IsReportAvailable(report)) << way.name;
        EXPECT_FALSE(QFile::exists(path)) << way.name;
        EXPECT_EQ(desk.messages.size(), 1U) << way.name << ": no word of a save that failed";
    }
}

TEST(CReportViewPane, TheMenusCloseInTheSameWay)
{
    for (const MessageAnswer answer : {MessageAnswer::Yes, MessageAnswer::No, MessageAnswer::Cancel}) {
        ReportPanes desk;
        desk.answer = answer;
        UReportDoc *report = ReportPanes::create(QStringLiteral("text\r\n"), true);
        desk.meanwhile = [report] { report->OnCloseDocument(); };
        EXPECT_TRUE(dynamic_cast<UReportView *>(report->GetViews().front())->runCommand(57602));
        EXPECT_EQ(desk.messages.size(), 1U);
        EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
    }
}

} // namespace
