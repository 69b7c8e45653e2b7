#include "ReportEdit.h"

#include "AppMessageBox.h"
#include "LinePager.h"
#include "PrintQt.h"

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QContextMenuEvent>
#include <QMenu>
#include <QMimeData>
#include <QPrinter>
#include <QScrollBar>
#include <QTest>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextLayout>
#include <QWheelEvent>

#include <gtest/gtest.h>

namespace
{

using kareport::ReportChange;
using kareport::ReportEdit;

/// A control that records the edits that it was notified of.
struct Edited
{
    explicit Edited(const QString &text)
    {
        edit.loadPlainText(text);
        edit.setEditHandler([this](const ReportChange &change) { changes.push_back(change); });
    }
    void replace(int position, int removed, const QString &inserted)
    {
        QTextCursor cursor(edit.document());
        cursor.setPosition(position);
        cursor.setPosition(position + removed, QTextCursor::KeepAnchor);
        cursor.insertText(inserted);
    }

    ReportEdit edit;
    std::vector<ReportChange> changes;
};

TEST(ReportEdit, TellsOfAnEditWhatItIs)
{
    struct Row
    {
        int position;
        int removed;
        const char16_t *inserted;
        qint64 at;
        qint64 gone;
        const char16_t *added;
        const char *reason;
    };
    // The text is "ab\ncd\n", in the document "ab\r\ncd\r\n".
    constexpr Row rows[] = {
        {0, 0, u"x", 0, 0, u"x", "before everything"},
        {6, 0, u"x", 8, 0, u"x", "after everything: two line ends before it"},
        {2, 1, u"", 2, 2, u"", "a line end is two characters"},
        {3, 0, u"x", 4, 0, u"x", "in the second line"},
        {1, 3, u"\n", 1, 4, u"\r\n", "across a line end, by a line end"},
        {0, 6, u"", 0, 8, u"", "everything goes"},
        {0, 6, u"1\n2\n3\n", 0, 8, u"1\r\n2\r\n3\r\n", "everything is replaced"},
        {5, 1, u"", 6, 2, u"", "the last line end"},
    };
    for (const Row &row : rows) {
        Edited t(QStringLiteral("ab\ncd\n"));
        t.replace(row.position, row.removed, QString::fromUtf16(row.inserted));
        ASSERT_EQ(t.changes.size(), 1U) << row.reason;
        EXPECT_EQ(t.changes[0].documentPosition(), row.at) << row.reason;
        EXPECT_EQ(t.changes[0].documentRemoved(), row.gone) << row.reason;
        EXPECT_EQ(t.changes[0].documentInserted(), QString::fromUtf16(row.added)) << row.reason;
        EXPECT_EQ(t.changes[0].documentLengthBefore(), 8) << row.reason;
    }
}

TEST(ReportEdit, ATextThatIsSetFromOutsideIsAnEditOfEverything)
{
    for (const char16_t *text : {u"", u"x", u"x\ny\n", u"ab\ncd\n"}) {
        Edited t(QStringLiteral("ab\ncd\n"));
        QString document = QStringLiteral("ab\r\ncd\r\n");
        t.edit.setPlainText(QString::fromUtf16(text));
        for (const ReportChange &change : t.changes) {
            EXPECT_EQ(change.documentLengthBefore(), document.size());
            document.replace(change.documentPosition(), change.documentRemoved(), change.documentInserted());
        }
        EXPECT_EQ(document, t.edit.windowText()) << "the changes, one after the other";
        EXPECT_EQ(t.edit.toPlainText(), QString::fromUtf16(text));
    }
}

TEST(ReportEdit, AFormatOfTheLastParagraphReachesNoFurtherThanTheText)
{
    Edited t(QStringLiteral("ab\ncd"));
    QTextBlockFormat indented;
    indented.setIndent(1);
    QTextCursor(t.edit.document()->lastBlock()).setBlockFormat(indented);
    for (const ReportChange &change : t.changes) {
        EXPECT_LE(change.position + change.removed, 5) << "the end of the last paragraph is not a character";
        EXPECT_EQ(change.documentInserted().size(), change.documentRemoved());
    }
    EXPECT_EQ(t.edit.windowText(), QStringLiteral("ab\r\ncd"));
}

TEST(ReportEdit, LoadingAndFollowingAreNotEditsAndCannotBeUndone)
{
    Edited t(QStringLiteral("one"));
    Edited source(QStringLiteral("one"));
    source.replace(3, 0, QStringLiteral("\ntwo"));
    ASSERT_EQ(source.changes.size(), 1U);
    EXPECT_TRUE(t.edit.applyChange(source.changes[0]));
    EXPECT_EQ(t.edit.windowText(), QStringLiteral("one\r\ntwo"));
    EXPECT_FALSE(t.edit.applyChange(source.changes[0])) << "it was made in another text";
    EXPECT_EQ(t.edit.windowText(), QStringLiteral("one\r\ntwo"));
    t.edit.loadRichText(u"{\\rtf1 a}");
    t.edit.loadPlainText(QStringLiteral("b"));
    EXPECT_TRUE(t.changes.empty());
    EXPECT_FALSE(t.edit.document()->isUndoAvailable());
    QTest::keyClick(&t.edit, Qt::Key_X);
    EXPECT_EQ(t.changes.size(), 1U) << "edits are told of again";
    EXPECT_TRUE(t.edit.document()->isUndoAvailable());
}

TEST(ReportEdit, ZoomGoesInStepsAndKeepsItsLimits)
{
    struct Row
    {
        int percent;
        int direction;
        int expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {100, 1, 110, "up"},          {100, -1, 90, "down"},         {500, 1, 500, "the largest"},
        {25, -1, 25, "the smallest"}, {120, 1, 125, "from between"}, {120, -1, 110, "from between, down"},
        {1, 0, 25, "too small"},      {100000, 0, 500, "too large"}, {-5, 0, 25, "less than nothing"},
    };
    for (const Row &row : rows) {
        ReportEdit edit;
        edit.setZoomPercent(row.percent);
        if (row.direction != 0) {
            edit.zoomStep(row.direction);
        }
        EXPECT_EQ(edit.zoomPercent(), row.expected) << row.reason;
    }
}

TEST(ReportEdit, ZoomsByKeysAndWheel)
{
    ReportEdit edit;
    int told = 0;
    edit.setZoomHandler([&told] { ++told; });
    QTest::keyClick(&edit, Qt::Key_Plus, Qt::ControlModifier);
    EXPECT_EQ(edit.zoomPercent(), 110);
    QTest::keyClick(&edit, Qt::Key_Equal, Qt::ControlModifier);
    EXPECT_EQ(edit.zoomPercent(), 125) << "where plus needs the shift key";
    QTest::keyClick(&edit, Qt::Key_Minus, Qt::ControlModifier | Qt::KeypadModifier);
    EXPECT_EQ(edit.zoomPercent(), 110);
    QTest::keyClick(&edit, Qt::Key_0, Qt::ControlModifier);
    EXPECT_EQ(edit.zoomPercent(), 100);
    EXPECT_EQ(told, 4);
    QTest::keyClick(&edit, Qt::Key_Plus);
    EXPECT_EQ(edit.toPlainText(), QStringLiteral("+")) << "without the control key it is a character";

    const auto turn = [&edit](int eighths, Qt::KeyboardModifiers modifiers) {
        QWheelEvent event({5, 5}, edit.mapToGlobal(QPointF(5, 5)), {}, {0, eighths}, Qt::NoButton, modifiers,
                          Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(edit.viewport(), &event);
    };
    turn(120, Qt::NoModifier);
    EXPECT_EQ(edit.zoomPercent(), 100) << "scrolls";
    turn(240, Qt::ControlModifier);
    EXPECT_EQ(edit.zoomPercent(), 125) << "two steps";
    turn(-120, Qt::ControlModifier);
    EXPECT_EQ(edit.zoomPercent(), 110);
    turn(60, Qt::ControlModifier);
    EXPECT_EQ(edit.zoomPercent(), 110) << "half a step";
    turn(60, Qt::ControlModifier);
    EXPECT_EQ(edit.zoomPercent(), 125) << "and the other half";
}

TEST(ReportEdit, ZoomScalesEveryFontAndChangesNone)
{
    ReportEdit edit;
    edit.setReportFont(QFont(QStringLiteral("DejaVu Sans Mono"), 10));
    edit.resize(600, 400);
    edit.show();
    edit.loadRichText(u"{\\rtf1 \\fs16 small\\par \\fs40 large\\par}");
    const auto heightOf = [&edit](int block) {
        const QTextBlock shown = edit.document()->findBlockByNumber(block);
        edit.document()->documentLayout()->blockBoundingRect(shown);
        return shown.layout()->boundingRect().height();
    };
    const double small = heightOf(0);
    const double large = heightOf(1);
    EXPECT_GT(large, small * 2);
    edit.setZoomPercent(200);
    EXPECT_NEAR(heightOf(0), small * 2, 2);
    EXPECT_NEAR(heightOf(1), large * 2, 2);
    EXPECT_DOUBLE_EQ(QTextCursor(edit.document()->firstBlock()).block().begin().fragment().charFormat().fontPointSize(),
                     8);
    edit.setZoomPercent(100);
    EXPECT_NEAR(heightOf(0), small, 0.01);
    EXPECT_NEAR(heightOf(1), large, 0.01);
}

TEST(ReportEdit, TabStopsAreEightCharactersApartAtEveryZoom)
{
    ReportEdit edit;
    edit.setReportFont(QFont(QStringLiteral("DejaVu Sans Mono"), 10));
    edit.resize(600, 400);
    edit.show();
    edit.loadPlainText(QStringLiteral("\tx\n        x"));
    QPrinter printer(QPrinter::HighResolution);
    printer.setOutputFormat(QPrinter::PdfFormat);
    const auto left = [&edit](int block, int at) {
        QTextCursor cursor(edit.document()->findBlockByNumber(block));
        cursor.movePosition(QTextCursor::Right, QTextCursor::MoveAnchor, at);
        return edit.cursorRect(cursor).left();
    };
    double printed = 0;
    for (const int zoom : {100, 50, 150, 200, 400, 100}) {
        edit.setZoomPercent(zoom);
        EXPECT_NEAR(left(0, 1), left(1, 8), left(1, 8) / 10.0) << "by less than a character: " << zoom;
        const double width = kareport::LinePager(*edit.document(), printer).measure(0, 3).widestRow;
        printed = printed == 0 ? width : printed;
        EXPECT_EQ(width, printed) << "printing does not depend on it: " << zoom;
    }
}

TEST(ReportEdit, GlyphsAreKeptWhereTheNextKeyPaints)
{
    ReportEdit edit;
    edit.resize(600, 400);
    edit.show();
    edit.loadPlainText(QStringLiteral("line\n").repeated(20));
    edit.setCursorWidth(0); // it blinks
    const auto keptLines = [&edit] {
        edit.grab();
        QList<int> kept;
        for (QTextBlock block = edit.document()->begin(); block.isValid(); block = block.next()) {
            if (block.layout()->cacheEnabled()) {
                kept.append(block.blockNumber());
            }
        }
        return kept;
    };
    EXPECT_EQ(keptLines(), (QList<int>{0, 1}));
    QTextCursor cursor(edit.document()->findBlockByNumber(7));
    edit.setTextCursor(cursor);
    EXPECT_EQ(keptLines(), (QList<int>{6, 7, 8})) << "and no others: they would take memory";
    QTest::keyClicks(&edit, QStringLiteral("abc"));
    const QImage kept = edit.viewport()->grab().toImage();
    ReportEdit other;
    other.resize(600, 400);
    other.show();
    other.loadPlainText(edit.document()->toPlainText());
    other.setCursorWidth(0);
    other.setTextCursor([&other, at = edit.textCursor().position()] {
        QTextCursor same(other.document());
        same.setPosition(at);
        return same;
    }());
    EXPECT_EQ(kept, other.viewport()->grab().toImage()) << "what is shown is the same";
}

TEST(ReportEdit, ZoomHoldsForWhatIsLoadedLater)
{
    ReportEdit edit;
    edit.resize(600, 400);
    edit.show();
    const auto height = [&edit] {
        edit.document()->documentLayout()->blockBoundingRect(edit.document()->firstBlock());
        return edit.document()->firstBlock().layout()->boundingRect().height();
    };
    edit.loadPlainText(QStringLiteral("x"));
    const double before = height();
    edit.setZoomPercent(300);
    edit.loadPlainText(QStringLiteral("y"));
    EXPECT_NEAR(height(), before * 3, 3);
}

TEST(ReportEdit, RichTextIsShownOnPaper)
{
    ReportEdit edit;
    QPalette dark;
    dark.setColor(QPalette::Base, Qt::black);
    dark.setColor(QPalette::Text, Qt::white);
    QWidget window;
    window.setPalette(dark);
    edit.setParent(&window);
    edit.loadPlainText(QStringLiteral("a"));
    EXPECT_EQ(edit.palette().color(QPalette::Base), QColor(Qt::black)) << "plain text follows the desktop";
    edit.loadRichText(u"{\\rtf1 a}");
    EXPECT_EQ(edit.palette().color(QPalette::Base), QColor(Qt::white));
    EXPECT_EQ(edit.palette().color(QPalette::Text), QColor(Qt::black));
    edit.loadPlainText(QStringLiteral("a"));
    EXPECT_EQ(edit.palette().color(QPalette::Text), QColor(Qt::white));
    edit.setParent(nullptr);
}

TEST(ReportEdit, ATextWithoutCharactersIsPastedAsNothing)
{
    Edited t(QStringLiteral("a"));
    struct Pasting : ReportEdit
    {
        using ReportEdit::insertFromMimeData;
    };
    Pasting edit;
    QMimeData picture;
    picture.setData(QStringLiteral("image/png"), "x");
    edit.insertFromMimeData(&picture);
    EXPECT_TRUE(edit.toPlainText().isEmpty());
    QMimeData text;
    text.setText(QStringLiteral("t"));
    edit.setReadOnly(true);
    edit.insertFromMimeData(&text);
    EXPECT_TRUE(edit.toPlainText().isEmpty()) << "read only";
}

TEST(ReportEdit, WrongRichTextShowsWhatWasReadUpToThere)
{
    ReportEdit edit;
    const auto error = edit.loadRichText(u"{\\rtf1 some{");
    ASSERT_TRUE(error.has_value());
    EXPECT_TRUE(edit.toPlainText().startsWith(QStringLiteral("some")));
    EXPECT_FALSE(edit.accessibleName().isEmpty());
}

/// A control for whose copies there is no memory.
class EditWithoutMemory : public ReportEdit
{
public:
    std::unique_ptr<QMimeData> selection() const override { throw std::bad_alloc(); }
    using ReportEdit::createMimeDataFromSelection;
};

/// Chooses an entry of the control's own menu.
void chooseFromMenu(ReportEdit &edit, const char *name)
{
    QContextMenuEvent event(QContextMenuEvent::Keyboard, QPoint(1, 1), QPoint(1, 1));
    QCoreApplication::sendEvent(edit.viewport(), &event);
    auto *menu = qobject_cast<QMenu *>(QApplication::activePopupWidget());
    ASSERT_NE(menu, nullptr);
    auto *action = menu->findChild<QAction *>(QLatin1StringView(name));
    ASSERT_NE(action, nullptr) << name;
    action->trigger();
    menu->close();
}

template <typename Edit>
void copyEveryWay(const std::function<void(Edit &edit, bool cuts)> &expect)
{
    const struct
    {
        std::function<void(Edit &)> act;
        bool cuts;
    } ways[] = {
        {[](Edit &edit) { edit.copy(); }, false},
        {[](Edit &edit) { QTest::keyClick(&edit, Qt::Key_C, Qt::ControlModifier); }, false},
        {[](Edit &edit) { chooseFromMenu(edit, "edit-copy"); }, false},
        {[](Edit &edit) { edit.cut(); }, true},
        {[](Edit &edit) { QTest::keyClick(&edit, Qt::Key_X, Qt::ControlModifier); }, true},
        {[](Edit &edit) { chooseFromMenu(edit, "edit-cut"); }, true},
    };
    for (const auto &way : ways) {
        QGuiApplication::clipboard()->setText(QStringLiteral("before"));
        Edit edit;
        edit.loadPlainText(QStringLiteral("one\ntwo"));
        edit.resize(200, 100);
        edit.show();
        edit.selectAll();
        way.act(edit);
        expect(edit, way.cuts);
    }
}

TEST(ReportEdit, CopiesAndCuts)
{
    copyEveryWay<ReportEdit>([](ReportEdit &edit, bool cuts) {
        EXPECT_EQ(QGuiApplication::clipboard()->text(), QStringLiteral("one\ntwo"));
        EXPECT_EQ(edit.toPlainText(), cuts ? QString() : QStringLiteral("one\ntwo"));
    });
    ReportEdit edit;
    edit.loadPlainText(QStringLiteral("one"));
    QGuiApplication::clipboard()->setText(QStringLiteral("before"));
    edit.copy();
    edit.cut();
    EXPECT_EQ(QGuiApplication::clipboard()->text(), QStringLiteral("before")) << "nothing is selected";
    edit.setReadOnly(true);
    edit.selectAll();
    edit.cut();
    QTest::keyClick(&edit, Qt::Key_X, Qt::ControlModifier);
    EXPECT_EQ(edit.toPlainText(), QStringLiteral("one")) << "nothing may be edited";
}

TEST(ReportEdit, ACopyWithoutMemoryIsSaidAndLeavesClipboardAndText)
{
    QStringList said;
    kareport::setMessageHandler([&said](const QString &text, MessageButtons) {
        said.append(text);
        return MessageAnswer::Ok;
    });
    copyEveryWay<EditWithoutMemory>([&said](EditWithoutMemory &edit, bool /*cuts*/) {
        EXPECT_EQ(QGuiApplication::clipboard()->text(), QStringLiteral("before"));
        EXPECT_EQ(edit.toPlainText(), QStringLiteral("one\ntwo"));
        EXPECT_EQ(said,
                  QStringList{QStringLiteral("There is not enough memory to copy this. The clipboard is as it was.")});
        said.clear();
        const std::unique_ptr<QMimeData> dragged(edit.createMimeDataFromSelection());
        EXPECT_FALSE(dragged->hasText()) << "what is dragged then is not taken";
    });
    kareport::setMessageHandler({});
}

} // namespace
