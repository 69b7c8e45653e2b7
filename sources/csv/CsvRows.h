#pragma once

#include "CsvDialect.h"
#include "CsvReader.h"
#include "RowReader.h"

#include <memory>

namespace kareport
{

/// The rows of a text file of rows and cells.
class CsvRows : public RowReader
{
public:
    /// Reads what comes before the rows.
    CsvRows(std::shared_ptr<const FileBytes> file, const CsvDialect &dialect, const Variables &variables);
    /// Fails where the header row would be skipped although it is data: the first point would be lost.
    void checkHeader();

    bool next(UDataObject &object, const std::vector<unsigned> *onlyIds) override;
    void rewind() override;
    std::size_t position() const override { return reader_.position(); }
    std::size_t rowBytes() const override { return reader_.position() - reader_.rowStart(); }
    std::optional<InputError> lostBytes() const override { return file_->lostBytes(); }
    QString name() const override { return file_->path(); }
    bool canSeek() const override { return true; }
    RowPlace place() const override { return {reader_.rowStart(), reader_.rowLine()}; }
    void seek(const RowPlace &place) override;
    std::optional<TextPlace> placeOfNext(const QString &variable) override;

private:
    bool readColumns(const CsvDialect &dialect);
    bool bindColumns(const CsvDialect &dialect, const Variables &variables);
    void lookAtHeader(const CsvDialect &dialect);
    void failWithoutVariable();
    bool failWithCells();
    bool failInCell(const BoundField &field);

    std::shared_ptr<const FileBytes> file_;
    CsvReader reader_;
    bool isNamed_;                           ///< the header row names the columns
    std::optional<InputError> headerIsData_; ///< says that the header row has values instead of names
    std::size_t width_ = 0;                  ///< cells of every row
    RowPlace firstRow_;
    std::size_t released_ = 0; ///< up to where memory was given back
};

/// The layout of a dialect whose delimiter is known.
CsvReader::Layout layoutOf(const CsvDialect &dialect);

} // namespace kareport
