#include "DeskFixture.h"

#include "DeskPreferences.h"
#include "EditorHold.h"
#include "EditorLauncher.h"

#include <gtest/gtest.h>

namespace
{

/// A program that runs as long as a file is there.
class WaitingEditor
{
public:
    WaitingEditor()
    {
        folder_.put("open", "");
        folder_.put("editor", "#!/bin/sh\ntouch \"" + QFile::encodeName(folder_.path("started")) + "\"\nwhile [ -e \"" +
                                  QFile::encodeName(folder_.path("open")) + "\" ]; do sleep 0.05; done\ntouch \"" +
                                  QFile::encodeName(folder_.path("ended")) + "\"\n");
        QFile::setPermissions(path(), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    }
    ~WaitingEditor() { close(); }
    WaitingEditor(const WaitingEditor &) = delete;
    WaitingEditor &operator=(const WaitingEditor &) = delete;

    QString path() const { return folder_.path("editor"); }
    bool hasStarted() const { return QFile::exists(folder_.path("started")); }
    bool hasEnded() const { return QFile::exists(folder_.path("ended")); }
    void close() const { QFile::remove(folder_.path("open")); }

private:
    JobFolder folder_;
};

void preferEditor(const QString &path, bool keeps)
{
    kareport::DeskPreferences preferences = kareport::loadPreferences();
    preferences.usesEditor = true;
    preferences.editor = path;
    preferences.keepsForEditor = keeps;
    kareport::savePreferences(preferences);
}

TEST(EditorHold, AReportStaysOpenWhileItsEditorIs)
{
    struct Row
    {
        bool keeps;
        const char *reason;
    };
    for (const Row &row : {Row{true, "the user wants it kept"}, Row{false, "the user does not"}}) {
        const WaitingEditor editor;
        Desk desk;
        preferEditor(editor.path(), row.keeps);
        UReportDoc *report = CreateReport(QStringLiteral("R"), false, true, nullptr, 0, nullptr);
        report->WriteLine(QStringLiteral("x"), 0, 1, 0);
        report->UpdateAllViews(nullptr);
        EXPECT_TRUE(QTest::qWaitFor([&editor] { return editor.hasStarted(); })) << row.reason;
        EXPECT_EQ(report->EnableCloseOption(), !row.keeps) << row.reason;
        editor.close();
        EXPECT_TRUE(QTest::qWaitFor([report] { return report->EnableCloseOption(); })) << row.reason;
        desk.answer = MessageAnswer::No;
    }
}

/// A report that an editor shows.
UReportDoc *reportIn(const WaitingEditor &editor)
{
    preferEditor(editor.path(), true);
    UReportDoc *report = CreateReport(QStringLiteral("R"), false, true, nullptr, 0, nullptr);
    report->WriteLine(QStringLiteral("x"), 0, 1, 0);
    report->UpdateAllViews(nullptr);
    EXPECT_TRUE(QTest::qWaitFor([&editor] { return editor.hasStarted(); }));
    return report;
}

/// Closes an editor and waits until it has been found closed: another one, which is closed after it, releases its report.
void closeAndWait(const WaitingEditor &editor, const UReportDoc &other, const WaitingEditor &itsEditor)
{
    editor.close();
    EXPECT_TRUE(QTest::qWaitFor([&editor] { return editor.hasEnded(); }));
    itsEditor.close();
    EXPECT_TRUE(QTest::qWaitFor([&other] { return other.EnableCloseOption(); }));
}

TEST(EditorHold, TheLastOfSeveralEditorsReleasesIt)
{
    const WaitingEditor first;
    const WaitingEditor second;
    const WaitingEditor another;
    Desk desk;
    desk.answer = MessageAnswer::No;
    const UReportDoc *other = reportIn(another);
    UReportDoc *report = reportIn(first);
    preferEditor(second.path(), true);
    report->UpdateAllViews(nullptr);
    EXPECT_TRUE(QTest::qWaitFor([&second] { return second.hasStarted(); }));
    closeAndWait(first, *other, another);
    EXPECT_FALSE(report->EnableCloseOption());
    second.close();
    EXPECT_TRUE(QTest::qWaitFor([report] { return report->EnableCloseOption(); }));
}

TEST(EditorHold, AReportThatHasGoneMeanwhileIsNotTouched)
{
    const WaitingEditor editor;
    const WaitingEditor another;
    Desk desk;
    desk.answer = MessageAnswer::No;
    const UReportDoc *other = reportIn(another);
    UReportDoc *report = reportIn(editor);
    report->OnCloseDocument();
    closeAndWait(editor, *other, another);
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
}

TEST(EditorHold, AProgramThatCannotBeStartedHoldsNothing)
{
    Desk desk;
    UReportDoc *report = CreateReport(QStringLiteral("R"), false, false, nullptr, 0, nullptr);
    kareport::launchEditor(QStringLiteral("/no/such/program"), QStringLiteral("/tmp/x.rep"), QString(), report);
    EXPECT_TRUE(report->EnableCloseOption());
}

TEST(EditorHold, AReportThatComesInThePlaceOfAClosedOneIsNotHeld)
{
    const WaitingEditor editor;
    Desk desk;
    desk.answer = MessageAnswer::No;
    preferEditor(editor.path(), true);
    UReportDoc *report = CreateReport(QStringLiteral("R"), false, false, nullptr, 0, nullptr);
    report->SetModifiedFlag(false);
    kareport::EditorHold hold;
    kareport::launchEditor(editor.path(), QStringLiteral("/tmp/x.rep"), QString(), report);
    EXPECT_TRUE(QTest::qWaitFor([&editor] { return editor.hasStarted(); }));
    EXPECT_TRUE(hold.holds(*report));
    hold.forget(report); // what has its address from now on is another one
    EXPECT_FALSE(hold.holds(*report));
    report->EnableCloseOption(true);
}

} // namespace
