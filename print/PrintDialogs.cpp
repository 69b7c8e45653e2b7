#include "PrintDialogs.h"

#include "PageSetupDialog.h"
#include "PlainWidgets.h"
#include "PrintQuestions.h"
#include "Xlate.h"

#include <QPointer>
#include <QPrintDialog>
#include <QPrintPreviewDialog>
#include <QPrinter>

namespace kareport
{

namespace
{

PrintDialogs &installed()
{
    static PrintDialogs dialogs;
    return dialogs;
}

} // namespace

void setPrintDialogs(PrintDialogs dialogs)
{
    installed() = std::move(dialogs);
}

bool askPrint(QPrinter &printer, int maxPage, QWidget *parent)
{
    if (installed().print) {
        return installed().print(printer, maxPage, parent);
    }
    // The parent may be destroyed, and the dialog with it, while it is open.
    const QPointer<QPrintDialog> dialog = new QPrintDialog(&printer, parent);
    dialog->setWindowTitle(Xlate("Print"));
    keepLabelsPlain(*dialog); // they show what printers say of themselves
    dialog->setOption(QAbstractPrintDialog::PrintPageRange);
    if (maxPage > 0) {
        dialog->setMinMax(1, maxPage);
        dialog->setFromTo(1, maxPage);
    }
    dialog->setPrintRange(QAbstractPrintDialog::AllPages);
    const bool accepted = dialog->exec() == QDialog::Accepted;
    delete dialog;
    return accepted;
}

void showPreview(QPrinter &printer, QWidget *parent, const std::function<void(QPrinter &)> &paint)
{
    if (installed().preview) {
        installed().preview(printer, parent, paint);
        return;
    }
    const QPointer<QPrintPreviewDialog> dialog = new QPrintPreviewDialog(&printer, parent);
    dialog->setWindowTitle(Xlate("Print Preview"));
    dialog->setWindowFlag(Qt::WindowMaximizeButtonHint);
    QObject::connect(dialog, &QPrintPreviewDialog::paintRequested, dialog,
                     [&paint](QPrinter *target) { paint(*target); });
    dialog->exec();
    delete dialog;
}

bool askPageSetup(PageSetup &setup, QWidget *parent)
{
    if (installed().pageSetup) {
        return installed().pageSetup(setup, parent);
    }
    return showPageSetup(setup, parent);
}

} // namespace kareport
