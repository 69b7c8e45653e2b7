#pragma once

#include <QString>

#include <functional>
#include <vector>

namespace kareport
{

/// Opens a template file in an editor of its own, with the pages of its report beside it, or brings the editor to the front that
/// has the file already.
/// @param line, column  where the cursor goes, both from 1; 0 leaves it where it is
/// @return false, after a message, when the file cannot be read
bool openTemplateAt(const QString &path, qsizetype line = 0, qsizetype column = 0);

/// A template that is open in an editor.
struct OpenTemplateFile
{
    QString path;
    bool isModified = false; ///< it has changes that are not saved
};
/// All of them, in the order in which they were opened.
std::vector<OpenTemplateFile> openTemplates();

/// Closes all editors of templates. Each asks about its unsaved changes. @return false when the user has kept one open
bool closeTemplateEditors();
/// Closes all editors of templates without a question.
void dropTemplateEditors();

/// Sets what opens files that an editor does not edit itself, as those that its File menu opens; an empty one opens none.
void setFileOpener(std::function<bool(const QString &path)> open);
/// Opens a file by what was set. @return whether it was opened
bool openAnyFile(const QString &path);

} // namespace kareport
