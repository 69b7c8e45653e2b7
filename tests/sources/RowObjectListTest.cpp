#include "RowObjectList.h"

#include "InputErrorText.h"
#include "TemporaryFolder.h"
#include "VariableType.h"

#include <gtest/gtest.h>

#include <atomic>
#include <limits>
#include <thread>

namespace
{

using kareport::InputError;
using kareport::RowObjectList;
using kareport::RowReader;

constexpr unsigned keyId = 1;
constexpr unsigned textId = 2;
constexpr unsigned wholeId = 3;
constexpr unsigned flagId = 4;
constexpr unsigned pointId = 5;

/// Rows that can be read in order only, as those of a database.
class StreamedRows : public RowReader
{
public:
    explicit StreamedRows(std::size_t count) : count_(count)
    {
        columns_ = {{QStringLiteral("key"), {}, false},
                    {QStringLiteral("text"), {}, false},
                    {QStringLiteral("whole"), {}, false},
                    {QStringLiteral("flag"), {}, false},
                    {QStringLiteral("point"), {}, false}};
        const kareport::FindVariable find = [](const QString &name) -> std::optional<kareport::ValueParser> {
            const std::pair<const char16_t *, std::pair<int, unsigned>> all[] = {
                {u"key", {VARIABLE_DOUBLE, keyId}},
                {u"text", {VARIABLE_TEXT, textId}},
                {u"whole", {VARIABLE_INTEGER, wholeId}},
                {u"flag", {VARIABLE_BOOLEAN, flagId}},
                {u"point", {VARIABLE_NUMBER, pointId}}};
            for (const auto &one : all) {
                if (name == QStringView(one.first)) {
                    return kareport::ValueParser(one.second.first, one.second.second, {});
                }
            }
            return std::nullopt;
        };
        EXPECT_FALSE(binding_.bind(columns_, {}, {find, {}}));
    }

    bool next(UDataObject &object, const std::vector<unsigned> * /*onlyIds*/) override
    {
        while (isWaiting && !isStopped) {
            std::this_thread::sleep_for(std::chrono::milliseconds(5));
        }
        if (isStopped || row_ == count_) {
            return false;
        }
        if (row_ == wrongRow) {
            error_ = InputError{QStringLiteral("rows"), std::nullopt, QStringLiteral("row %1 is wrong").arg(row_)};
            return false;
        }
        ++reads;
        object.Clear();
        object.Set(keyId, static_cast<double>(row_ * 7919 % count_));
        if (row_ % 2 == 0) { // the others have no values beside their key
            object.Set(textId, QStringLiteral("text € %1").arg(row_));
            object.Set(wholeId, static_cast<qint32>(row_));
            object.Set(flagId, row_ % 4 == 0);
            object.Set(pointId, UPointNumber(QStringLiteral("P%1").arg(row_)));
        }
        ++row_;
        return true;
    }
    void rewind() override
    {
        row_ = 0;
        ++rewinds;
        error_.reset();
    }
    QString name() const override { return QStringLiteral("stream"); }
    std::size_t position() const override { return row_; }
    std::size_t rowBytes() const override { return 20; }
    bool mayWait() const override { return true; }
    void stop() override { isStopped = true; }

    std::size_t wrongRow = std::numeric_limits<std::size_t>::max();
    std::atomic<std::size_t> reads = 0;
    int rewinds = 0;
    std::atomic<bool> isWaiting = false;
    std::atomic<bool> isStopped = false;

private:
    std::size_t count_;
    std::size_t row_ = 0;
};

struct List
{
    explicit List(std::size_t count, kareport::ReadProgress progress = {})
        : rows(new StreamedRows(count)), list(std::unique_ptr<RowReader>(rows), std::move(progress))
    {}

    StreamedRows *rows;
    RowObjectList list;
};

QString textOf(const UDataObject *object)
{
    if (object == nullptr) {
        return QStringLiteral("null");
    }
    QString text = QString::number(*static_cast<const double *>(object->Find(keyId)->GetData()));
    if (object->Find(textId) != nullptr) {
        text += u'|' + *static_cast<const QString *>(object->Find(textId)->GetData()) + u'|' +
                QString::number(*static_cast<const qint32 *>(object->Find(wholeId)->GetData())) + u'|' +
                (*static_cast<const bool *>(object->Find(flagId)->GetData()) ? u'y' : u'n') + u'|' +
                static_cast<const UPointNumber *>(object->Find(pointId)->GetData())->Convert();
    }
    return text;
}

/// The row of a key, whose index is the one that the key was made of.
QString rowOf(std::size_t key, std::size_t count)
{
    std::size_t row = 0;
    while (row * 7919 % count != key) {
        ++row;
    }
    return row % 2 != 0
               ? QString::number(key)
               : QStringLiteral("%1|text € %2|%2|%3|P%2").arg(key).arg(row).arg(QChar(row % 4 == 0 ? u'y' : u'n'));
}

TEST(RowObjectList, SortsRowsThatCannotBeReadTwice)
{
    // Few rows stay in memory; more than a megabyte of them go to a file.
    for (const std::size_t count : {std::size_t(0), std::size_t(1), std::size_t(5), std::size_t(40000)}) {
        List all(count);
        all.list.Sort({keyId});
        for (std::size_t key = 0; key<count; key += count> 100 ? 997 : 1) {
            ASSERT_EQ(textOf(all.list.GetAt(key)), rowOf(key, count)) << count;
        }
        EXPECT_EQ(all.list.GetAt(count), nullptr) << count;
        EXPECT_FALSE(all.list.error()) << count;
        EXPECT_EQ(textOf(all.list.GetAt(0)), count > 0 ? rowOf(0, count) : QStringLiteral("null")) << "going back";
        EXPECT_EQ(all.rows->reads, count) << "each row is read once";
    }
}

TEST(RowObjectList, SortingAgainKeepsTheOrderOfEqualRows)
{
    List all(6);
    all.list.Sort({keyId});
    all.list.Sort({flagId});
    QStringList keys;
    for (std::size_t i = 0; i < 6; ++i) {
        keys.append(QString::number(*static_cast<const double *>(all.list.GetAt(i)->Find(keyId)->GetData())));
    }
    // Rows 0 to 5 have the keys 0 5 4 3 2 1; every second one has no flag, which comes first.
    EXPECT_EQ(keys.join(u' ').toStdString(), "1 3 5 4 0 2");
    EXPECT_EQ(all.rows->reads, 6U);
}

TEST(RowObjectList, AWrongRowIsSaidAfterSorting)
{
    List all(5000);
    all.rows->wrongRow = 4000;
    all.list.Sort({keyId});
    EXPECT_EQ(all.list.GetAt(0), nullptr);
    EXPECT_EQ(textOfError(all.list.error()).toStdString(), "row 4000 is wrong");
    EXPECT_EQ(all.list.GetAt(0), nullptr) << "it stays";
    EXPECT_EQ(textOfError(all.list.error()).toStdString(), "row 4000 is wrong");
}

TEST(RowObjectList, ARowThatIsLongInComingCanBeStopped)
{
    for (const bool isSorted : {false, true}) {
        std::atomic<int> calls = 0;
        List all(100, [&calls](std::size_t) { return ++calls < 3; });
        all.rows->isWaiting = true;
        if (isSorted) {
            all.list.Sort({keyId});
        }
        EXPECT_EQ(all.list.GetAt(0), nullptr) << isSorted;
        EXPECT_EQ(calls, 3) << isSorted << ": it is asked while nothing comes";
        EXPECT_TRUE(all.rows->isStopped) << isSorted;
        EXPECT_FALSE(all.list.error()) << isSorted << ": to be stopped is not a mistake of the data";
    }
}

TEST(RowObjectList, SortingWhatWasReadCanBeStopped)
{
    constexpr std::size_t count = 20'000;
    const auto sort = [](int most, int &calls) {
        StreamedRows *rows = nullptr;
        List all(count, [&](std::size_t) {
            calls += rows != nullptr && rows->reads >= count ? 1 : 0;
            return calls <= most;
        });
        rows = all.rows;
        all.list.Sort({keyId});
        const int asked = calls;
        EXPECT_EQ(all.list.GetAt(0) == nullptr, most < asked) << most;
        EXPECT_FALSE(all.list.error()) << most;
        return asked;
    };
    int all = 0;
    const int asked = sort(1'000'000, all);
    constexpr int least = 12; // it is asked besides while the last rows are waited for
    EXPECT_GE(asked, least) << "while the sort keys are made, and while they are compared";
    for (int most = 1; most < least; ++most) {
        int calls = 0;
        EXPECT_EQ(sort(most, calls), most + 1) << "it is not asked again";
    }
}

TEST(RowObjectList, ReadsAheadWhereRowsAreLongInComing)
{
    List all(10000);
    for (std::size_t i = 0; i < 10000; ++i) {
        ASSERT_NE(all.list.GetAt(i), nullptr) << i;
    }
    EXPECT_EQ(all.list.GetAt(10000), nullptr);
    EXPECT_NE(all.list.GetAt(0), nullptr) << "going back";
    EXPECT_EQ(all.rows->rewinds, 2);
}

TEST(RowObjectList, WhatCannotBeKeptIsSaid)
{
    const TemporaryFolder folder;
    TemporaryFolder::set(QStringLiteral("/proc"));
    List all(40000);
    all.list.Sort({keyId});
    EXPECT_EQ(all.list.GetAt(0), nullptr);
    EXPECT_TRUE(
        textOfError(all.list.error()).startsWith(QStringLiteral("the data cannot be kept in a temporary file: ")))
        << textOfError(all.list.error()).toStdString();
}

} // namespace
