#pragma once

#include "ColumnBinding.h"
#include "ColumnMapping.h"
#include "DataPreview.h"
#include "DataUnits.h"
#include "FileBytes.h"
#include "ImportDatabase.h"

#include <QGroupBox>
#include <QJsonObject>
#include <QString>

#include <functional>
#include <memory>
#include <vector>

class QTableWidget;

namespace kareport
{

class ImportFields;

/// Asks how data is read. Of a text file of rows and cells: delimiter, decimal sign, encoding, header row or order of the columns, the
/// variables of the columns and the units of the numbers; and shows the first rows as they are read then. What does not fit is
/// red, and its tool tip says why. Of a database: the table, the variables of its columns and the units.
///
/// A file begins with what was chosen for the last one of its shape, or else with what can be detected.
class ImportPanel : public QGroupBox
{
public:
    /// Gives the variables that are wanted, for numbers in units; none while there is no dictionary.
    using VariablesIn = ImportDatabase::VariablesIn;

    explicit ImportPanel(QWidget *parent = nullptr);

    /// Shows a file; null shows none. @param begin  the beginning of the file, as `beginOfText` makes it
    void setFile(std::shared_ptr<const FileBytes> begin);
    /// Shows a database. @param database  not null
    void setDatabase(std::shared_ptr<ImportDatabase> database);
    /// Says which variables are wanted. Choices that they do not have are forgotten.
    void setVariables(const VariablesIn &variablesIn);
    /// Called when something was chosen.
    void setChangedHandler(std::function<void()> handler) { changed_ = std::move(handler); }

    bool hasFile() const { return begin_ != nullptr || isDatabase(); }
    bool isDatabase() const { return database_ != nullptr; }
    /// The key of the data set in a job.
    QString dataKind() const;
    /// The keys of a data set that say what is chosen, as far as they are not the defaults.
    QJsonObject options() const;
    /// What is wrong with the first rows; empty where they can be read.
    QString problem() const;
    /// Keeps what is chosen for files of the same shape.
    void remember() const;

    QTableWidget &table() const { return *table_; }

private:
    QJsonObject ownOptions() const;
    void putOptions(const QJsonObject &options);
    void begin();
    void offerTables();
    void beginTable();
    void chooseTable();
    void forgetUnknown();
    void change(bool isOfColumns);
    void preview();
    DataPreview previewWith(const QJsonObject &options, int rows) const;
    void showColumns();
    void showRows();

    ImportFields *fields_;
    QTableWidget *table_;                      ///< its first row has the variables
    std::shared_ptr<const FileBytes> begin_;   ///< null for a database
    std::shared_ptr<ImportDatabase> database_; ///< null for a text file
    QString shownTable_;                       ///< of the database
    QString wrongDatabase_;                    ///< why it has no tables to choose from
    VariablesIn variablesIn_;
    QString shape_;
    QJsonObject kept_; ///< keys that were remembered and are not shown
    ColumnMapping mapping_;
    DataPreview own_; ///< without what was chosen for columns
    DataPreview preview_;
    bool isChosen_ = false;  ///< the user has chosen something since the file came
    bool isFilling_ = false; ///< the lists are being filled: what changes in them is not a choice
    std::function<void()> changed_;
};

} // namespace kareport
