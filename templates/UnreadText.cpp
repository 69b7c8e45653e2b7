#include "UnreadText.h"

#include "NearestName.h"
#include "TagLint.h"
#include "TextFolding.h"

#include <algorithm>
#include <array>
#include <optional>
#include <unordered_map>

namespace kareport
{

namespace
{

constexpr qsizetype longestQuote = 40;
constexpr QStringView templateName = u"ReportTemplate";

/// Elements whose text is a value.
constexpr std::array<QStringView, 12> valueNames = {u"Name",  u"Title",          u"Use",       u"VariableName",
                                                    u"Label", u"Format",         u"Align",     u"ID",
                                                    u"Type",  u"DictionaryName", u"Separator", u"PageBreaks"};

bool isValueName(QStringView name)
{
    return std::any_of(valueNames.begin(), valueNames.end(),
                       [name](QStringView known) { return equalFolded(known, name); });
}

/// A tag, or what looks like one.
struct TagPlace
{
    qsizetype at;
    qsizetype end; ///< after it
    QStringView name;
    bool isClosing;
    bool isEmpty; ///< ends with a slash
};

/// Walks over a file from one tag to the next and gathers what is between them.
class Walk
{
public:
    explicit Walk(const ScanText &file) : file_(file), text_(file.view()) {}

    std::vector<UnreadPiece> pieces();

private:
    std::optional<TagPlace> tagAt(qsizetype at) const;
    qsizetype nextTag(qsizetype from, std::optional<TagPlace> &tag) const;
    qsizetype afterMarkup(qsizetype at) const;
    qsizetype closingOf(QStringView name, qsizetype from);
    qsizetype endOfValue(const TagPlace &tag);
    qsizetype endOfTemplate(qsizetype from);
    void take(const TagPlace &tag);
    void noteList(const TagPlace &tag);
    void takeMarkup();
    void takeText(qsizetype from, qsizetype to);
    void takeElement(const TagPlace &tag);
    void closeGap(qsizetype end, UnreadPiece::Kind kind);

    const ScanText &file_;
    QStringView text_;
    qsizetype at_ = 0;
    bool inTemplate_ = false;
    bool hasTemplate_ = false;
    qsizetype gap_ = -1;             ///< where the text around templates begins that no piece has yet; -1 for none
    std::vector<QStringView> lists_; ///< the names of the elements that are open and hold elements
    std::unordered_map<QString, qsizetype> closings_; ///< the next closing tags, by their folded names
    std::vector<UnreadPiece> pieces_;
};

std::vector<UnreadPiece> Walk::pieces()
{
    while (at_ < text_.size()) {
        std::optional<TagPlace> tag;
        const qsizetype next = nextTag(at_, tag);
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

std::optional<TagPlace> Walk::tagAt(qsizetype at) const
{
    const QStringView tag = tagTextAt(text_, at);
    const QStringView name = nameInTag(tag);
    if (name.isEmpty() || !name.front().isLetter()) {
        return std::nullopt;
    }
    return TagPlace{at, at + tag.size() + 2, name, tag.trimmed().startsWith(u'/'), tag.endsWith(u'/')};
}

/// The next tag or other markup (a comment, a declaration). @param tag  receives it when it is a tag
qsizetype Walk::nextTag(qsizetype from, std::optional<TagPlace> &tag) const
{
    for (qsizetype at = text_.indexOf(u'<', from); at >= 0; at = text_.indexOf(u'<', at + 1)) {
        const QStringView rest = text_.sliced(at + 1);
        if (rest.startsWith(u'!') || rest.startsWith(u'?') || rest.startsWith(u"/>")) {
            return at;
        }
        tag = tagAt(at);
        if (tag) {
            return at;
        }
    }
    return text_.size();
}

/// The end of a comment, a declaration or a short closing tag.
qsizetype Walk::afterMarkup(qsizetype at) const
{
    const bool isComment = text_.sliced(at).startsWith(u"<!--");
    const QStringView end = isComment ? QStringView(u"-->") : QStringView(u">");
    const qsizetype found = text_.indexOf(end, at);
    return found < 0 ? text_.size() : found + end.size();
}

/// The next closing tag of a name; the end of the text where there is none.
qsizetype Walk::closingOf(QStringView name, qsizetype from)
{
    qsizetype &next = closings_.try_emplace(foldedKey(name), -1).first->second;
    if (next < from) {
        const QString closing = QStringLiteral("</%1>").arg(name);
        next = text_.indexOf(closing, from, Qt::CaseInsensitive);
        next = next < 0 ? text_.size() : next;
    }
    return next;
}

qsizetype Walk::endOfTemplate(qsizetype from)
{
    return closingOf(templateName, from);
}

/// The end of an element whose text is a value, with its closing tag. One that is not closed ends before the next tag.
qsizetype Walk::endOfValue(const TagPlace &tag)
{
    const qsizetype full = closingOf(tag.name, tag.end);
    const qsizetype shortTag = closingOf(QStringView(), tag.end);
    const qsizetype last = endOfTemplate(tag.end);
    if (std::min(full, shortTag) >= last) {
        const qsizetype next = text_.indexOf(u'<', tag.end);
        return next < 0 ? text_.size() : next;
    }
    if (full < shortTag) {
        return full + tag.name.size() + 3;
    }
    // As many characters go with a short closing tag as a full one has.
    const qsizetype end = shortTag + 3;
    const qsizetype next = text_.indexOf(u'<', end);
    return std::min(end + tag.name.size(), next < 0 ? text_.size() : next);
}

void Walk::take(const TagPlace &tag)
{
    at_ = tag.end;
    const bool isExact = tag.end - tag.at == tag.name.size() + (tag.isClosing ? 3 : 2);
    if (isExact && equalFolded(tag.name, templateName)) {
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
        at_ = endOfValue(tag);
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
    at_ = afterMarkup(at_);
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
    const qsizetype nextAt = nextTag(tag.end, next);
    const bool isLeaf = !tag.isEmpty && next && next->isClosing && equalFolded(next->name, tag.name);
    const bool holdsElement = !tag.isEmpty && next && !next->isClosing && isElementName(next->name);
    if (inTemplate_) {
        pieces_.push_back({UnreadPiece::Kind::Element, file_.sourceOf(tag.at), tag.name.toString(), 0, holdsElement});
        at_ = isLeaf ? next->end : tag.end;
        return;
    }
    // Elements around the templates do no harm, except one that was meant as a template.
    const bool isTemplate = holdsElement && !equalFolded(next->name, templateName) &&
                            nearestName(tag.name, QStringList(templateName.toString())) == templateName;
    if (isTemplate) {
        pieces_.push_back({UnreadPiece::Kind::Element, file_.sourceOf(tag.at), tag.name.toString(), 0, false});
        hasTemplate_ = true;
        at_ = std::max(nextAt, closingOf(tag.name, nextAt));
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
