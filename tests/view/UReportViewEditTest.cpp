#include "ReportChange.h"
#include "ViewFixture.h"

#include <QClipboard>

namespace
{

using kareport::ReportEdit;

const QString pair = QString::fromUtf8("\xF0\x9F\x98\x80");

/// Types a key in a report view. In the text of a row, "|" is the cursor; with a second one, the selection's ends.
struct Row
{
    const char16_t *before;
    void (*act)(ReportEdit &edit);
    const char16_t *after;
    const char *reason;
};

void key(ReportEdit &edit, Qt::Key code, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
{
    QTest::keyClick(&edit, code, modifiers);
}

void paste(ReportEdit &edit, const QString &text)
{
    QApplication::clipboard()->setText(text);
    edit.paste();
}

constexpr Row edits[] = {
    {u"|", [](ReportEdit &e) { key(e, Qt::Key_A); }, u"a", "into an empty report"},
    {u"|", [](ReportEdit &e) { key(e, Qt::Key_Return); }, u"\n", "a line end into an empty report"},
    {u"|", [](ReportEdit &e) { key(e, Qt::Key_Backspace); }, u"", "nothing to delete"},
    {u"|ab\ncd", [](ReportEdit &e) { key(e, Qt::Key_X); }, u"xab\ncd", "before the first character"},
    {u"ab\ncd|", [](ReportEdit &e) { key(e, Qt::Key_X); }, u"ab\ncdx", "after the last character"},
    {u"ab\n|", [](ReportEdit &e) { key(e, Qt::Key_X); }, u"ab\nx", "after the last line end"},
    {u"a|b\ncd", [](ReportEdit &e) { key(e, Qt::Key_Return); }, u"a\nb\ncd", "a line is cut in two"},
    {u"a|b\ncd", [](ReportEdit &e) { key(e, Qt::Key_Return, Qt::ShiftModifier); }, u"a\nb\ncd",
     "there are no breaks within a line"},
    {u"a|b\ncd", [](ReportEdit &e) { key(e, Qt::Key_Tab); }, u"a\tb\ncd", "a tab is a character"},
    {u"ab|\ncd", [](ReportEdit &e) { key(e, Qt::Key_X); }, u"abx\ncd", "before a line end"},
    {u"ab\n|cd", [](ReportEdit &e) { key(e, Qt::Key_X); }, u"ab\nxcd", "after a line end"},
    {u"ab|\ncd", [](ReportEdit &e) { key(e, Qt::Key_Delete); }, u"abcd", "the line end after the cursor"},
    {u"ab\n|cd", [](ReportEdit &e) { key(e, Qt::Key_Backspace); }, u"abcd", "the line end before the cursor"},
    {u"ab\n\n|\ncd", [](ReportEdit &e) { key(e, Qt::Key_Backspace); }, u"ab\n\ncd", "one of three line ends"},
    {u"|ab\ncd", [](ReportEdit &e) { key(e, Qt::Key_Delete); }, u"b\ncd", "the first character"},
    {u"ab\ncd|", [](ReportEdit &e) { key(e, Qt::Key_Backspace); }, u"ab\nc", "the last character"},
    {u"ab\ncd|", [](ReportEdit &e) { key(e, Qt::Key_Delete); }, u"ab\ncd", "nothing after the last"},
    {u"ab\n|", [](ReportEdit &e) { key(e, Qt::Key_Backspace); }, u"ab", "the last line end"},
    {u"|\nab", [](ReportEdit &e) { key(e, Qt::Key_Delete); }, u"ab", "the first line end"},
    {u"a|b\nc|d", [](ReportEdit &e) { key(e, Qt::Key_X); }, u"axd", "a selection across a line end"},
    {u"|ab\ncd|", [](ReportEdit &e) { key(e, Qt::Key_X); }, u"x", "everything"},
    {u"|ab\ncd|", [](ReportEdit &e) { key(e, Qt::Key_Delete); }, u"", "everything goes"},
    {u"|ab\ncd\n|", [](ReportEdit &e) { e.cut(); }, u"", "everything is cut, with the last line end"},
    {u"a\U0001F600|b", [](ReportEdit &e) { key(e, Qt::Key_Backspace); }, u"ab", "both halves of a pair"},
    {u"a|\U0001F600b", [](ReportEdit &e) { key(e, Qt::Key_Delete); }, u"ab", "both halves, forwards"},
    {u"a\U0001F600|b", [](ReportEdit &e) { key(e, Qt::Key_X); }, u"a\U0001F600xb", "after a pair"},
    {u"a|b", [](ReportEdit &e) { paste(e, pair + QStringLiteral("\u6E2C")); }, u"a\U0001F600\u6E2Cb", "pasted"},
    {u"a|b", [](ReportEdit &e) { paste(e, QStringLiteral("1\r\n2\r3\n4")); }, u"a1\n2\n3\n4b",
     "line ends of all kinds are pasted as line ends"},
    {u"a|b", [](ReportEdit &e) { paste(e, QStringLiteral("1\u20282\u20293")); }, u"a1\n2\n3b",
     "separators of lines and paragraphs"},
    {u"|a\nb|", [](ReportEdit &e) { paste(e, QStringLiteral("x\n")); }, u"x\n", "over everything"},
    {u"a|b", [](ReportEdit &e) { paste(e, QStringLiteral("\u00A0")); }, u"a\u00A0b", "a no-break space stays one"},
    {u"a|b",
     [](ReportEdit &e) {
         key(e, Qt::Key_X);
         e.undo();
     },
     u"ab", "undone"},
    {u"a|b",
     [](ReportEdit &e) {
         key(e, Qt::Key_X);
         e.undo();
         e.redo();
     },
     u"axb", "done again"},
    {u"|a\nb|",
     [](ReportEdit &e) {
         e.cut();
         e.undo();
     },
     u"a\nb", "everything comes back"},
    {u"a|\nb",
     [](ReportEdit &e) {
         key(e, Qt::Key_Delete);
         e.undo();
     },
     u"a\nb", "a line end comes back"},
    {u"a|b",
     [](ReportEdit &e) {
         key(e, Qt::Key_Return);
         key(e, Qt::Key_Return);
         e.undo();
         e.undo();
     },
     u"ab", "line ends go again"},
    {u"ab cd|", [](ReportEdit &e) { key(e, Qt::Key_Backspace, Qt::ControlModifier); }, u"ab ", "a word"},
    {u"|ab", [](ReportEdit &e) { e.undo(); }, u"ab", "loading is nothing that can be undone"},
};

TEST(UReportViewEdit, EveryEditIsInTheDocumentAtOnce)
{
    for (const Row &row : edits) {
        const QStringList parts = QString::fromUtf16(row.before).split(u'|');
        ShownReport t(reportLines(parts.join(QString())));
        UReportView &view = t.open();
        UReportView &other = t.open();
        putCursor(view.GetEdit(), static_cast<int>(parts[0].size() + (parts.size() > 2 ? parts[1].size() : 0)),
                  static_cast<int>(parts[0].size()));
        row.act(view.GetEdit());
        const QString expected = QString::fromUtf16(row.after);
        EXPECT_EQ(textOf(t.report), reportLines(expected)) << row.reason;
        EXPECT_EQ(view.GetEdit().windowText(), reportLines(expected)) << row.reason;
        EXPECT_EQ(other.GetEdit().windowText(), reportLines(expected)) << row.reason << ", in the other view";
    }
}

TEST(UReportViewEdit, AnEditSetsTheModifiedFlagAndLoadingDoesNot)
{
    ShownReport t(QStringLiteral("ab\r\n"));
    UReportView &view = t.open();
    EXPECT_FALSE(t.report.IsModified());
    t.report.UpdateAllViews(nullptr);
    EXPECT_FALSE(t.report.IsModified());
    QTest::keyClick(&view.GetEdit(), Qt::Key_Left);
    EXPECT_FALSE(t.report.IsModified()) << "moving about";
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    EXPECT_TRUE(t.report.IsModified());
}

TEST(UReportViewEdit, OtherLineEndsBecomeCrLfWithTheFirstEdit)
{
    struct Line
    {
        const char16_t *text;
        const char16_t *expected;
        const char *reason;
    };
    constexpr Line lines[] = {
        {u"a\r\nb\r\n", u"xa\r\nb\r\n", "as a report ends them"},
        {u"a\nb\n", u"xa\r\nb\r\n", "LF"},
        {u"a\rb\r", u"xa\r\nb\r\n", "CR"},
        {u"a\r\nb\nc\r", u"xa\r\nb\r\nc\r\n", "all kinds"},
        {u"a\r\r\nb", u"xa\r\n\r\nb", "a CR of its own before a line end"},
        {u"a\u2029b", u"xa\r\nb", "a separator of paragraphs"},
        {u"a\u2028b\r\n", u"xa\u2028b\r\n", "a separator of lines is a character"},
        {u"\r\n\n", u"x\r\n\r\n", "nothing else"},
    };
    for (const Line &line : lines) {
        ShownReport t(QString::fromUtf16(line.text));
        UReportView &view = t.open();
        UReportView &other = t.open();
        EXPECT_EQ(textOf(t.report), QString::fromUtf16(line.text)) << line.reason << ": shown only";
        QTest::keyClick(&view.GetEdit(), Qt::Key_X);
        EXPECT_EQ(textOf(t.report), QString::fromUtf16(line.expected)) << line.reason;
        EXPECT_EQ(other.GetEdit().toPlainText(), view.GetEdit().toPlainText()) << line.reason;
        putCursor(other.GetEdit(), 1);
        QTest::keyClick(&other.GetEdit(), Qt::Key_Y);
        EXPECT_EQ(textOf(t.report), QString::fromUtf16(line.expected).insert(1, u'y')) << line.reason;
    }
}

TEST(UReportViewEdit, WhatTheControlShowsWinsOverATextThatWasChangedWithoutIt)
{
    ShownReport t(QStringLiteral("ab\r\n"));
    UReportView &view = t.open();
    t.report.Write(QStringLiteral("more"), 0);
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    EXPECT_EQ(textOf(t.report), QStringLiteral("xab\r\n"));
}

TEST(UReportViewEdit, TwoViewsFollowEachOther)
{
    ShownReport t(QStringLiteral("one\r\ntwo\r\n"));
    UReportView &first = t.open();
    UReportView &second = t.open();
    putCursor(first.GetEdit(), 3);
    putCursor(second.GetEdit(), 7);
    for (const char letter : {'a', 'b', 'c'}) {
        QTest::keyClick(&first.GetEdit(), letter);
        QTest::keyClick(&second.GetEdit(), static_cast<char>(letter - 'a' + 'A'));
    }
    EXPECT_EQ(t.lines(), QStringLiteral("oneabc\ntwoABC\n"));
    EXPECT_EQ(first.GetEdit().toPlainText(), t.lines());
    EXPECT_EQ(second.GetEdit().toPlainText(), t.lines());
    EXPECT_EQ(first.GetEdit().textCursor().position(), 6) << "each has its own cursor";
    EXPECT_EQ(second.GetEdit().textCursor().position(), 13) << "which moves on with the text";
    second.GetEdit().undo();
    EXPECT_EQ(first.GetEdit().toPlainText(), t.lines()) << "an undone edit is an edit";
}

TEST(UReportViewEdit, AnEditThatMakesATextRichTextIsShownSoInOtherViews)
{
    ShownReport t(QStringLiteral("rtf1 one{\\b two}}"));
    UReportView &first = t.open();
    UReportView &second = t.open();
    putCursor(first.GetEdit(), 0);
    for (const char key : {'{', '\\'}) {
        QTest::keyClick(&first.GetEdit(), key);
    }
    EXPECT_EQ(first.GetEdit().toPlainText(), t.lines()) << "the user goes on typing in the source";
    EXPECT_EQ(second.GetEdit().toPlainText(), QStringLiteral("onetwo"));
    QTest::keyClick(&first.GetEdit(), Qt::Key_Backspace);
    EXPECT_EQ(second.GetEdit().toPlainText(), t.lines()) << "and back";
}

TEST(UReportViewEdit, OneViewClosesWhileTheOtherEdits)
{
    ShownReport t(QStringLiteral("one\r\n"));
    t.open();
    UReportView &second = t.open();
    QTest::keyClick(&second.GetEdit(), Qt::Key_A);
    t.close(0);
    QTest::keyClick(&second.GetEdit(), Qt::Key_B);
    EXPECT_EQ(t.lines(), QStringLiteral("abone\n"));
    UReportView &third = t.open();
    EXPECT_EQ(third.GetEdit().toPlainText(), t.lines());
    QTest::keyClick(&third.GetEdit(), Qt::Key_C);
    EXPECT_EQ(second.GetEdit().toPlainText(), QStringLiteral("cabone\n"));
}

TEST(UReportViewEdit, AHostsViewsAreToldOfEveryEditInTheSameWay)
{
    ShownReport t(QStringLiteral("one\r\ntwo\r\n"));
    UReportView &view = t.open();
    CViewPane pane;
    auto *recorder = showIn<RecordingView>(pane, t.report);
    putCursor(view.GetEdit(), 4);
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    ASSERT_EQ(recorder->updates.size(), 1U);
    EXPECT_EQ(recorder->updates[0], (RecordingView::Update{&view, 0, nullptr})) << "one character";
    view.OnChange();
    ASSERT_EQ(recorder->updates.size(), 2U);
    EXPECT_EQ(recorder->updates[1], (RecordingView::Update{&view, 0, nullptr})) << "the whole text was taken over";
}

/// Counts how often the whole text was loaded into a view.
int loadsOf(UReportView &view, const std::function<void()> &act)
{
    int loads = 0;
    const auto counting = QObject::connect(view.GetEdit().document(), &QTextDocument::contentsChange, view.GetWidget(),
                                           [&loads, &view](int position, int removed, int) {
                                               loads += position == 0 && removed >= view.GetEdit().toPlainText().size();
                                           });
    const QTextDocument *before = view.GetEdit().document();
    act();
    QObject::disconnect(counting);
    return loads + (view.GetEdit().document() != before ? 1 : 0);
}

TEST(UReportViewEdit, OtherViewsOfTheReportTakeOverOnlyTheChange)
{
    ShownReport t(QStringLiteral("one\r\ntwo\r\nthree\r\n"));
    UReportView &view = t.open();
    UReportView &other = t.open();
    putCursor(view.GetEdit(), 4);
    EXPECT_EQ(loadsOf(other, [&view] { QTest::keyClicks(&view.GetEdit(), QStringLiteral("xyz")); }), 0);
    EXPECT_EQ(other.GetEdit().toPlainText(), QStringLiteral("one\nxyztwo\nthree\n"));
    EXPECT_EQ(loadsOf(other, [&t] { t.report.UpdateAllViews(nullptr); }), 1) << "an update by anybody else loads all";
}

TEST(UReportViewEdit, AHintFromAnotherKindOfViewReloads)
{
    ShownReport t(QStringLiteral("one"));
    UReportView &view = t.open();
    RecordingView other;
    t.report.SetData(QStringLiteral("two"));
    int hintObject = 0;
    t.report.UpdateAllViews(&other, 1, &hintObject);
    EXPECT_EQ(view.GetEdit().toPlainText(), QStringLiteral("two")) << "whatever its number means there";
    t.report.SetData(QStringLiteral("three"));
    t.report.UpdateAllViews(nullptr, 7, nullptr);
    EXPECT_EQ(view.GetEdit().toPlainText(), QStringLiteral("three"));
}

TEST(UReportViewEdit, AnEditOfRichTextPutsThePlainTextIntoTheDocumentAndKeepsTheFormats)
{
    ShownReport t(QStringLiteral("{\\rtf1 {\\b bold}\\par next\\line break}"));
    UReportView &view = t.open();
    UReportView &other = t.open();
    ASSERT_EQ(view.GetWordWrap(), UReportView::WrapToWindow);
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    EXPECT_EQ(textOf(t.report), QStringLiteral("xbold\r\nnext\nbreak")) << "a break within a paragraph is a bare LF";
    putCursor(view.GetEdit(), 6);
    QTest::keyClick(&view.GetEdit(), Qt::Key_Y);
    EXPECT_EQ(textOf(t.report), QStringLiteral("xbold\r\nynext\nbreak"));
    QTextCursor cursor(view.GetEdit().document());
    cursor.setPosition(3);
    EXPECT_EQ(cursor.charFormat().fontWeight(), QFont::Bold) << "the view that is typed in still shows the formats";
    EXPECT_EQ(view.GetWordWrap(), UReportView::WrapToWindow);
    EXPECT_EQ(other.GetEdit().toPlainText(), QStringLiteral("xbold\nynext\nbreak"));
    EXPECT_EQ(other.GetWordWrap(), UReportView::WrapNone) << "for the other one the document holds plain text now";
    putCursor(other.GetEdit(), 0);
    QTest::keyClick(&other.GetEdit(), Qt::Key_Z);
    EXPECT_EQ(textOf(t.report), QStringLiteral("zxbold\r\nynext\r\nbreak"));
    EXPECT_EQ(view.GetEdit().toPlainText(), QStringLiteral("zxbold\nynext\nbreak"));
    t.report.UpdateAllViews(nullptr);
    EXPECT_EQ(view.GetWordWrap(), UReportView::WrapNone) << "what the document holds now is plain text";
}

TEST(UReportViewEdit, AnEditedRichTextIsSavedWithItsFormats)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rtf"));
    ShownReport t(QStringLiteral("{\\rtf1\\pard\\qc {\\b bold}\\par\\pard\\li720 indented\\par}"));
    UReportView &view = t.open();
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    // Saving brings the view up to date first.
    ASSERT_TRUE(t.report.OnSaveDocument(path));
    const QByteArray saved = QByteArray::fromStdString(contentOf(path));
    for (const char *part : {"xbold", "\\b", "\\qc", "\\li720"}) {
        EXPECT_TRUE(saved.contains(part)) << part << "\n" << saved.toStdString();
    }
    t.report.SetData(QStringLiteral("xbold\r\nother"));
    t.report.UpdateAllViews(nullptr);
    ASSERT_TRUE(t.report.OnSaveDocument(path));
    EXPECT_FALSE(QByteArray::fromStdString(contentOf(path)).contains("\\qc"))
        << "a text that was set from elsewhere has no formats";
}

TEST(UReportViewEdit, FormatsGoWithATextThatAHostSets)
{
    for (const bool isEdited : {false, true}) {
        ShownReport t(QStringLiteral("{\\rtf1 {\\b bold}\\par next}"));
        UReportView &view = t.open();
        if (isEdited) {
            QTest::keyClick(&view.GetEdit(), Qt::Key_X);
            t.report.UpdateAllViews(nullptr);
            EXPECT_TRUE(view.ShowsFormats()) << "the text is the one that was typed here";
        }
        t.report.SetData(view.GetEdit().windowText());
        t.report.UpdateAllViews(nullptr);
        EXPECT_FALSE(view.ShowsFormats()) << "the very same characters, but from elsewhere; edited: " << isEdited;
        QTextCursor cursor(view.GetEdit().document());
        cursor.setPosition(2);
        EXPECT_NE(cursor.charFormat().fontWeight(), QFont::Bold) << isEdited;
    }
}

/// A view that keeps whether the report was modified when it was notified of a change.
class WatchingView : public UView
{
public:
    void OnUpdate(UView *, long, void *) override { wasModified.push_back(GetDocument()->IsModified()); }
    std::vector<bool> wasModified;
};

TEST(UReportViewEdit, OthersHearOfAReportThatIsModifiedAlready)
{
    ShownReport t(QStringLiteral("one\r\n"));
    UReportView &view = t.open();
    CViewPane pane;
    auto *watching = showIn<WatchingView>(pane, t.report);
    view.OnChange();
    EXPECT_EQ(watching->wasModified, std::vector<bool>{true}) << "the whole text";
    t.report.SetModifiedFlag(false);
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    EXPECT_EQ(watching->wasModified, (std::vector<bool>{true, true})) << "a letter";
}

TEST(UReportViewEdit, AViewOfTheImageStaysAViewOfTheImage)
{
    ShownReport t;
    t.report.SetRTFDataFlag(true);
    t.report.Write(QStringLiteral("line"), 1);
    UReportView &view = t.open();
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    const QString edited = textOf(t.report);
    EXPECT_TRUE(edited.startsWith(QStringLiteral("xline"))) << edited.toStdString();
    UReportView &late = t.open();
    EXPECT_TRUE(late.GetEdit().toPlainText().startsWith(QStringLiteral("line"))) << "the image knows of no edits";
    QTest::keyClick(&view.GetEdit(), Qt::Key_Y);
    EXPECT_TRUE(textOf(t.report).startsWith(QStringLiteral("xyline")));
    EXPECT_TRUE(late.GetEdit().toPlainText().startsWith(QStringLiteral("line"))) << "nor does a view of it";
}

TEST(UReportViewEdit, ATextOfTheSameLengthThatWasSetWithoutTheViewIsNotTheOneThatIsShown)
{
    ShownReport t(QStringLiteral("abcd"));
    UReportView &view = t.open();
    QTest::keyClick(&view.GetEdit(), Qt::Key_Q);
    t.report.SetData(QStringLiteral("vwxyz"));
    QTest::keyClick(&view.GetEdit(), Qt::Key_R);
    EXPECT_EQ(textOf(t.report), QStringLiteral("qrabcd")) << "what the control shows wins";
    EXPECT_EQ(view.GetEdit().windowText(), QStringLiteral("qrabcd"));
}

TEST(UReportViewEdit, AnotherTextOfTheSameLengthIsNotTakenForTheOneThatIsShown)
{
    ShownReport t;
    t.report.SetRTFDataFlag(true);
    t.report.Write(QStringLiteral("line"), 1);
    const qsizetype length = t.open().GetEdit().windowText().size();
    t.close(0);
    t.report.SetData(QString(length, u'?'));
    UReportView &view = t.open();
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    EXPECT_EQ(textOf(t.report), view.GetEdit().windowText());
    EXPECT_TRUE(textOf(t.report).startsWith(QStringLiteral("xline")));
}

TEST(UReportViewEdit, AViewWithoutADocumentCanBeTypedInto)
{
    UReportView view;
    view.GetWidget()->show();
    QTest::keyClick(&view.GetEdit(), Qt::Key_A);
    view.OnChange();
    EXPECT_EQ(view.GetEdit().toPlainText(), QStringLiteral("a"));
}

TEST(UReportViewEdit, AFileThatChangesWhileItIsShownStaysAsItWasRead)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("shown.rep"));
    putFile(path, "one\r\ntwo\r\n");
    ShownReport t;
    ASSERT_TRUE(t.report.OnOpenDocument(path));
    UReportView &view = t.open();
    const QString before = view.GetEdit().toPlainText();
    putFile(path, "x");
    QTest::keyClick(&view.GetEdit(), Qt::Key_A);
    EXPECT_EQ(view.GetEdit().toPlainText(), u'a' + before);
    QFile::remove(path);
    EXPECT_TRUE(t.report.OnSaveDocument(path));
    EXPECT_TRUE(contentOf(path).find("aone") != std::string::npos) << "and is saved as it is shown";
}

TEST(UReportViewEdit, ALongInsertionIsFollowedByOthers)
{
    ShownReport shown(reportLines(QStringLiteral("first\nlast\n")));
    UReportView &view = shown.open();
    ReportEdit &edit = view.GetEdit();
    QString expected = QStringLiteral("first\nlast\n");
    const auto insert = [&](int at, const QString &text) {
        putCursor(edit, at);
        paste(edit, text);
        expected.insert(at, text);
        EXPECT_TRUE(shown.report.GetTextLength() == reportLines(expected).size()) << "after " << text.size();
    };
    insert(3, QString(70000, u'x')); // longer than what waits to be carried out
    for (int i = 0; i < 3; ++i) {
        putCursor(edit, 2);
        key(edit, Qt::Key_A);
        expected.insert(2, u'a');
    }
    insert(5, QString(40000, u'y'));
    insert(10, QString(70000, u'z'));
    putCursor(edit, 1);
    key(edit, Qt::Key_Return);
    expected.insert(1, u'\n');
    EXPECT_EQ(shown.report.CheckSize(400000), 1);
    shown.report.WriteLine(QStringLiteral("written"), 0, 1, 0);
    shown.report.UpdateAllViews(nullptr);
    expected += QStringLiteral("written\n");
    EXPECT_TRUE(shown.lines() == expected);
    EXPECT_TRUE(edit.toPlainText() == expected);
}

} // namespace
