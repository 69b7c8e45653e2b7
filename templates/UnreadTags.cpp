#include "UnreadTags.h"

#include "TagLint.h"
#include "TextFolding.h"

#include <algorithm>

namespace kareport
{

std::optional<TagPlace> UnreadTags::tagAt(qsizetype at) const
{
    const QStringView tag = tagTextAt(text_, at);
    const QStringView name = nameInTag(tag);
    if (name.isEmpty() || !name.front().isLetter()) {
        return std::nullopt;
    }
    return TagPlace{at, at + tag.size() + 2, name, tag.trimmed().startsWith(u'/'), tag.endsWith(u'/')};
}

qsizetype UnreadTags::nextTag(qsizetype from, std::optional<TagPlace> &tag) const
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

qsizetype UnreadTags::afterMarkup(qsizetype at) const
{
    const bool isComment = text_.sliced(at).startsWith(u"<!--");
    const QStringView end = isComment ? QStringView(u"-->") : QStringView(u">");
    const qsizetype found = text_.indexOf(end, at);
    return found < 0 ? text_.size() : found + end.size();
}

qsizetype UnreadTags::closingOf(QStringView name, qsizetype from)
{
    qsizetype &next = closings_.try_emplace(foldedKey(name), -1).first->second;
    if (next < from) {
        const QString closing = QStringLiteral("</%1>").arg(name);
        next = text_.indexOf(closing, from, Qt::CaseInsensitive);
        next = next < 0 ? text_.size() : next;
    }
    return next;
}

qsizetype UnreadTags::endOfValue(const TagPlace &tag)
{
    const qsizetype full = closingOf(tag.name, tag.end);
    const qsizetype shortTag = closingOf(QStringView(), tag.end);
    const qsizetype last = closingOf(templateName, tag.end);
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

} // namespace kareport
