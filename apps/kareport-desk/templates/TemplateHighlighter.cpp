#include "TemplateHighlighter.h"

#include "TagLint.h"

#include <QPalette>

#include <algorithm>
#include <iterator>

namespace kareport
{

namespace
{

/// What a line of the text begins in.
enum LineState
{
    inText = 0,
    inComment = 1
};

constexpr QStringView commentEnd = u"-->";

/// Whether the values of an element are of a fixed set.
bool hasFixedValues(QStringView name)
{
    constexpr QStringView names[] = {u"Type", u"Align", u"Format", u"ID", u"PageBreaks", u"Separator"};
    return std::any_of(std::begin(names), std::end(names),
                       [name](QStringView one) { return name.compare(one, Qt::CaseInsensitive) == 0; });
}

} // namespace

bool isDark(const QPalette &palette)
{
    constexpr int middle = 128;
    return palette.color(QPalette::Base).lightness() < middle;
}

TemplateHighlighter::TemplateHighlighter(QTextDocument *document, const QPalette &palette)
    : QSyntaxHighlighter(document)
{
    setColours(palette);
}

void TemplateHighlighter::setColours(const QPalette &palette)
{
    // Each has a contrast of at least 4.5 to the usual backgrounds.
    const bool dark = isDark(palette);
    tag_.setForeground(dark ? QColor(126, 182, 240) : QColor(11, 92, 173));
    unknown_.setForeground(dark ? QColor(242, 149, 141) : QColor(168, 32, 24));
    unknown_.setFontItalic(true);
    comment_.setForeground(dark ? QColor(160, 176, 160) : QColor(85, 107, 85));
    word_.setForeground(dark ? QColor(205, 172, 246) : QColor(107, 63, 160));
    rehighlight();
}

void TemplateHighlighter::colourTag(const QString &text, int begin, int end)
{
    const QStringView inside = QStringView(text).sliced(begin + 1, end - begin - 2);
    const QStringView name = inside.startsWith(u'/') ? inside.sliced(1) : inside;
    if (inside.startsWith(u'?') || inside.startsWith(u'!')) {
        setFormat(begin, end - begin, comment_);
        return;
    }
    const bool isKnown = inside == u"/" || isElementName(name);
    setFormat(begin, end - begin, isKnown ? tag_ : unknown_);
    if (isKnown && !inside.startsWith(u'/') && hasFixedValues(name)) {
        const qsizetype next = text.indexOf(u'<', end);
        setFormat(end, static_cast<int>(next < 0 ? text.size() : next) - end, word_);
    }
}

void TemplateHighlighter::highlightBlock(const QString &text)
{
    setCurrentBlockState(inText);
    int at = 0;
    if (previousBlockState() == inComment) {
        const qsizetype end = text.indexOf(commentEnd);
        at = static_cast<int>(end < 0 ? text.size() : end + commentEnd.size());
        setFormat(0, at, comment_);
        setCurrentBlockState(end < 0 ? inComment : inText);
    }
    for (qsizetype open = text.indexOf(u'<', at); open >= 0; open = text.indexOf(u'<', at)) {
        const int begin = static_cast<int>(open);
        if (QStringView(text).sliced(open).startsWith(u"<!--")) {
            const qsizetype end = text.indexOf(commentEnd, open);
            at = static_cast<int>(end < 0 ? text.size() : end + commentEnd.size());
            setFormat(begin, at - begin, comment_);
            setCurrentBlockState(end < 0 ? inComment : inText);
            continue;
        }
        const qsizetype end = text.indexOf(u'>', open);
        if (end < 0) {
            return;
        }
        at = static_cast<int>(end) + 1;
        colourTag(text, begin, at);
    }
}

} // namespace kareport
