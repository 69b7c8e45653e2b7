#pragma once

#include <QByteArray>
#include <QString>

#include <vector>

namespace kareport
{

/// The text of a template file for an editor, and the way back: what was not edited has its bytes again, with its encoding and
/// its line ends, of whatever kinds they are.
class EditableText
{
public:
    /// @param bytes  of the file: UTF-8 when all of it is valid UTF-8, with or without a byte-order mark, else Latin-1
    explicit EditableText(const QByteArray &bytes = QByteArray());

    /// The text, its lines ended by LF alone.
    const QString &text() const { return text_; }
    /// The bytes of the text after it was edited. A line that is new ends as the one before it. Where Latin-1 does not have all
    /// characters, or its bytes would be read as UTF-8, all of it is UTF-8.
    QByteArray bytesOf(const QString &text) const;
    /// Whether the bytes of a text are in another encoding than the file was.
    bool changesEncoding(const QString &text) const;

private:
    struct Line
    {
        QString text;
        QString end; ///< empty for the last line
    };

    QString withLineEnds(const QString &text) const;
    std::vector<QString> endsOf(const QStringList &lines) const;
    bool fitsLatin1(const QString &text) const;

    bool isUtf8_ = true;
    bool hasMark_ = false;    ///< a byte-order mark
    bool isUniform_ = true;   ///< all lines end in the same way
    QString usualEnd_;        ///< of the first line; LF in a file of one line
    std::vector<Line> lines_; ///< those of the file
    QString text_;
};

} // namespace kareport
