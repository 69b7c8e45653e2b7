#include "TagLint.h"

#include "TextFolding.h"

#include <algorithm>
#include <array>

namespace kareport
{

namespace
{

constexpr std::array<QStringView, 25> elementNames = {
    u"ReportTemplate", u"Name",       u"Title",        u"Tables",         u"Table",        u"Use",   u"Sort",
    u"OutputList",     u"Field",      u"VariableName", u"Label",          u"Format",       u"Align", u"Dictionaries",
    u"Variable",       u"Dictionary", u"ID",           u"DictionaryName", u"VariableList", u"Type",  u"Blocks",
    u"Block",          u"Separator",  u"PageBreaks",   u"Options"};

/// Longer than any text that is meant as a tag, attributes included.
constexpr qsizetype longestTag = 200;
constexpr qsizetype longestQuote = 40;

} // namespace

QStringList elementNameList()
{
    QStringList names;
    for (const QStringView name : elementNames) {
        names.append(name.toString());
    }
    return names;
}

bool isElementName(QStringView name)
{
    return std::any_of(elementNames.begin(), elementNames.end(),
                       [name](QStringView known) { return equalFolded(known, name); });
}

QStringView tagTextAt(QStringView text, qsizetype at)
{
    const QStringView rest = text.sliced(at + 1).first(std::min(longestTag, text.size() - at - 1));
    const auto *const end =
        std::find_if(rest.begin(), rest.end(), [](QChar character) { return character == u'>' || character == u'<'; });
    return end != rest.end() && *end == u'>' ? QStringView(rest.begin(), end) : QStringView();
}

QStringView nameInTag(QStringView tag)
{
    qsizetype begin = 0;
    while (begin < tag.size() && (tag[begin] == u'/' || tag[begin].isSpace())) {
        ++begin;
    }
    qsizetype end = begin;
    while (end < tag.size() && (tag[end].isLetterOrNumber() || tag[end] == u'_' || tag[end] == u'-' ||
                                tag[end] == u':' || tag[end] == u'.'))
    {
        ++end;
    }
    return tag.sliced(begin, end - begin);
}

QString elementName(QStringView tag)
{
    const auto *const found = std::find_if(elementNames.begin(), elementNames.end(),
                                           [tag](QStringView known) { return equalFolded(known, tag); });
    if (found != elementNames.end()) {
        return found->toString();
    }
    return tag.toString();
}

std::vector<TagRemark> findIgnoredTags(const ScanText &file)
{
    std::vector<TagRemark> remarks;
    const QStringView text = file.view();
    qsizetype commentEnd = 0;
    for (qsizetype at = text.indexOf(u'<'); at >= 0; at = text.indexOf(u'<', at + 1)) {
        if (at >= commentEnd && text.sliced(at).startsWith(u"<!--")) {
            const qsizetype end = text.indexOf(u"-->", at);
            commentEnd = end < 0 ? text.size() : end;
            continue;
        }
        const QStringView tag = tagTextAt(text, at);
        const QStringView name = nameInTag(tag);
        if (name.isEmpty() || !isElementName(name)) {
            continue;
        }
        const bool isTag = tag == name || (tag.startsWith(u'/') && tag.sliced(1) == name);
        const bool inComment = at < commentEnd;
        if (isTag == inComment) {
            QString quote = u'<' + tag.first(std::min(tag.size(), longestQuote)).toString();
            quote += tag.size() > longestQuote ? QStringLiteral("…>") : QStringLiteral(">");
            remarks.push_back(
                {isTag ? TagRemark::Kind::InComment : TagRemark::Kind::NotATag, file.sourceOf(at), quote});
        }
    }
    return remarks;
}

} // namespace kareport
