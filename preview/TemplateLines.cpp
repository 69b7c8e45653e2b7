#include "TemplateLines.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// The blanks and tabs that the line of a position begins with.
QString indentationAt(const QString &text, qsizetype position)
{
    const qsizetype start = lineStartOf(text, position);
    qsizetype end = start;
    while (end < text.size() && (text[end] == u' ' || text[end] == u'\t')) {
        ++end;
    }
    return text.mid(start, end - start);
}

/// What a line is indented by in an element.
QString indentationUnit(const QString &text)
{
    for (qsizetype at = text.indexOf(u'\n'); at >= 0 && at + 1 < text.size(); at = text.indexOf(u'\n', at + 1)) {
        if (text[at + 1] == u'\t') {
            break;
        }
        if (text[at + 1] == u' ') {
            return indentationAt(text, at + 1);
        }
    }
    return QStringLiteral("\t");
}

/// Lines of text, each with its depth as tabs.
QString indented(const QStringList &lines, const QString &indentation, const QString &unit)
{
    QString text;
    for (QString line : lines) {
        QString front = indentation;
        while (line.startsWith(u'\t')) {
            line.remove(0, 1);
            front += unit;
        }
        text += front + line + u'\n';
    }
    return text;
}

} // namespace

bool isIndentation(QStringView text)
{
    return std::all_of(text.begin(), text.end(), [](QChar one) { return one == u' ' || one == u'\t'; });
}

qsizetype lineStartOf(const QString &text, qsizetype position)
{
    return position <= 0 ? 0 : text.lastIndexOf(u'\n', position - 1) + 1;
}

QString element(const char *name, const QString &value)
{
    const QString tag = QString::fromLatin1(name);
    return u'<' + tag + u'>' + value + QStringLiteral("</") + tag + u'>';
}

/// Puts lines at the end of what an element holds, before its closing tag.
void insertInside(QString &text, const TextRange &inside, const QStringList &lines)
{
    const QString unit = indentationUnit(text);
    const qsizetype close = text.indexOf(u'<', inside.end);
    const qsizetype closeAt = close < 0 ? text.size() : close;
    const qsizetype start = lineStartOf(text, closeAt);
    const QString outer = indentationAt(text, closeAt);
    if (isIndentation(QStringView(text).sliced(start, closeAt - start))) {
        text.insert(start, indented(lines, outer + unit, unit));
    } else {
        text.insert(closeAt, u'\n' + indented(lines, outer + unit, unit) + outer);
    }
}

/// Puts lines after an element. @param end  of the element
void insertAfter(QString &text, qsizetype end, const QStringList &lines)
{
    const QString unit = indentationUnit(text);
    QString added = u'\n' + indented(lines, indentationAt(text, end), unit);
    added.chop(1); // the line goes on as it did
    text.insert(end, added);
}

/// The end of an element with its closing tag.
qsizetype endOfElement(const QString &text, const TextRange &inside)
{
    const qsizetype close = text.indexOf(u'>', inside.end);
    return close < 0 ? text.size() : close + 1;
}

/// A name with a number that none of the others has.
QString freeName(const QString &front, const QStringList &others)
{
    for (int number = 1;; ++number) {
        const QString name = front + QString::number(number);
        if (!others.contains(name, Qt::CaseInsensitive)) {
            return name;
        }
    }
}

TextRange valueAfter(const QString &text, qsizetype position, const char *name)
{
    const QString tag = u'<' + QString::fromLatin1(name) + u'>';
    const qsizetype at = text.indexOf(tag, position, Qt::CaseInsensitive);
    const qsizetype begin = at < 0 ? position : at + tag.size();
    const qsizetype end = at < 0 ? position : text.indexOf(u'<', begin);
    return {begin, end < 0 ? text.size() : end};
}

} // namespace kareport
