#pragma once

#include "FileBytes.h"
#include "JsonKeys.h"
#include "JsonRowParser.h"
#include "RowReader.h"

#include <functional>
#include <memory>
#include <string_view>
#include <vector>

namespace kareport
{

/// The rows of a JSON file.
class JsonFileRows : public RowReader, private JsonRowHandler
{
public:
    /// Longer objects are taken for something that is not a row.
    static constexpr std::size_t longestRow = std::size_t(1) << 20;

    JsonFileRows(std::shared_ptr<const FileBytes> file, const std::vector<ColumnChoice> &columns,
                 const Variables &variables);

    bool next(UDataObject &object, const std::vector<unsigned> *onlyIds) override;
    void rewind() override;
    std::size_t position() const override { return position_; }
    std::size_t rowBytes() const override { return position_ - row_.start; }
    std::optional<InputError> lostBytes() const override { return file_->lostBytes(); }
    QString name() const override { return file_->path(); }
    bool knowsColumns() const override { return isComplete_; }
    std::vector<unsigned> ids() const override { return keys_.ids(); }
    QStringList variables() const override { return keys_.variables(); }
    bool canSeek() const override { return true; }
    RowPlace place() const override { return row_; }
    void seek(const RowPlace &place) override;
    std::optional<TextPlace> placeOfNext(const QString &variable) override;

private:
    enum class Before
    {
        First,  ///< nothing was read yet
        Object, ///< an object must follow
        Rest    ///< what follows an object
    };

    bool findObject();
    bool skipBlanks();
    bool endList();
    bool endRows();
    bool storeAll(const std::function<bool(const ValueParser &)> &store);
    bool isWanted(unsigned id) const;
    bool fail(std::size_t at, const QString &text);
    std::size_t startOfValue() const;
    bool failInValue(const JsonKeys::Field &field);
    std::size_t start() const;
    std::size_t startOfKey(std::size_t end) const;
    TextPlace placeOf(std::size_t at);
    TextPlace findPlace(std::size_t at);
    std::optional<TextPlace> placeInLine(std::size_t at) const;
    void countOn(std::size_t end);

    bool onKey(std::string_view key, std::size_t end) override;
    bool onNull() override { return true; }
    bool onBoolean(bool value) override;
    bool onInteger(qint64 value) override;
    bool onUnsigned(quint64 value) override;
    bool onNumber(double value) override;
    bool onText(std::string_view text) override;
    bool onNested() override;
    void onMistake(const QString &text, std::size_t at) override;

    std::shared_ptr<const FileBytes> file_;
    std::string_view text_;
    JsonKeys keys_;

    std::size_t position_ = 0;
    qsizetype line_ = 1; ///< that `position_` is in
    Before before_ = Before::First;
    bool isList_ = false;
    bool isComplete_ = false; ///< the end of some objects was seen, and so every key
    RowPlace row_;
    /// A byte whose place is known.
    struct KnownPlace
    {
        std::size_t at;
        TextPlace place;
    };
    std::vector<KnownPlace> known_; ///< ascending, the start of the text first
    KnownPlace lastPlace_;          ///< that was asked for last
    std::size_t released_ = 0;      ///< up to where memory was given back
    std::size_t rowNumber_ = 0;     ///< counts every row that is read, also again

    // Of the row that is read.
    UDataObject *object_ = nullptr;
    const std::vector<unsigned> *onlyIds_ = nullptr;
    const std::vector<JsonKeys::Field> *fields_ = nullptr; ///< of the key
    std::size_t keyStart_ = 0;
    std::size_t valueStart_ = 0;             ///< after the key
    std::optional<std::size_t> sought_;      ///< the number of the variable whose value is looked for
    std::optional<std::size_t> soughtValue_; ///< where it is
};

} // namespace kareport
