#include "TagScanner.h"

#include <algorithm>
#include <array>

namespace kareport
{

namespace
{

constexpr qsizetype none = -1;

/// A character in capitals. Nearly all of a template are ASCII.
char16_t capitalOf(char16_t character)
{
    if (character < 0x80) {
        return character >= u'a' && character <= u'z' ? static_cast<char16_t>(character - (u'a' - u'A')) : character;
    }
    return QChar(character).toUpper().unicode();
}

/// A tag as it is searched for: "<", an optional "/", the name in capitals, ">".
struct Tag
{
    bool closing;
    QStringView name;

    qsizetype size() const { return name.size() + (closing ? 3 : 2); }

    /// Whether the tag begins at a position. Capitals are taken character by character.
    bool isAt(QStringView text, qsizetype position) const
    {
        if (text.size() - position < size() || text[position] != u'<') {
            return false;
        }
        ++position;
        if (closing && text[position++] != u'/') {
            return false;
        }
        for (const QChar character : name) {
            if (capitalOf(text[position++].unicode()) != character) {
                return false;
            }
        }
        return text[position] == u'>';
    }

    qsizetype find(QStringView text, qsizetype from) const
    {
        // Tags are so close together that walking to the next one is faster than any search for it.
        const char16_t *const begin = text.utf16();
        const char16_t *const end = begin + text.size();
        for (const char16_t *at = std::find(begin + from, end, u'<'); at != end; at = std::find(at + 1, end, u'<')) {
            if (isAt(text, at - begin)) {
                return at - begin;
            }
        }
        return none;
    }
};

Tag opening(QStringView name)
{
    return {false, name};
}

Tag closing(QStringView name)
{
    return {true, name};
}

const Tag shortClosing = {true, QStringView()};

void note(ScanNotes *notes, ScanNote::Kind kind, QStringView tag, qsizetype source, const QString &text = QString())
{
    if (notes != nullptr) {
        notes->push_back({kind, tag, source, text});
    }
}

/// The element between an opening tag and a closing one, and the remarks on it.
ScanElement elementBetween(const ScanText &text, QStringView tag, qsizetype open, qsizetype from, qsizetype close,
                           ScanNotes *notes)
{
    ScanElement element{text.sliced(from, close - from), text.sourceOf(open)};
    if (notes == nullptr) {
        return element;
    }
    const qsizetype inner = opening(tag).find(element.value.view(), 0);
    if (inner >= 0) {
        note(notes, ScanNote::Kind::RunsOn, tag, element.value.sourceOf(inner));
    }
    return element;
}

/// What is removed with a short closing tag when its element is cut out.
void noteDropped(const ScanText &text, QStringView tag, qsizetype close, ScanNotes *notes)
{
    const QStringView view = text.view();
    if (notes == nullptr || !shortClosing.isAt(view, close)) {
        return;
    }
    const qsizetype stop = close + shortClosing.size();
    const QStringView dropped = view.sliced(stop).first(std::min(tag.size(), view.size() - stop));
    if (!dropped.trimmed().isEmpty()) {
        note(notes, ScanNote::Kind::ShortCloseDrops, tag, text.sourceOf(stop), dropped.toString());
    }
}

struct Extent
{
    qsizetype open;
    qsizetype value;
    qsizetype close;
};

std::optional<Extent> findNode(const ScanText &text, QStringView tag, ScanNotes *notes)
{
    const QStringView view = text.view();
    const qsizetype open = opening(tag).find(view, 0);
    if (open < 0) {
        return std::nullopt;
    }
    qsizetype close = closing(tag).find(view, 0);
    if (close < 0) {
        close = shortClosing.find(view, open);
    }
    if (close < open) {
        note(notes, close < 0 ? ScanNote::Kind::Unclosed : ScanNote::Kind::ClosedBeforeOpen, tag, text.sourceOf(open));
        return std::nullopt;
    }
    return Extent{open, open + opening(tag).size(), close};
}

} // namespace

ScanElement ExtractNode(ScanText &text, QStringView tag, bool remove, ScanNotes *notes)
{
    const auto found = findNode(text, tag, notes);
    if (!found) {
        return {};
    }
    ScanElement element = elementBetween(text, tag, found->open, found->value, found->close, notes);
    if (remove) {
        noteDropped(text, tag, found->close, notes);
        const qsizetype stop = std::min(found->close + closing(tag).size(), text.size());
        text.remove(found->open, stop - found->open);
    }
    return element;
}

ScanElement GetNode(const ScanText &text, QStringView tag, ScanNotes *notes)
{
    const auto found = findNode(text, tag, notes);
    return found ? elementBetween(text, tag, found->open, found->value, found->close, notes) : ScanElement();
}

NodeSequence::NodeSequence(const ScanText &text, QStringView tag, ScanNotes *notes)
    : text_(text), view_(text.view()), tag_(tag), notes_(notes)
{
    closing_ = closing(tag_).find(view_, 0);
}

std::optional<ScanElement> NodeSequence::next()
{
    const auto open = findOpening();
    if (!open) {
        return std::nullopt;
    }
    qsizetype close = firstClosing();
    if (close < 0) {
        close = shortClosingFrom(open->value);
    }
    if (close < 0) {
        return end(ScanNote::Kind::Unclosed, open->at);
    }
    if (close < open->at) {
        return end(ScanNote::Kind::ClosedBeforeOpen, open->at);
    }
    if (close == open->value) {
        return end(ScanNote::Kind::EmptyEndsList, open->at);
    }
    ScanElement element = elementBetween(text_, tag_, std::max(open->at, position_), open->value, close, notes_);
    noteDropped(text_, tag_, close, notes_);
    if (open->at < position_) {
        kept_.chop(position_ - open->at);
    } else {
        kept_.append(view_.sliced(position_, open->at - position_));
    }
    position_ = std::min(close + closing(tag_).size(), view_.size());
    return element;
}

// What was kept holds no whole tag of the name, else the search had stopped there. But a cut joins the end of what was
// kept with what follows, and the two may form one.
std::optional<NodeSequence::Opening> NodeSequence::findOpening()
{
    const qsizetype reach = closing(tag_).size() - 1;
    const QStringView before = QStringView(kept_).last(std::min(reach, kept_.size()));
    const QStringView rest = view_.sliced(position_);
    const QString joint = before.toString().append(rest.first(std::min(reach, rest.size())));
    for (qsizetype i = 0; i < before.size(); ++i) {
        if (closing(tag_).isAt(joint, i)) {
            const qsizetype open = opening(tag_).find(view_, position_);
            if (open >= 0) {
                end(ScanNote::Kind::ClosedBeforeOpen, open);
            }
            return std::nullopt;
        }
        if (opening(tag_).isAt(joint, i)) {
            const qsizetype at = position_ - before.size() + i;
            return Opening{at, at + opening(tag_).size()};
        }
    }
    const qsizetype open = opening(tag_).find(view_, position_);
    if (open < 0) {
        return std::nullopt;
    }
    return Opening{open, open + opening(tag_).size()};
}

qsizetype NodeSequence::firstClosing()
{
    if (closing_ >= 0 && closing_ < position_) {
        closing_ = closing(tag_).find(view_, position_);
    }
    return closing_;
}

qsizetype NodeSequence::shortClosingFrom(qsizetype from)
{
    if (shortClosing_ != none && shortClosing_ < from) {
        shortClosing_ = shortClosing.find(view_, from);
    }
    return shortClosing_;
}

std::optional<ScanElement> NodeSequence::end(ScanNote::Kind kind, qsizetype opening)
{
    note(notes_, kind, tag_, text_.sourceOf(std::max(opening, position_)));
    return std::nullopt;
}

} // namespace kareport
