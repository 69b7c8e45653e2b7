#include "FindBar.h"

#include "ViewFixture.h"

#include <QCheckBox>
#include <QLabel>
#include <QLineEdit>
#include <QTimer>
#include <QToolButton>

namespace
{

using kareport::FindBar;

/// A window with an open find bar.
struct Finding
{
    explicit Finding(const QString &text)
    {
        widget.resize(700, 300);
        widget.show();
        QApplication::setActiveWindow(&widget);
        widget.edit().loadPlainText(text);
    }
    /// Opens the bar and types a text, and waits until it has been counted.
    void look(const QString &text)
    {
        widget.openFindBar();
        bar().field().clear();
        QTest::keyClicks(&bar().field(), text);
        settle();
    }
    void settle()
    {
        EXPECT_TRUE(waitUntil([this] { return !bar().count().text().endsWith(u'\u2026'); }));
    }
    FindBar &bar() const { return widget.findBar(); }
    QString count() const { return bar().count().text(); }
    int start() const { return widget.edit().textCursor().selectionStart(); }

    kareport::ReportViewWidget widget;
};

TEST(FindBar, IsHiddenUntilItIsOpenedAndEscapeClosesIt)
{
    Finding f(QStringLiteral("one"));
    EXPECT_FALSE(f.bar().isVisible());
    QTest::keyClick(&f.widget.edit(), Qt::Key_F, Qt::ControlModifier);
    EXPECT_TRUE(f.bar().isVisible());
    EXPECT_TRUE(f.bar().field().hasFocus());
    QTest::keyClick(&f.bar().field(), Qt::Key_Escape);
    EXPECT_FALSE(f.bar().isVisible());
    EXPECT_TRUE(f.widget.edit().hasFocus());
    QTest::keyClick(&f.widget.edit(), Qt::Key_F3);
    EXPECT_TRUE(f.bar().isVisible()) << "nothing to find on with";
    QTest::mouseClick(&f.bar().closeButton(), Qt::LeftButton);
    EXPECT_FALSE(f.bar().isVisible());
}

TEST(FindBar, GoesFromMatchToMatchAndRound)
{
    Finding f(QStringLiteral("one two\none\n\nONE"));
    f.look(QStringLiteral("one"));
    EXPECT_EQ(f.start(), 0) << "the first while it is typed";
    EXPECT_EQ(f.count(), QStringLiteral("1 of 3"));
    const auto press = [&f](QWidget &where, Qt::Key key, Qt::KeyboardModifiers modifiers) {
        QTest::keyClick(&where, key, modifiers);
        return f.start();
    };
    EXPECT_EQ(press(f.bar().field(), Qt::Key_Return, Qt::NoModifier), 8);
    EXPECT_EQ(f.count(), QStringLiteral("2 of 3"));
    EXPECT_EQ(press(f.bar().field(), Qt::Key_F3, Qt::NoModifier), 13);
    EXPECT_EQ(f.count(), QStringLiteral("3 of 3"));
    EXPECT_EQ(press(f.bar().field(), Qt::Key_F3, Qt::NoModifier), 0) << "from the end to the beginning";
    EXPECT_EQ(press(f.bar().field(), Qt::Key_Return, Qt::ShiftModifier), 13) << "and back";
    EXPECT_EQ(press(f.bar().field(), Qt::Key_F3, Qt::ShiftModifier), 8);
    EXPECT_EQ(press(f.widget.edit(), Qt::Key_F3, Qt::NoModifier), 13) << "from the text";
    QTest::mouseClick(&f.bar().nextButton(), Qt::LeftButton);
    EXPECT_EQ(f.start(), 0);
    QTest::mouseClick(&f.bar().previousButton(), Qt::LeftButton);
    EXPECT_EQ(f.start(), 13);
    f.bar().close();
    EXPECT_EQ(press(f.widget.edit(), Qt::Key_F3, Qt::NoModifier), 0) << "also while the bar is closed";
}

TEST(FindBar, CountsWhatItFinds)
{
    struct Row
    {
        const char16_t *text;
        const char16_t *pattern;
        bool matchCase;
        bool wholeWord;
        const char16_t *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", u"a", false, false, u"No match", "an empty report"},
        {u"abc", u"", false, false, u"", "nothing is looked for"},
        {u"abc", u"x", false, false, u"No match", "none"},
        {u"ab\nab", u"ab", false, false, u"1 of 2", "in every line"},
        {u"a\nb", u"a\nb", false, false, u"No match", "lines are searched one by one"},
        {u"aaaa", u"aa", false, false, u"1 of 2", "without overlaps"},
        {u"Ab ab", u"ab", true, false, u"1 of 1", "case"},
        {u"abc ab", u"ab", false, true, u"1 of 1", "whole words"},
        {u"\U0001F600 \U0001F600", u"\U0001F600", false, false, u"1 of 2", "pairs"},
    };
    for (const Row &row : rows) {
        Finding f(QString::fromUtf16(row.text));
        f.bar().matchCase().setChecked(row.matchCase);
        f.bar().wholeWord().setChecked(row.wholeWord);
        f.widget.openFindBar();
        f.bar().field().setText(QString::fromUtf16(row.pattern));
        f.settle();
        EXPECT_EQ(f.count(), QString::fromUtf16(row.expected)) << row.reason;
    }
}

TEST(FindBar, TakesTheSelectionOfALine)
{
    Finding f(QStringLiteral("one two\nthree"));
    putCursor(f.widget.edit(), 7, 4);
    f.widget.openFindBar();
    EXPECT_EQ(f.bar().field().text(), QStringLiteral("two"));
    putCursor(f.widget.edit(), 10, 4);
    f.widget.openFindBar();
    EXPECT_EQ(f.bar().field().text(), QStringLiteral("two")) << "not of several";
    EXPECT_EQ(f.bar().field().selectedText(), QStringLiteral("two")) << "ready to be typed over";
}

TEST(FindBar, CountsAnewWhenTheTextIsEditedOrReplaced)
{
    Finding f(QStringLiteral("one one"));
    f.look(QStringLiteral("one"));
    EXPECT_EQ(f.count(), QStringLiteral("1 of 2"));
    putCursor(f.widget.edit(), 0);
    QTest::keyClicks(&f.widget.edit(), QStringLiteral("one "));
    f.settle();
    EXPECT_EQ(f.count(), QStringLiteral("3 in all")) << "no match is selected";
    f.widget.edit().loadPlainText(QStringLiteral("one"));
    EXPECT_TRUE(f.bar().findNext());
    f.settle();
    EXPECT_EQ(f.count(), QStringLiteral("1 of 1"));
    f.widget.edit().loadPlainText(QString());
    EXPECT_FALSE(f.bar().findNext());
    EXPECT_FALSE(f.bar().findPrevious());
    f.settle();
    EXPECT_EQ(f.count(), QStringLiteral("No match"));
}

TEST(FindBar, CountsALongReportWithoutHoldingTheUserUp)
{
    Finding f(QStringLiteral("line one\n").repeated(300'000));
    f.widget.openFindBar();
    f.bar().field().setText(QStringLiteral("one"));
    EXPECT_TRUE(f.bar().isCounting());
    int answered = 0; // a window's events between the slices
    QTimer events;
    QObject::connect(&events, &QTimer::timeout, &events, [&answered] { ++answered; });
    events.start(0);
    while (f.bar().isCounting()) {
        QCoreApplication::processEvents();
    }
    EXPECT_GT(answered, 2);
    EXPECT_EQ(f.count(), QStringLiteral("1 of 300000"));
    EXPECT_TRUE(f.bar().findPrevious());
    EXPECT_EQ(f.count(), QStringLiteral("300000 of 300000"));
    EXPECT_TRUE(f.bar().findPrevious());
    EXPECT_EQ(f.count(), QStringLiteral("299999 of 300000"));
}

TEST(FindBar, ATextThatIsReplacedWhileItIsCountedIsCountedAnew)
{
    Finding f(QStringLiteral("line one\n").repeated(100'000));
    f.widget.openFindBar();
    f.bar().field().setText(QStringLiteral("one"));
    QCoreApplication::processEvents();
    ASSERT_TRUE(f.bar().isCounting());
    f.widget.edit().loadPlainText(QStringLiteral("one\none\n"));
    EXPECT_FALSE(f.bar().isCounting()) << "what it was counting is gone";
    f.settle();
    EXPECT_TRUE(f.bar().findNext());
    EXPECT_EQ(f.count(), QStringLiteral("1 of 2")) << "the cursor was past the end of the new text";
}

TEST(FindBar, ClosingStopsTheCount)
{
    Finding f(QStringLiteral("line one\n").repeated(100'000));
    f.widget.openFindBar();
    f.bar().field().setText(QStringLiteral("one"));
    ASSERT_TRUE(f.bar().isCounting());
    f.bar().close();
    EXPECT_FALSE(f.bar().isCounting());
    EXPECT_EQ(f.count(), QString());
}

TEST(FindBar, EveryControlHasANameAndIsReachedByTheKeyboard)
{
    Finding f(QStringLiteral("one"));
    f.widget.openFindBar();
    for (const QWidget *child : f.bar().findChildren<QWidget *>(QString(), Qt::FindDirectChildrenOnly)) {
        const auto *button = qobject_cast<const QAbstractButton *>(child);
        EXPECT_TRUE(!child->accessibleName().isEmpty() || (button != nullptr && button->text().size() > 1))
            << child->metaObject()->className();
        if (qobject_cast<const QLabel *>(child) == nullptr) {
            EXPECT_TRUE(child->focusPolicy() & Qt::TabFocus) << child->accessibleName().toStdString();
        }
    }
}

} // namespace
