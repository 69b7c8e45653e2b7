#include "ImportPanel.h"

#include "ImportGuess.h"
#include "ImportMemory.h"
#include "PlainWidgets.h"
#include "SqlitePreview.h"
#include "TextFolding.h"
#include "ValueGuard.h"
#include "Xlate.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QRegularExpression>
#include <QRegularExpressionValidator>
#include <QSignalBlocker>
#include <QTableWidget>
#include <QVBoxLayout>

#include <initializer_list>
#include <utility>

namespace kareport
{

namespace
{

constexpr int mostRows = 20;
constexpr int shownRows = 6;

const QString unitsKey = QStringLiteral("units");
const QString headerKey = QStringLiteral("header");
const QString tableKey = QStringLiteral("table");

/// A list of choices with the values of a key; that of the default is empty.
QComboBox *choice(std::initializer_list<std::pair<const char *, QString>> items)
{
    auto *box = new QComboBox;
    for (const auto &[value, text] : items) {
        box->addItem(text, QString::fromLatin1(value));
    }
    return box;
}

void select(QComboBox &box, const QString &value)
{
    const QSignalBlocker blocker(box);
    box.setCurrentIndex(qMax(0, box.findData(value)));
}

void put(QJsonObject &options, const char *key, const QComboBox &box)
{
    if (const QString value = box.currentData().toString(); !value.isEmpty()) {
        options.insert(QLatin1StringView(key), value);
    }
}

/// The keys that the panel shows.
bool isShown(const QString &key)
{
    for (const char *shown : {"delimiter", "decimal", "encoding", "header", "order", "columns", "units"}) {
        if (key == QLatin1StringView(shown)) {
            return true;
        }
    }
    return false;
}

} // namespace

ImportPanel::ImportPanel(QWidget *parent)
    : QGroupBox(parent),
      left_(new QFormLayout),
      right_(new QFormLayout),
      databaseTable_(new QComboBox),
      delimiter_(choice({{"", Xlate("Comma")},
                         {";", Xlate("Semicolon")},
                         {"\t", Xlate("Tab")},
                         {"|", Xlate("Vertical bar")},
                         {"whitespace", Xlate("Blanks and tabs")}})),
      decimal_(choice({{"", Xlate("Point: 1.5")}, {",", Xlate("Comma: 1,5")}})),
      encoding_(choice({{"", QStringLiteral("UTF-8")},
                        {"windows-1252", QStringLiteral("Windows-1252")},
                        {"latin-1", QStringLiteral("Latin-1")},
                        {"utf-16", QStringLiteral("UTF-16")}})),
      header_(new QCheckBox(Xlate("First &row names the columns"))),
      order_(new QLineEdit),
      length_(choice({{"", Xlate("Metre")},
                      {"mm", Xlate("Millimetre")},
                      {"km", Xlate("Kilometre")},
                      {"ft", Xlate("International foot")},
                      {"usft", Xlate("US survey foot")}})),
      area_(choice({{"", Xlate("Square metre")},
                    {"ha", Xlate("Hectare")},
                    {"km2", Xlate("Square kilometre")},
                    {"ft2", Xlate("Square foot")},
                    {"ac", Xlate("Acre")}})),
      angle_(choice({{"", Xlate("Degree")},
                     {"gon", Xlate("Gon")},
                     {"rad", Xlate("Radian")},
                     {"dms", Xlate("Degrees, minutes, seconds")}})),
      table_(new QTableWidget)
{
    const auto addRow = [](QFormLayout &form, const QString &text, const QString &name, QWidget *widget) {
        auto *label = plainLabel(text);
        label->setBuddy(widget);
        widget->setAccessibleName(name);
        form.addRow(label, widget);
    };
    addRow(*left_, Xlate("Tabl&e:"), Xlate("Table of the database"), databaseTable_);
    addRow(*left_, Xlate("Deli&miter:"), Xlate("Delimiter"), delimiter_);
    addRow(*left_, Xlate("Decimal s&ign:"), Xlate("Decimal sign"), decimal_);
    addRow(*left_, Xlate("En&coding:"), Xlate("Encoding"), encoding_);
    addRow(*left_, Xlate("&Order:"), Xlate("Order of the columns"), order_);
    addRow(*right_, Xlate("&Lengths are:"), Xlate("Unit of lengths in the data"), length_);
    addRow(*right_, Xlate("&Areas are:"), Xlate("Unit of areas in the data"), area_);
    addRow(*right_, Xlate("A&ngles are:"), Xlate("Unit of angles in the data"), angle_);
    right_->addRow(header_);
    header_->setAccessibleName(Xlate("First row names the columns"));
    order_->setPlaceholderText(QStringLiteral("PNEZD"));
    order_->setToolTip(Xlate("P number, N northing, E easting, Z elevation, D description, - not read"));
    order_->setValidator(new QRegularExpressionValidator(QRegularExpression(QStringLiteral("[PNEZDpnezd-]*")), order_));
    table_->setAccessibleName(Xlate("First rows of the data"));
    table_->setEditTriggers(QAbstractItemView::NoEditTriggers);
    table_->setSelectionMode(QAbstractItemView::SingleSelection);
    table_->setTabKeyNavigation(false);
    table_->verticalHeader()->hide();
    table_->setMinimumHeight((shownRows + 2) * table_->verticalHeader()->defaultSectionSize());

    auto *layout = new QVBoxLayout(this);
    auto *forms = new QHBoxLayout;
    forms->addLayout(left_, 1);
    forms->addLayout(right_, 1);
    layout->addLayout(forms);
    layout->addWidget(table_, 1);
    connect(databaseTable_, &QComboBox::currentIndexChanged, this, [this] {
        if (!isFilling_) {
            beginTable();
            change(false);
        }
    });
    for (QComboBox *box : {delimiter_, decimal_, encoding_}) {
        connect(box, &QComboBox::currentIndexChanged, this, [this] { change(true); });
    }
    for (QComboBox *box : {length_, area_, angle_}) {
        connect(box, &QComboBox::currentIndexChanged, this, [this] { change(false); });
    }
    connect(header_, &QCheckBox::toggled, this, [this] { change(true); });
    connect(order_, &QLineEdit::textChanged, this, [this] { change(true); });
}

void ImportPanel::setFile(std::shared_ptr<const FileBytes> begin)
{
    begin_ = std::move(begin);
    database_.clear();
    this->begin();
}

void ImportPanel::setDatabase(const QString &file)
{
    begin_ = nullptr;
    database_ = file;
    begin();
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
    showFields();
    if (!hasFile() || !variablesIn_) {
        preview();
        return;
    }
    if (!isDatabase()) {
        const ImportGuess guess = guessTextFile(begin_, variablesIn_({}));
        shape_ = guess.shape;
        putOptions(rememberedImport(shape_).value_or(guess.options));
        preview();
        return;
    }
    const auto tables = sqliteTables(database_);
    {
        const ValueGuard filling(isFilling_, true, [this](bool on) { isFilling_ = on; });
        const QString chosen = databaseTable_->currentText();
        databaseTable_->clear();
        if (const InputError *wrong = errorOf(tables)) {
            wrongDatabase_ = wrong->text;
        } else {
            databaseTable_->addItems(std::get<QStringList>(tables));
            databaseTable_->setCurrentIndex(databaseTable_->count() > 0 ? qMax(0, databaseTable_->findText(chosen))
                                                                        : -1);
            if (databaseTable_->count() == 0) {
                wrongDatabase_ = Xlate("the database has no table");
            }
        }
    }
    beginTable();
    preview();
}

/// Begins with the table of a database that is chosen.
void ImportPanel::beginTable()
{
    mapping_.clear();
    kept_ = {};
    shape_.clear();
    if (databaseTable_->currentIndex() < 0 || !variablesIn_) {
        return;
    }
    const DataPreview own = previewWith({{tableKey, databaseTable_->currentText()}}, 0);
    QStringList names(QStringLiteral("sqlite"));
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

/// The first rows with keys of a data set.
DataPreview ImportPanel::previewWith(const QJsonObject &options, int rows) const
{
    return isDatabase() ? previewDatabase(database_, options, variablesIn_, rows)
                        : previewTextFile(begin_, options, variablesIn_, rows);
}

/// Shows the fields that the file has a use for.
void ImportPanel::showFields()
{
    setTitle(isDatabase() ? Xlate("Database") : Xlate("Text file"));
    left_->setRowVisible(databaseTable_, isDatabase());
    for (QWidget *field : {static_cast<QWidget *>(delimiter_), static_cast<QWidget *>(decimal_),
                           static_cast<QWidget *>(encoding_), static_cast<QWidget *>(order_)})
    {
        left_->setRowVisible(field, !isDatabase());
    }
    right_->setRowVisible(header_, !isDatabase());
}

void ImportPanel::putOptions(const QJsonObject &options)
{
    const ValueGuard filling(isFilling_, true, [this](bool on) { isFilling_ = on; });
    const auto textOf = [&options](const char *key) { return options.value(QLatin1StringView(key)).toString(); };
    select(*delimiter_, textOf("delimiter"));
    select(*decimal_, textOf("decimal"));
    select(*encoding_, textOf("encoding"));
    header_->setChecked(options.value(headerKey).toBool(true));
    order_->setText(textOf("order"));
    const QJsonObject units = options.value(unitsKey).toObject();
    select(*length_, units.value(u"length").toString());
    select(*area_, units.value(u"area").toString());
    select(*angle_, units.value(u"angle").toString());
    for (auto key = options.begin(); key != options.end(); ++key) {
        if (!isShown(key.key()) && key.key() != tableKey) {
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
    QJsonObject options = kept_;
    if (isDatabase()) {
        options.insert(tableKey, databaseTable_->currentText());
    } else {
        put(options, "delimiter", *delimiter_);
        put(options, "decimal", *decimal_);
        put(options, "encoding", *encoding_);
        if (!header_->isChecked()) {
            options.insert(headerKey, false);
        }
        if (!order_->text().isEmpty()) {
            options.insert(orderKey, order_->text());
        }
    }
    QJsonObject units;
    put(units, "length", *length_);
    put(units, "area", *area_);
    put(units, "angle", *angle_);
    if (!units.isEmpty()) {
        options.insert(unitsKey, units);
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
