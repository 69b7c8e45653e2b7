#pragma once

#include <QString>
#include <QStringMatcher>
#include <QStringView>

namespace kareport
{

/// Finds a text within lines. Matches of one line do not overlap: they are counted from the left.
class TextSearch
{
public:
    TextSearch() = default;
    TextSearch(const QString &text, bool matchCase, bool wholeWord);

    bool isEmpty() const { return text_.isEmpty(); }
    qsizetype length() const { return text_.size(); }
    /// The first match that begins at a place or after it; -1 when there is none. @param from  0 or the end of a match
    qsizetype find(QStringView line, qsizetype from = 0) const;
    /// The last match that begins before a place; -1 when there is none.
    qsizetype findLast(QStringView line, qsizetype before) const;
    qint64 count(QStringView line) const;

private:
    bool isWord(QStringView line, qsizetype at) const;

    QString text_;
    bool wholeWord_ = false;
    QStringMatcher matcher_;
};

} // namespace kareport
