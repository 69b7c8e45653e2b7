#pragma once

#include "TemplateFile.h"
#include "TextPlace.h"

#include <QString>

#include <optional>
#include <vector>

namespace kareport
{

/// Something in a template file that is read in another way than it looks, or not at all.
struct TemplateRemark
{
    TextPlace place;      ///< in the file
    bool isError = false; ///< the report would come out wrong; otherwise it may be meant
    QString text;         ///< one sentence, translated
};

/// A width or a number of decimals above this counts as a mistake.
inline constexpr qint32 widestColumn = 32767;

/// What of a file is checked, and for which use.
struct TemplateCheckScope
{
    QString name =
        QString(); ///< of the one template that is checked, the last one of the name; empty for the whole file
    bool hasPlaceholders = false; ///< labels have placeholders, so that they are not as wide as they look
};

/// Reads every template of a file as the module reads it and says what the module ignores silently, in the order
/// of the file. Where memory ends, the one remark is an error that says so.
std::vector<TemplateRemark> checkTemplates(const TemplateFile &file, const TemplateCheckScope &scope = {});

/// The first thing in a file that keeps a whole template from being read; nothing when there is none. That memory has ended
/// while it was looked for is one.
std::optional<TemplateRemark> firstUnreadTemplate(const TemplateFile &file);

} // namespace kareport
