#pragma once

#include <QHash>
#include <QString>
#include <QStringView>

#include <optional>
#include <unordered_map>

namespace kareport
{

/// A tag, or what looks like one.
struct TagPlace
{
    qsizetype at;
    qsizetype end; ///< after it
    QStringView name;
    bool isClosing;
    bool isEmpty; ///< ends with a slash
};

/// Finds the tags of a template file, and where elements end as they are read. The text must outlive it.
class UnreadTags
{
public:
    static constexpr QStringView templateName = u"ReportTemplate";

    explicit UnreadTags(QStringView text) : text_(text) {}

    /// The next tag or other markup (a comment, a declaration). @param tag  receives it when it is a tag
    qsizetype nextTag(qsizetype from, std::optional<TagPlace> &tag) const;
    /// The end of a comment, a declaration or a short closing tag.
    qsizetype afterMarkup(qsizetype at) const;
    /// The next closing tag of a name; the end of the text where there is none. @param from  never before an earlier one
    qsizetype closingOf(QStringView name, qsizetype from);
    /// The end of an element whose text is a value, with its closing tag. One that is not closed ends before the next tag.
    qsizetype endOfValue(const TagPlace &tag);

private:
    std::optional<TagPlace> tagAt(qsizetype at) const;

    QStringView text_;
    std::unordered_map<QString, qsizetype> closings_; ///< the next closing tags, by their folded names
};

} // namespace kareport
