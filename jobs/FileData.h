#pragma once

#include "DataKind.h"
#include "FileBytes.h"

#include <QString>

#include <memory>

namespace kareport
{

/// A data set whose rows are in one file, or come from standard input.
class FileData : public DataSource
{
public:
    /// @param key   of the data set's kind, whose value names the file
    /// @param file  with its complete name; "-" is standard input
    FileData(QString key, QString file) : key_(std::move(key)), file_(std::move(file)) {}

    Expected<std::unique_ptr<RowList>> open(const DataRequest &request) const final;

    QStringList files() const override { return readsStandardInput() ? QStringList() : QStringList(file_); }
    bool isAllInFiles() const override { return !readsStandardInput(); }
    bool readsStandardInput() const override { return file_ == u"-"; }

protected:
    const QString &file() const { return file_; }

    /// Makes the rows of the file, which has been opened.
    virtual Expected<std::unique_ptr<RowList>> rowsOf(const std::shared_ptr<const FileBytes> &bytes,
                                                      const DataRequest &request,
                                                      const ReadProgress &progress) const = 0;

private:
    QString key_;
    QString file_;
};

} // namespace kareport
