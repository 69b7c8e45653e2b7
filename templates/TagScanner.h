#pragma once

#include "ScanText.h"

#include <QStringView>

#include <optional>
#include <vector>

namespace kareport
{

/// Something that the scanner skipped or read in another way than the author may have meant.
struct ScanNote
{
    enum class Kind
    {
        EmptyEndsList,    ///< an empty element ends a list: its later siblings are not read
        ClosedBeforeOpen, ///< a closing tag comes before the opening tag: the element is not read
        Unclosed,         ///< an opening tag without any closing tag: the element is not read
        RunsOn,           ///< the value holds another opening tag of the name: it ends at the first closing tag
        ShortCloseDrops   ///< what follows a short closing tag is dropped with it
    };
    Kind kind;
    QStringView tag;  ///< the element's name as the scanner was given it
    qsizetype source; ///< where in the file
    QString text;     ///< the dropped characters
};
using ScanNotes = std::vector<ScanNote>;

/// An element that the scanner found.
struct ScanElement
{
    ScanText value;        ///< the text between the tags, unchanged
    qsizetype source = -1; ///< where its opening tag is in the file (its end, if a cut has joined it); -1 when
                           ///< there is no such element

    bool exists() const { return source >= 0; }
};

/// The first element of a name in a text. An opening tag is exactly "<", the name in any case, and ">"; the closing tag
/// is the first "</name>" of the whole text or, where there is none, the first "</>" after the opening tag. A closing
/// tag that comes before the opening tag leaves the element unread.
///
/// With `remove` the element is cut out of the text. As many characters are removed as a full closing tag has, also
/// where the short one was: templates in use are laid out for that.
/// @param tag    the name in ASCII capitals
/// @param notes  where to note what an author may not have meant; null for none
ScanElement ExtractNode(ScanText &text, QStringView tag, bool remove, ScanNotes *notes = nullptr);

/// The first element of a name in a text that stays as it is.
ScanElement GetNode(const ScanText &text, QStringView tag, ScanNotes *notes = nullptr);

/// The elements of a name in a text, one after the other, as repeated cutting with `ExtractNode` finds them: an empty
/// element or one that cannot be read ends the sequence. The text is walked once, whatever it holds.
class NodeSequence
{
public:
    /// The text must live as long as the sequence.
    NodeSequence(const ScanText &text, QStringView tag, ScanNotes *notes = nullptr);

    /// The next element; nothing at the end.
    std::optional<ScanElement> next();

private:
    static constexpr qsizetype notSearched = -2;

    struct Opening
    {
        qsizetype at;    ///< position of the tag; before `position_` when it begins in what was kept
        qsizetype value; ///< position after the tag
    };

    std::optional<Opening> findOpening();
    qsizetype firstClosing();
    qsizetype shortClosingFrom(qsizetype from);
    std::optional<ScanElement> end(ScanNote::Kind kind, qsizetype opening);

    const ScanText &text_;
    QStringView view_;
    QStringView tag_;
    ScanNotes *notes_;
    qsizetype position_ = 0; ///< the text before it was kept or cut out
    QString kept_;           ///< what was kept so far: a cut can join its end with what follows to a tag
    qsizetype closing_ = -1;
    qsizetype shortClosing_ = notSearched; ///< looked for once it is needed: a file without any is walked to its end
};

} // namespace kareport
