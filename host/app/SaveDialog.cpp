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

} // namespace

void setSaveDialog(SaveDialog dialog)
{
    installedDialog() = std::move(dialog);
}

std::optional<QString> askSaveName(const SaveRequest &request)
{
    return installedDialog() ? installedDialog()(request) : std::nullopt;
}

} // namespace kareport
