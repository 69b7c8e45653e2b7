#include "LandXmlList.h"

#include "LandXmlTexts.h"
#include "TextFolding.h"
#include "Xlate.h"

#include <algorithm>

// The variables of a list, and their values.

namespace kareport
{

void LandXmlList::bind(const FindVariable &findVariable)
{
    QStringList known;
    for (const LandXmlVariable &variable : rows_->variables()) {
        if (const auto parser = findVariable(variable.name)) {
            const bool isFirst = std::none_of(columns_.begin(), columns_.end(),
                                              [&](const Column &column) { return column.parser.id() == parser->id(); });
            columns_.push_back({*parser, names_.size(), variable.type, isFirst});
        }
        names_.push_back(variable.name);
        known.append(variable.name);
    }
    QStringList asked;
    for (const Column &column : columns_) {
        asked.append(names_[column.variable]);
    }
    rows_->setAsked(asked);
    if (columns_.empty()) {
        error_ = InputError{file_->path(), std::nullopt,
                            Xlate("the dictionary has none of the variables of this list, which are: %1")
                                .arg(known.join(QStringLiteral(", ")))};
    }
}

bool LandXmlList::storeNumber(const Column &column, double number, UDataObject &object) const
{
    const auto text = column.parser.takesAnyText() ? landXmlText(number, column.type, settings_) : std::nullopt;
    return text ? column.parser.store(text->toStdString(), object) : column.parser.storeNumber(number, object);
}

/// Stores the values of the current row. @return what is wrong with one
std::optional<InputError> LandXmlList::storeValues(UDataObject &object, const std::vector<unsigned> *onlyIds) const
{
    for (const Column &column : columns_) {
        const ValueParser &parser = column.parser;
        if (onlyIds != nullptr && std::find(onlyIds->begin(), onlyIds->end(), parser.id()) == onlyIds->end()) {
            continue;
        }
        const LandXmlValue value = rows_->value(column.variable);
        if (column.isFirst && std::holds_alternative<std::monostate>(value)) {
            object.Remove(parser.id()); // of an earlier row
        }
        bool fits = true;
        if (const auto *number = std::get_if<double>(&value)) {
            fits = storeNumber(column, *number, object);
        } else if (const auto *text = std::get_if<std::string_view>(&value)) {
            fits = parser.store(*text, object);
        }
        if (!fits) {
            return InputError{file_->path(), FilePlaces(*file_).of(rows_->byte()),
                              Xlate("the value of the variable \"%1\" does not fit: %2 was expected")
                                  .arg(names_[column.variable], parser.expected())};
        }
    }
    return std::nullopt;
}

std::optional<SourceColumns> LandXmlList::columns() const
{
    SourceColumns found;
    found.source = file_->path();
    for (const QString &name : names_) {
        SourceColumn &column = found.columns.emplace_back();
        column.name = name;
        column.isOffered = true;
    }
    for (const Column &column : columns_) {
        found.columns[column.variable].isKnown = true;
        found.variables.append(foldedKey(names_[column.variable]));
    }
    return found;
}

void LandXmlList::setShown(const QStringList &variables)
{
    if (!rows_) {
        return;
    }
    QStringList asked;
    for (const Column &column : columns_) {
        if (variables.contains(names_[column.variable], Qt::CaseInsensitive)) {
            asked.append(names_[column.variable]);
        }
    }
    rows_->setAsked(asked);
}

ValuePlace LandXmlList::placeOf(std::size_t index, const QString & /*variable*/)
{
    ValuePlace found = {file_->path()};
    if (!rows_) {
        return found;
    }
    if (batch_ == nullptr || !batch_->isLast) {
        batches_.reset(); // its thread reads on
        batch_ = nullptr;
    }
    const bool isSorted = order_ && index < order_->size();
    const auto byte = isSorted || !order_ ? rows_->byteOf(isSorted ? (*order_)[index] : index) : std::nullopt;
    if (byte) {
        if (!places_) {
            places_ = std::make_unique<FilePlaces>(*file_);
        }
        found.place = places_->of(*byte);
    }
    return found;
}

} // namespace kareport
