#pragma once

#include "ScanText.h"

#include <QString>
#include <QStringList>
#include <QStringView>

#include <vector>

namespace kareport
{

/// The usual spelling of an element's name, "ReportTemplate" for REPORTTEMPLATE; another name comes back as it is.
QString elementName(QStringView tag);

/// The usual spelling of all elements' names.
QStringList elementNameList();
/// Whether it is the name of an element, in any case.
bool isElementName(QStringView name);
/// What is between "<" and ">" of the tag at a position; empty when there is no such text.
QStringView tagTextAt(QStringView text, qsizetype at);
/// The name in a tag's text, without what surrounds it.
QStringView nameInTag(QStringView tag);

/// A piece of text that looks like a tag of a template and is not, or the other way round.
struct TagRemark
{
    enum class Kind
    {
        NotATag,  ///< blanks, attributes or a slash: the scanner does not see it
        InComment ///< a tag inside a comment: the scanner does not see the comment
    };
    Kind kind;
    qsizetype source; ///< where in the file
    QString text;     ///< unchanged, but shortened
};

std::vector<TagRemark> findIgnoredTags(const ScanText &file);

} // namespace kareport
