#pragma once

#include "PageSetup.h"

#include <functional>

class QPrinter;
class QWidget;

namespace kareport
{

// Each asks with what `setPrintDialogs` installed, else with Qt's window, or ours; `PrintDialogs` says what comes back.
bool askPrint(QPrinter &printer, int maxPage, QWidget *parent);
void showPreview(QPrinter &printer, QWidget *parent, const std::function<void(QPrinter &)> &paint);
bool askPageSetup(PageSetup &setup, QWidget *parent);

} // namespace kareport
