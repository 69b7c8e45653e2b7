#pragma once

#include <QString>
#include <QStringView>

#include <vector>

namespace kareport
{

class TemplateFile;

/// A piece of template text that remembers where each of its characters was in the file, through every cut, so that
/// a remark about it can name line and column.
class ScanText
{
public:
    ScanText() = default;
    /// A text of its own: its characters are at their own positions.
    explicit ScanText(QString text);

    QStringView view() const { return text_; }
    const QString &text() const { return text_; }
    bool isEmpty() const { return text_.isEmpty(); }
    qsizetype size() const { return text_.size(); }

    /// Appends characters that follow each other in the file from `source` on.
    void append(QStringView characters, qsizetype source);
    /// The `count` characters from `from` on.
    ScanText sliced(qsizetype from, qsizetype count) const;
    /// Takes `count` characters from `from` on out of the text; what is left closes up.
    void remove(qsizetype from, qsizetype count);

    /// Where the character at a position (0 to `size()`) was; the end is after the last character.
    qsizetype sourceOf(qsizetype position) const;

private:
    /// From `at` on, up to the next run, the characters followed each other from `source` on.
    struct Run
    {
        qsizetype at;
        qsizetype source;
    };

    std::size_t runAt(qsizetype position) const;
    void removeRuns(qsizetype from, qsizetype count);

    QString text_;
    std::vector<Run> runs_;
};

/// The text of a template file that is scanned: without tabs, line feeds and carriage returns, which also values lose.
/// @throws std::bad_alloc
ScanText scanTextOf(const TemplateFile &file);

} // namespace kareport
