#pragma once

#include "GroupedList.h"
#include "RowConditions.h"
#include "RowFormulas.h"
#include "RowList.h"
#include "RunningValues.h"

#include <QStringList>

#include <memory>
#include <optional>
#include <vector>

namespace kareport
{

/// What becomes of the rows of a source before a table shows them.
struct RowShape
{
    std::vector<RowFormula> formulas;     ///< in the order that they are computed in
    std::vector<RowCondition> conditions; ///< rows that do not fulfil all of them are not shown
    std::vector<RunningValue> running;    ///< of the rows that are shown
    std::vector<RowFlag> flags;           ///< of the values that the row then has
    QStringList variables;                ///< those that rows are given, folded
    TableGroups groups;
};

/// The rows of a source as a table shows them: with what is computed of them, without those that are not wanted, in groups.
class ShownRows : public RowList, public GroupedList
{
public:
    ShownRows(std::unique_ptr<RowList> rows, RowShape shape);

    UDataObject *GetAt(std::size_t index) override;
    /// Orders the rows of the source: what is computed has no part in it.
    void Sort(const std::vector<unsigned> &ids) override;

    std::optional<InputError> error() const override { return rows_->error(); }
    std::optional<SourceColumns> columns() const override;
    /// Nothing for what is computed, nor where rows are left out: which row of the source it is, is not kept.
    ValuePlace placeOf(std::size_t index, const QString &variable) override;
    std::vector<InputError> notes() const override { return rows_->notes(); }
    std::vector<InputError> differences() const override { return rows_->differences(); }

    const TableGroups &groups() const override { return shape_.groups; }
    std::size_t firstNewLevel() const override { return firstNewLevel_; }
    void noteLeftOut(std::vector<LeftOut> variables) override { leftOut_ = std::move(variables); }
    /// The variables of running values, with what is in no sum of them.
    const std::vector<RunningValue> &running() const { return shape_.running; }
    /// The values that are in no total of the table that was written.
    const std::vector<LeftOut> &leftOut() const { return leftOut_; }

private:
    void restart();
    bool readNext();
    bool isShown(const UDataObject &object);
    void findNewLevel(const UDataObject &object);

    std::unique_ptr<RowList> rows_;
    RowShape shape_;
    UDataObject *current_ = nullptr;
    std::size_t shown_ = 0;         ///< rows that were shown so far
    std::size_t nextRow_ = 0;       ///< of the source
    std::vector<UDataObject> keys_; ///< what the groups of each level have in common, by the levels
    std::size_t firstNewLevel_ = 0;
    std::vector<LeftOut> leftOut_;
};

} // namespace kareport
