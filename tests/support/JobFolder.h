#pragma once

#include "PrintQt.h"

#include <QByteArray>
#include <QDir>
#include <QFile>
#include <QString>
#include <QTemporaryDir>

#include <gtest/gtest.h>

/// A folder for the files of one test.
class JobFolder
{
public:
    QString path() const { return folder_.path(); }
    QString path(const char *name) const { return folder_.filePath(QString::fromUtf8(name)); }
    /// The names of the files in it.
    QStringList names() const { return QDir(folder_.path()).entryList(QDir::Files | QDir::Hidden, QDir::Name); }

    void put(const char *name, const QByteArray &content) const;
    QByteArray bytesOf(const char *name) const;

private:
    QTemporaryDir folder_;
};

/// A text in which "@" marks a place.
struct MarkedText
{
    QByteArray text; ///< without the mark
    QString place;   ///< of what followed the mark, as "line:column"

    explicit MarkedText(const QByteArray &marked);
};
