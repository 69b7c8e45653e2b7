#include "DeskDialogs.h"

#include "AppMessageBox.h"
#include "PlainWidgets.h"
#include "SaveAs.h"

namespace kareport
{

void installDialogs(QWidget *parent)
{
    setMessageBox([parent](const Message &message) { return showMessageBox(parent, message); });
    setSaveDialog([parent](const SaveRequest &request) {
        return askOwnName(request, [parent](const SaveRequest &asked) { return askSavePath(parent, asked); });
    });
}

} // namespace kareport
