#include "ImportFields.h"

#include "ColumnMapping.h"
#include "PlainWidgets.h"
#include "ValueGuard.h"
#include "Xlate.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QRegularExpression>
#include <QRegularExpressionValidator>

#include <algorithm>
#include <initializer_list>
#include <iterator>
#include <utility>

namespace kareport
{

namespace
{

const QString unitsKey = QStringLiteral("units");
const QString headerKey = QStringLiteral("header");

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
    box.setCurrentIndex(qMax(0, box.findData(value)));
}

void insert(QJsonObject &keys, const char *key, const QComboBox &box)
{
    if (const QString value = box.currentData().toString(); !value.isEmpty()) {
        keys.insert(QLatin1StringView(key), value);
    }
}

} // namespace

ImportFields::ImportFields(QWidget *parent)
    : QWidget(parent),
      left_(new QFormLayout),
      right_(new QFormLayout),
      table_(new QComboBox),
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
                     {"dms", Xlate("Degrees, minutes, seconds")}}))
{
    const auto addRow = [](QFormLayout &form, const QString &text, const QString &name, QWidget *widget) {
        auto *label = plainLabel(text);
        label->setBuddy(widget);
        widget->setAccessibleName(name);
        form.addRow(label, widget);
    };
    addRow(*left_, Xlate("Tabl&e:"), Xlate("Table of the database"), table_);
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
    // A long name of a table does not make the window wider.
    table_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    constexpr int leastLetters = 16;
    table_->setMinimumContentsLength(leastLetters);
    auto *forms = new QHBoxLayout(this);
    forms->setContentsMargins(0, 0, 0, 0);
    forms->addLayout(left_, 1);
    forms->addLayout(right_, 1);
    watch();
}

void ImportFields::watch()
{
    // One that could not be read can be chosen again.
    connect(table_, &QComboBox::activated, this, [this] {
        if (tableChosen) {
            tableChosen();
        }
    });
    for (QComboBox *box : {delimiter_, decimal_, encoding_}) {
        connect(box, &QComboBox::currentIndexChanged, this, [this] { tell(true); });
    }
    for (QComboBox *box : {length_, area_, angle_}) {
        connect(box, &QComboBox::currentIndexChanged, this, [this] { tell(false); });
    }
    connect(header_, &QCheckBox::toggled, this, [this] { tell(true); });
    connect(order_, &QLineEdit::textChanged, this, [this] { tell(true); });
}

void ImportFields::tell(bool isOfColumns)
{
    if (!isFilling_ && changed) {
        changed(isOfColumns);
    }
}

void ImportFields::showFor(bool isDatabase)
{
    left_->setRowVisible(table_, isDatabase);
    for (QWidget *field : {static_cast<QWidget *>(delimiter_), static_cast<QWidget *>(decimal_),
                           static_cast<QWidget *>(encoding_), static_cast<QWidget *>(order_)})
    {
        left_->setRowVisible(field, !isDatabase);
    }
    right_->setRowVisible(header_, !isDatabase);
}

void ImportFields::offer(const std::vector<ImportTable> &tables)
{
    const QString chosen = table_->currentText();
    table_->clear();
    for (const ImportTable &table : tables) {
        table_->addItem(table.name);
        if (const QString columns = table.columns.join(QStringLiteral(", ")); !columns.isEmpty()) {
            table_->setItemData(table_->count() - 1, plainToolTip(columns), Qt::ToolTipRole);
        }
    }
    table_->setCurrentIndex(tables.empty() ? -1 : qMax(0, table_->findText(chosen)));
}

QString ImportFields::table() const
{
    return table_->currentText();
}

QJsonObject ImportFields::keys(bool isDatabase) const
{
    QJsonObject keys;
    if (!isDatabase) {
        insert(keys, "delimiter", *delimiter_);
        insert(keys, "decimal", *decimal_);
        insert(keys, "encoding", *encoding_);
        if (!header_->isChecked()) {
            keys.insert(headerKey, false);
        }
        if (!order_->text().isEmpty()) {
            keys.insert(orderKey, order_->text());
        }
    }
    QJsonObject units;
    insert(units, "length", *length_);
    insert(units, "area", *area_);
    insert(units, "angle", *angle_);
    if (!units.isEmpty()) {
        keys.insert(unitsKey, units);
    }
    return keys;
}

void ImportFields::put(const QJsonObject &keys)
{
    const ValueGuard filling(isFilling_, true, [this](bool on) { isFilling_ = on; });
    const auto textOf = [&keys](const char *key) { return keys.value(QLatin1StringView(key)).toString(); };
    select(*delimiter_, textOf("delimiter"));
    select(*decimal_, textOf("decimal"));
    select(*encoding_, textOf("encoding"));
    header_->setChecked(keys.value(headerKey).toBool(true));
    order_->setText(textOf("order"));
    const QJsonObject units = keys.value(unitsKey).toObject();
    select(*length_, units.value(u"length").toString());
    select(*area_, units.value(u"area").toString());
    select(*angle_, units.value(u"angle").toString());
}

bool ImportFields::isShown(const QString &key)
{
    constexpr const char *shown[] = {"delimiter", "decimal", "encoding", "header", "order",
                                     "columns",   "units",   "table",    "query"};
    return std::any_of(std::begin(shown), std::end(shown),
                       [&key](const char *one) { return key == QLatin1StringView(one); });
}

} // namespace kareport
