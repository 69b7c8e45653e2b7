#include "ChangedFile.h"

#include "AppMessageBox.h"
#include "Xlate.h"

namespace kareport
{

bool askToLoadAgain(const QString &path, bool hasUnsavedChanges)
{
    const QString question = hasUnsavedChanges
                                 ? Xlate("\"%1\" was changed by another program, and it has unsaved changes here. "
                                         "Load it again and lose the changes made here?")
                                 : Xlate("\"%1\" was changed by another program. Load it again?");
    return showMessage({question.arg(path), QString(), MessageButtons::YesNo, MessageIcon::Question}) ==
           MessageAnswer::Yes;
}

} // namespace kareport
