#include "ShownRows.h"

#include "VariableType.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

namespace
{

using namespace kareport;

/// Rows with a text under 1, a number under 2 and another text under 3.
class SomeRows : public RowList
{
public:
    struct Row
    {
        const char *text;
        double number;
        const char *other;
    };
    explicit SomeRows(const std::vector<Row> &rows)
    {
        for (const Row &row : rows) {
            UDataObject &object = Add();
            object.Set(1, QString::fromLatin1(row.text));
            object.Set(2, row.number);
            object.Set(3, QString::fromLatin1(row.other));
        }
    }
    std::optional<InputError> error() const override { return std::nullopt; }
    std::optional<SourceColumns> columns() const override
    {
        SourceColumns columns;
        columns.variables.append(QStringLiteral("text"));
        return columns;
    }
};

RowShape groupedShape()
{
    RowShape shape;
    GroupLevel outer;
    outer.ids = {1};
    GroupLevel inner;
    inner.ids = {3};
    shape.groups.levels = {outer, inner};
    return shape;
}

/// The level that each row begins a new group of.
std::vector<std::size_t> levelsOf(const std::vector<SomeRows::Row> &rows)
{
    ShownRows shown(std::make_unique<SomeRows>(rows), groupedShape());
    std::vector<std::size_t> levels;
    for (std::size_t i = 0; shown.GetAt(i) != nullptr; ++i) {
        levels.push_back(shown.firstNewLevel());
    }
    return levels;
}

TEST(ShownRows, FindTheirGroups)
{
    using Levels = std::vector<std::size_t>;
    EXPECT_EQ(levelsOf({{"a", 1, "x"}, {"a", 1, "x"}, {"a", 1, "y"}, {"b", 1, "y"}, {"B", 1, "Y"}, {"c", 1, "y"}}),
              (Levels{0, 2, 1, 0, 2, 0}))
        << "texts that the sort does not tell apart are one group";
    EXPECT_EQ(levelsOf({}), Levels());
}

TEST(ShownRows, ARowThatIsLeftOutBeginsNoGroup)
{
    RowShape shape = groupedShape();
    RowCondition condition;
    condition.id = 2;
    condition.kind = RowCondition::Kind::Above;
    condition.limit = 0;
    shape.conditions.push_back(condition);
    ShownRows shown(std::make_unique<SomeRows>(std::vector<SomeRows::Row>{
                        {"a", -1, "x"}, {"a", 1, "x"}, {"b", -1, "x"}, {"a", 2, "x"}, {"b", -5, "x"}}),
                    std::move(shape));
    ASSERT_NE(shown.GetAt(0), nullptr);
    EXPECT_EQ(shown.firstNewLevel(), 0U) << "the first row that is shown begins the first group";
    ASSERT_NE(shown.GetAt(1), nullptr);
    EXPECT_EQ(shown.firstNewLevel(), 2U) << "what is not shown parts no group";
    EXPECT_EQ(shown.GetAt(2), nullptr);
}

TEST(ShownRows, AreTheSameWhenTheyAreReadAgain)
{
    RowShape shape;
    shape.running.emplace_back(RunningValue::Kind::Sum, 2, CellReader(), RunningValue::Target{9, VARIABLE_DOUBLE},
                               false);
    shape.variables.append(QStringLiteral("sum"));
    ShownRows shown(
        std::make_unique<SomeRows>(std::vector<SomeRows::Row>{{"b", 0.1, "x"}, {"a", 0.2, "x"}, {"c", 0.4, "x"}}),
        std::move(shape));
    const auto sumAt = [&](std::size_t index) { return std::get<double>(shown.GetAt(index)->Find(9)->value()); };
    EXPECT_EQ(sumAt(0), 0.1);
    EXPECT_EQ(sumAt(0), 0.1) << "a row that is asked for again is added once";
    EXPECT_EQ(sumAt(2), 0.7);
    EXPECT_EQ(sumAt(1), 0.3) << "going back begins again";
    shown.Sort({1});
    EXPECT_EQ(sumAt(0), 0.2) << "and so does sorting";
    EXPECT_EQ(shown.columns()->variables.join(u','), QStringLiteral("text,sum")) << "what is computed is filled";
}

} // namespace
