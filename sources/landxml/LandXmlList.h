#pragma once

#include "DataUnits.h"
#include "FilePlaces.h"
#include "LandXmlQuery.h"
#include "LandXmlRows.h"
#include "RowBatches.h"
#include "RowList.h"
#include "UJobSettings.h"
#include "ValueParser.h"

#include <memory>
#include <optional>
#include <vector>

namespace kareport
{

/// The rows of a LandXML file as data objects, made while they are asked for in order: only a few objects exist at a time,
/// and a list of points does not keep the file in memory either. Progress counts bytes.
class LandXmlList : public RowList
{
public:
    /// Reads the file up to its units. Variables that the dictionary does not know are left out.
    /// @param findVariable  gives parsers for the units of `units()`
    /// @param settings      of the report, for lengths and stations that the dictionary has as texts
    LandXmlList(std::shared_ptr<const FileBytes> file, LandXmlQuery query, const FindVariable &findVariable,
                ReadProgress progress, const UJobSettings &settings = {});
    ~LandXmlList() override;

    /// Says which variables are shown, of those that the dictionary has; without it, all. What concerns others alone is not noted.
    /// To be called before rows are asked for.
    void setShown(const QStringList &variables);

    /// What the values are in, whatever the file's units are: metre, square metre, radian.
    static DataUnits units();
    /// The variables that the rows of a query have, with the value types that suit them.
    static std::vector<LandXmlVariable> variables(const LandXmlQuery &query);

    /// Going back is possible; points are then read from the file's start again.
    UDataObject *GetAt(std::size_t index) override;
    /// Makes the sort keys of all rows and orders the rows. Points are then kept in memory.
    void Sort(const std::vector<unsigned> &ids) override;

    std::optional<InputError> error() const override { return error_; }
    /// The place of the element that the row is made of.
    ValuePlace placeOf(std::size_t index, const QString &variable) override;
    /// Differences in a file whose rows are sound, and the kinds of elements that no list reads. Nothing before the rows have
    /// come to their end.
    std::vector<InputError> notes() const override;
    /// The variables that rows of the query have. All are offered: one that is not read is not missed.
    std::optional<SourceColumns> columns() const override;

private:
    struct Column
    {
        ValueParser parser;
        std::size_t variable;
        int type;     ///< that suits the variable
        bool isFirst; ///< of those with its identifier
    };

    void bind(const FindVariable &findVariable);
    void rewind();
    bool takeBatch();
    void fill(RowBatch &batch);
    bool readRow(RowBatch &batch);
    bool storeNumber(const Column &column, double number, UDataObject &object) const;
    std::optional<InputError> storeValues(UDataObject &object, const std::vector<unsigned> *onlyIds) const;
    std::optional<InputError> endOfRows(const std::optional<InputError> &error) const;

    std::shared_ptr<const FileBytes> file_;
    ReadProgress progress_;
    UJobSettings settings_;
    std::unique_ptr<LandXmlRows> rows_; ///< null when the file could not be begun
    std::vector<QString> names_;        ///< of the variables
    std::vector<Column> columns_;
    std::optional<std::vector<std::size_t>> order_; ///< of a sorted list
    std::size_t nextOrdered_ = 0;
    const RowBatch *batch_ = nullptr;
    std::size_t batchStart_ = 0;
    std::optional<InputError> error_;
    std::unique_ptr<FilePlaces> places_; ///< once one was asked for
    bool stopped_ = false;
    std::unique_ptr<RowBatches> batches_; ///< last, so that its thread ends before what it reads goes
};

} // namespace kareport
