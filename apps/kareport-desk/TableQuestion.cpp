#include "TableQuestion.h"

#include "PlainWidgets.h"
#include "Xlate.h"

#include <QDialog>
#include <QDialogButtonBox>
#include <QLabel>
#include <QListWidget>
#include <QVBoxLayout>

namespace kareport
{

std::optional<std::size_t> askExportedTable(QWidget *parent, const QStringList &tables)
{
    QDialog dialog(parent);
    dialog.setWindowTitle(Xlate("Export Values"));
    auto *label = plainLabel(Xlate("A file of this kind has the rows of &one table:"));
    auto *list = new QListWidget;
    list->addItems(tables);
    list->setCurrentRow(0);
    label->setBuddy(list);
    auto *buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    auto *layout = new QVBoxLayout(&dialog);
    layout->addWidget(label);
    layout->addWidget(list, 1);
    layout->addWidget(buttons);
    QObject::connect(list, &QListWidget::itemActivated, &dialog, &QDialog::accept);
    QObject::connect(buttons, &QDialogButtonBox::accepted, &dialog, &QDialog::accept);
    QObject::connect(buttons, &QDialogButtonBox::rejected, &dialog, &QDialog::reject);
    list->setFocus();
    if (dialog.exec() != QDialog::Accepted || list->currentRow() < 0) {
        return std::nullopt;
    }
    return static_cast<std::size_t>(list->currentRow());
}

} // namespace kareport
