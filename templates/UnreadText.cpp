#include "UnreadText.h"

#include "NearestName.h"
#include "TagLint.h"
#include "TextFolding.h"
#include "UnreadTags.h"

#include <algorithm>
#include <array>
#include <optional>

namespace kareport
{

namespace
{

constexpr qsizetype longestQuote = 40;

/// Elements whose text is a value.
constexpr std::array<QStringView, 12> valueNames = {u"Name",  u"Title",          u"Use",       u"VariableName",
                                                    u"Label", u"Format",         u"Align",     u"ID",
                                                    u"Type",  u"DictionaryName", u"Separator", u"PageBreaks"};

bool isValueName(QStringView name)
{
    return std::any_of(valueNames.begin(), valueNames.end(),
                       [name](QStringView known) { return equalFolded(known, name); });
}

/// Walks over a file from one tag to the next and gathers what is between them.
class Walk
{
public:
    explicit Walk(const ScanText &file) : file_(file), text_(file.view()), tags_(file.view()) {}

    std::vector<UnreadPiece> pieces();

private:
    void take(const TagPlace &tag);
    void noteList(const TagPlace &tag);
    void takeMarkup();
    void takeText(qsizetype from, qsizetype to);
    void takeElement(const TagPlace &tag);
    void closeGap(qsizetype end, UnreadPiece::Kind kind);

    const ScanText &file_;
    QStringView text_;
    UnreadTags tags_;
    qsizetype at_ = 0;
    bool inTemplate_ = false;
    bool hasTemplate_ = false;
    qsizetype gap_ = -1;             ///< where the text around templates begins that no piece has yet; -1 for none
    std::vector<QStringView> lists_; ///< the names of the elements that are open and hold elements
    std::vector<UnreadPiece> pieces_;
};

std::vector<UnreadPiece> Walk::pieces()
{
    while (at_ < text_.size()) {
        std::optional<TagPlace> tag;
        const qsizetype next = tags_.nextTag(at_, tag);
        takeText(at_, next);
        at_ = next;
        if (tag) {
            take(*tag);
        } else if (at_ < text_.size()) {
            takeMarkup();
        }
    }
    closeGap(text_.size(), UnreadPiece::Kind::AfterLast);
    return hasTemplate_ ? std::move(pieces_) : std::vector<UnreadPiece>();
}

void Walk::take(const TagPlace &tag)
{
    at_ = tag.end;
    const bool isExact = tag.end - tag.at == tag.name.size() + (tag.isClosing ? 3 : 2);
    if (isExact && equalFolded(tag.name, UnreadTags::templateName)) {
        if (!tag.isClosing && !inTemplate_) {
            closeGap(tag.at, UnreadPiece::Kind::Around);
        }
        inTemplate_ = !tag.isClosing;
        hasTemplate_ = true;
        return;
    }
    if (!isElementName(tag.name)) {
        takeElement(tag);
    } else if (inTemplate_ && !tag.isClosing && !tag.isEmpty && isValueName(tag.name)) {
        at_ = tags_.endOfValue(tag);
    } else if (isExact) {
        noteList(tag);
    }
}

/// Keeps the names of the open elements that hold others. One that is closed somewhere else stays.
void Walk::noteList(const TagPlace &tag)
{
    if (!tag.isClosing) {
        lists_.push_back(tag.name);
    } else if (!lists_.empty() && equalFolded(lists_.back(), tag.name)) {
        lists_.pop_back();
    }
}

/// Skips what is not a tag. With a short closing tag of a list as many characters go as a full one has.
void Walk::takeMarkup()
{
    const bool isShortTag = text_.sliced(at_).startsWith(u"</>");
    at_ = tags_.afterMarkup(at_);
    if (isShortTag && !lists_.empty()) {
        const qsizetype next = text_.indexOf(u'<', at_);
        at_ = std::min(at_ + lists_.back().size(), next < 0 ? text_.size() : next);
        lists_.pop_back();
    }
}

/// Notes an element of another name, with its text where it holds no other tag.
void Walk::takeElement(const TagPlace &tag)
{
    if (tag.isClosing) {
        return;
    }
    std::optional<TagPlace> next;
    const qsizetype nextAt = tags_.nextTag(tag.end, next);
    const bool isLeaf = !tag.isEmpty && next && next->isClosing && equalFolded(next->name, tag.name);
    const bool holdsElement = !tag.isEmpty && next && !next->isClosing && isElementName(next->name);
    if (inTemplate_) {
        pieces_.push_back({UnreadPiece::Kind::Element, file_.sourceOf(tag.at), tag.name.toString(), 0, holdsElement});
        at_ = isLeaf ? next->end : tag.end;
        return;
    }
    // Elements around the templates do no harm, except one that was meant as a template.
    const bool isTemplate =
        holdsElement && !equalFolded(next->name, UnreadTags::templateName) &&
        nearestName(tag.name, QStringList(UnreadTags::templateName.toString())) == UnreadTags::templateName;
    if (isTemplate) {
        pieces_.push_back({UnreadPiece::Kind::Element, file_.sourceOf(tag.at), tag.name.toString(), 0, false});
        hasTemplate_ = true;
        at_ = std::max(nextAt, tags_.closingOf(tag.name, nextAt));
    }
}

void Walk::takeText(qsizetype from, qsizetype to)
{
    QStringView text = text_.sliced(from, to - from);
    while (!text.isEmpty() && (text.front().isSpace() || text.front() == QChar::ByteOrderMark)) {
        text = text.sliced(1);
        ++from;
    }
    text = text.trimmed();
    if (text.isEmpty()) {
        return;
    }
    if (!inTemplate_) {
        gap_ = gap_ < 0 ? from : gap_;
        return;
    }
    QString quote = text.left(longestQuote).toString();
    quote += text.size() > longestQuote ? QStringLiteral("…") : QString();
    pieces_.push_back({UnreadPiece::Kind::Text, file_.sourceOf(from), quote});
}

void Walk::closeGap(qsizetype end, UnreadPiece::Kind kind)
{
    if (gap_ >= 0) {
        pieces_.push_back({kind, file_.sourceOf(gap_), QString(), file_.sourceOf(end)});
    }
    gap_ = -1;
}

} // namespace

std::vector<UnreadPiece> findUnread(const ScanText &file)
{
    return Walk(file).pieces();
}

} // namespace kareport
