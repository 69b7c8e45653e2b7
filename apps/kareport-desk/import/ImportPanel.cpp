#include "ImportPanel.h"

#include "ImportFields.h"
#include "ImportGuess.h"
#include "ImportMemory.h"
#include "ImportTables.h"
#include "TextFolding.h"
#include "ValueGuard.h"
#include "Xlate.h"

#include <QHeaderView>
#include <QTableWidget>
#include <QVBoxLayout>

#include <utility>

namespace kareport
{

namespace
{

constexpr int mostRows = 20;
constexpr int shownRows = 6;

} // namespace

ImportPanel::ImportPanel(QWidget *parent) : QGroupBox(parent), fields_(new ImportFields), table_(new QTableWidget)
{
    table_->setAccessibleName(Xlate("First rows of the data"));
    table_->setEditTriggers(QAbstractItemView::NoEditTriggers);
    table_->setSelectionMode(QAbstractItemView::SingleSelection);
    table_->setTabKeyNavigation(false);
    table_->verticalHeader()->hide();
    table_->setMinimumHeight((shownRows + 2) * table_->verticalHeader()->defaultSectionSize());
    auto *layout = new QVBoxLayout(this);
    layout->addWidget(fields_);
    layout->addWidget(table_, 1);
    fields_->changed = [this](bool isOfColumns) { change(isOfColumns); };
    fields_->tableChosen = [this] { chooseTable(); };
}

void ImportPanel::setFile(std::shared_ptr<const FileBytes> begin)
{
    begin_ = std::move(begin);
    database_ = nullptr;
    this->begin();
}

void ImportPanel::setDatabase(std::shared_ptr<ImportDatabase> database)
{
    begin_ = nullptr;
    database_ = std::move(database);
    begin();
}

QString ImportPanel::dataKind() const
{
    return isDatabase() ? database_->dataKind() : QStringLiteral("csv");
}

void ImportPanel::setVariables(const VariablesIn &variablesIn)
{
    variablesIn_ = variablesIn;
    if (!isChosen_) {
        begin(); // what a file is can be told by the variables
        return;
    }
    forgetUnknown();
    preview();
}

/// Forgets what was chosen for columns where that are variables of another dictionary.
void ImportPanel::forgetUnknown()
{
    for (const QString &variable : mapping_.variables(own_)) {
        if (!variable.isEmpty() && (!variablesIn_ || !variablesIn_({}).find(variable))) {
            mapping_.clear();
            return;
        }
    }
}

/// Begins with the file: with what was chosen for another one of its shape, or with what can be detected.
void ImportPanel::begin()
{
    mapping_.clear();
    kept_ = {};
    shape_.clear();
    isChosen_ = false;
    wrongDatabase_.clear();
    setTitle(isDatabase() ? Xlate("Database") : Xlate("Text file"));
    fields_->showFor(isDatabase());
    if (!hasFile() || !variablesIn_) {
        preview();
        return;
    }
    if (isDatabase()) {
        offerTables();
        beginTable();
    } else {
        const ImportGuess guess = guessTextFile(begin_, variablesIn_({}));
        shape_ = guess.shape;
        putOptions(rememberedImport(shape_).value_or(guess.options));
    }
    preview();
}

void ImportPanel::offerTables()
{
    const auto tables = database_->tables();
    if (const InputError *wrong = errorOf(tables)) {
        wrongDatabase_ = wrong->text;
        fields_->offer({});
        return;
    }
    fields_->offer(std::get<std::vector<ImportTable>>(tables));
    if (std::get<std::vector<ImportTable>>(tables).empty()) {
        wrongDatabase_ = Xlate("the database has no table");
    }
}

/// Begins with the table of a database that is chosen.
void ImportPanel::beginTable()
{
    mapping_.clear();
    kept_ = {};
    shape_.clear();
    shownTable_ = fields_->table();
    if (shownTable_.isEmpty() || !variablesIn_) {
        return;
    }
    const std::shared_ptr<ImportDatabase> database = database_; // another one may be shown meanwhile
    database->open(shownTable_);
    if (database != database_) {
        return;
    }
    const DataPreview own = previewWith(database_->keysOf(shownTable_), 0);
    QStringList names(database_->dataKind());
    for (const PreviewedColumn &column : own.columns) {
        names.append(foldedKey(column.name));
    }
    shape_ = names.join(u'\n');
    const QJsonObject proposed = proposedGeometry(own, variablesIn_({}));
    QJsonObject options;
    if (!proposed.isEmpty()) {
        options.insert(columnsKey, proposed);
    }
    putOptions(rememberedImport(shape_).value_or(options));
}

void ImportPanel::chooseTable()
{
    if (fields_->table() == shownTable_ && !own_.columns.empty()) {
        return; // what was chosen for its columns stays
    }
    beginTable();
    change(false);
}

/// The first rows with keys of a data set.
DataPreview ImportPanel::previewWith(const QJsonObject &options, int rows) const
{
    return isDatabase() ? database_->preview(fields_->table(), options, variablesIn_, rows)
                        : previewTextFile(begin_, options, variablesIn_, rows);
}

void ImportPanel::putOptions(const QJsonObject &options)
{
    const ValueGuard filling(isFilling_, true, [this](bool on) { isFilling_ = on; });
    fields_->put(options);
    for (auto key = options.begin(); key != options.end(); ++key) {
        if (!ImportFields::isShown(key.key())) {
            kept_.insert(key.key(), key.value());
        }
    }
    own_ = previewWith(ownOptions(), 0);
    mapping_.take(options, own_);
    forgetUnknown();
}

/// The keys without what was chosen for columns.
QJsonObject ImportPanel::ownOptions() const
{
    QJsonObject options = fields_->keys(isDatabase());
    const QJsonObject more = isDatabase() ? database_->keysOf(fields_->table()) : QJsonObject();
    for (const QJsonObject &keys : {kept_, more}) {
        for (auto key = keys.begin(); key != keys.end(); ++key) {
            options.insert(key.key(), key.value());
        }
    }
    return options;
}

QJsonObject ImportPanel::options() const
{
    return hasFile() && variablesIn_ ? mapping_.put(ownOptions(), own_, !isDatabase()) : QJsonObject();
}

QString ImportPanel::problem() const
{
    if (!wrongDatabase_.isEmpty() || !hasFile() || !variablesIn_ || !preview_.error) {
        return wrongDatabase_;
    }
    const InputError &error = *preview_.error;
    return error.place ? Xlate("Line %1, column %2: %3").arg(error.place->line).arg(error.place->column).arg(error.text)
                       : error.text;
}

void ImportPanel::remember() const
{
    if (hasFile() && variablesIn_) {
        rememberImport(shape_, options());
    }
}

/// @param isOfColumns  the columns may be other ones now
void ImportPanel::change(bool isOfColumns)
{
    if (isFilling_) {
        return;
    }
    isChosen_ = true;
    if (isOfColumns) {
        mapping_.clear();
    }
    preview();
    if (changed_) {
        changed_();
    }
}

void ImportPanel::preview()
{
    setVisible(hasFile());
    own_ = {};
    preview_ = {};
    if (hasFile() && variablesIn_ && wrongDatabase_.isEmpty()) {
        own_ = previewWith(ownOptions(), mapping_.isEmpty() ? mostRows : 0);
        preview_ = mapping_.isEmpty() ? own_ : previewWith(options(), mostRows);
    }
    showColumns();
    showRows();
}

} // namespace kareport
