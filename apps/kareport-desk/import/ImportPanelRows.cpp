// The table of an import: what is read from the columns, and the first rows.

#include "ImportPanel.h"

#include "PlainWidgets.h"
#include "ValueGuard.h"
#include "Xlate.h"

#include <QComboBox>
#include <QTableWidget>

#include <algorithm>

namespace kareport
{

namespace
{

/// Offers the variables of a dictionary; a list that offers them already stays as it is.
void offerVariables(QComboBox &box, const QStringList &known)
{
    QStringList offered;
    for (int i = 1; i < box.count(); ++i) {
        offered.append(box.itemText(i));
    }
    if (box.count() > 0 && offered == known) {
        return;
    }
    box.clear();
    box.addItem(Xlate("(not read)"), QString());
    for (const QString &variable : known) {
        box.addItem(variable, variable);
    }
}

} // namespace

/// Shows the columns with what is read from them.
void ImportPanel::showColumns()
{
    const ValueGuard filling(isFilling_, true, [this](bool on) { isFilling_ = on; });
    const int count = static_cast<int>(own_.columns.size());
    table_->setColumnCount(count);
    table_->setRowCount(count > 0 ? 1 + static_cast<int>(preview_.rows.size()) : 0);
    const QStringList variables = mapping_.variables(own_);
    const QStringList known = variablesIn_ ? variablesIn_({}).names : QStringList();
    QStringList titles;
    for (int column = 0; column < count; ++column) {
        const QString &name = own_.columns[static_cast<std::size_t>(column)].name;
        const QString title = name.isEmpty() ? QString::number(column + 1) : name;
        titles.append(title);
        // A box that has the keyboard stays.
        auto *box = qobject_cast<QComboBox *>(table_->cellWidget(0, column));
        if (box == nullptr) {
            box = new QComboBox;
            box->setSizeAdjustPolicy(QComboBox::AdjustToContents);
            table_->setCellWidget(0, column, box);
            connect(box, &QComboBox::currentIndexChanged, this, [this, box, column] {
                if (!isFilling_) {
                    mapping_.choose(column, box->currentData().toString());
                    change(false);
                }
            });
        }
        box->setAccessibleName(Xlate("Variable of the column %1").arg(title));
        offerVariables(*box, known);
        box->setCurrentIndex(qMax(0, box->findData(variables[column], Qt::UserRole, Qt::MatchFixedString)));
    }
    table_->setHorizontalHeaderLabels(titles);
}

void ImportPanel::showRows()
{
    const QColor wrongColor(220, 50, 50, 110);
    const int count = table_->columnCount();
    for (int row = 0; row < static_cast<int>(preview_.rows.size()) && count > 0; ++row) {
        const std::vector<PreviewedCell> &cells = preview_.rows[static_cast<std::size_t>(row)];
        for (int column = 0; column < count; ++column) {
            const auto index = static_cast<std::size_t>(column);
            const PreviewedCell cell = index < cells.size() ? cells[index] : PreviewedCell{QString()};
            auto *item = new QTableWidgetItem(cell.text);
            QString wrong = cell.wrong;
            if (column == count - 1 && cells.size() > index + 1) {
                wrong = cells[index + 1].wrong; // what is wrong with the cells after the last column
            }
            if (!wrong.isEmpty()) {
                item->setBackground(wrongColor);
                item->setToolTip(plainToolTip(wrong));
                item->setData(Qt::AccessibleDescriptionRole, wrong);
            }
            table_->setItem(row + 1, column, item);
        }
    }
    table_->resizeColumnsToContents();
    for (int column = 0; column < table_->columnCount(); ++column) {
        // A box in a cell is not content of its column.
        if (const QWidget *box = table_->cellWidget(0, column)) {
            const int room = box->fontMetrics().averageCharWidth(); // a box asks for a little less than its style draws
            table_->setColumnWidth(column, std::max(table_->columnWidth(column), box->sizeHint().width() + room));
        }
    }
}

} // namespace kareport
