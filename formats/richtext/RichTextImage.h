#pragma once

#include <QString>
#include <QStringView>

#include <array>

namespace kareport
{

/// The rich text of a report, made piece by piece while the report is written.
///
/// Every piece of text is put into the paragraph template of its style; every line end is a paragraph mark. Text goes in as it
/// is: backslashes and braces act as markup.
class RichTextImage
{
public:
    /// Whether what is written becomes rich text, or stays as it is for a spreadsheet.
    enum class Form
    {
        RichText,
        BareText
    };

    /// Cuts a rich-text document down to its paragraph: from "\viewkind" up to the next closing brace.
    /// @return false, with the text as it was, when it has no "\viewkind" after its first character or no brace after it
    static bool cutToParagraph(QString &document);
    /// The font table of one font. Its number is the font size, which nothing refers to: the templates choose number 1.
    static QString fontTable(const QString &fontName, unsigned fontSize);

    /// Switching on makes the templates. What has been written stays in either case.
    /// @throws std::bad_alloc, with everything as it was
    void setOn(bool on);
    bool isOn() const { return on_; }

    /// Adds a piece of text in a style: 0 plain, 1 bold, 2 underlined, 3 both; other styles add nothing as rich text. An
    /// empty text is a line end. Nothing happens while the image is off.
    /// @return false, with nothing added, when there is no memory
    bool write(QStringView text, int style, Form form);
    /// Empties the image. The templates stay.
    void clear() { pieces_.clear(); }

    /// The whole document; as bare text, only what was written.
    QString document(const QString &fontName, unsigned fontSize, Form form) const;

private:
    struct ParagraphTemplate
    {
        QString before; ///< what comes before the text
        QString after;
    };

    void add(QStringView text, int style, Form form);

    bool on_ = false;
    std::array<ParagraphTemplate, 4> templates_; ///< by style
    QString pieces_;                             ///< all of them, in order
};

} // namespace kareport
