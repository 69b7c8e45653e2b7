#pragma once

#include <QByteArray>
#include <QHash>
#include <QStringView>
#include <QTextFormat>

#include <unordered_map>
#include <vector>

class QTextDocument;

namespace kareport
{

/// Appends the text as rich text holds it, all in 7 bits.
void appendRichText(QByteArray &out, QStringView text);

/// The fonts, colours and formats of a document as the words that rich text has for them.
class RichTextTables
{
public:
    explicit RichTextTables(const QTextDocument &document);

    /// The font table and the colour table.
    QByteArray header() const;
    /// The words that bring a format into force, whatever was in force before; they end with a blank or before one.
    const QByteArray &characterWords(int format) const { return characterWords_.at(format); }
    const QByteArray &paragraphWords(int format) const { return paragraphWords_.at(format); }

private:
    void addCharacters(int index, const QTextCharFormat &format);
    void addParagraph(int index, const QTextBlockFormat &format);
    int fontNumber(const QTextCharFormat &format);
    int halfPoints(const QTextCharFormat &format) const;
    int colourNumber(const QBrush &brush);

    const QTextDocument &document_;
    QHash<QByteArray, int> fontNumbers_;
    std::vector<QByteArray> fonts_;
    QHash<unsigned, int> colourNumbers_;
    std::vector<unsigned> colours_;
    std::unordered_map<int, QByteArray> characterWords_;
    std::unordered_map<int, QByteArray> paragraphWords_;
};

} // namespace kareport
