#include "SaveDialog.h"

namespace kareport
{

namespace
{

SaveDialog &installedDialog()
{
    static SaveDialog dialog;
    return dialog;
}

SaveFailure &installedFailure()
{
    static SaveFailure say;
    return say;
}

} // namespace

void setSaveDialog(SaveDialog dialog)
{
    installedDialog() = std::move(dialog);
}

std::optional<QString> askSaveName(const SaveRequest &request)
{
    return installedDialog() ? installedDialog()(request) : std::nullopt;
}

void setSaveFailure(SaveFailure say)
{
    installedFailure() = std::move(say);
}

void saySaveFailed(const QString &path, const QString &reason)
{
    if (installedFailure()) {
        installedFailure()(path, reason);
    }
}

} // namespace kareport
