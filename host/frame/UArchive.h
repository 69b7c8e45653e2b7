#pragma once

#include "KaReportExport.h"

#include <QByteArrayView>
#include <QIODevice>
#include <QString>

/// A file that a document is stored to or loaded from.
class KAREPORT_EXPORT UArchive
{
public:
    /// What is done with the file.
    enum class Mode
    {
        Storing,
        Loading
    };

    /// The device must be open for the mode and live as long as the archive.
    UArchive(QIODevice &device, Mode mode, QString path);

    /// Whether the document is stored.
    bool IsStoring() const { return mode_ == Mode::Storing; }
    /// Whether the document is loaded.
    bool IsLoading() const { return mode_ == Mode::Loading; }
    /// The file's full path.
    const QString &GetFilePath() const { return path_; }
    /// The file's length in bytes.
    qint64 GetLength() const { return device_.size(); }

    /// Writes bytes. A failed write is remembered: `IsGood` answers false from then on.
    void Write(QByteArrayView bytes);
    /// Whether nothing has failed so far.
    bool IsGood() const { return good_; }
    /// Abandons storing or loading: `IsGood` answers false from then on.
    void Abandon() { good_ = false; }

private:
    QIODevice &device_;
    Mode mode_;
    QString path_;
    bool good_ = true;
};
