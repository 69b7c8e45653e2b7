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

    void put(const char *name, const QByteArray &content) const
    {
        QFile file(path(name));
        ASSERT_TRUE(file.open(QIODevice::WriteOnly)) << name;
        ASSERT_EQ(file.write(content), content.size()) << name;
    }
    QByteArray bytesOf(const char *name) const
    {
        QFile file(path(name));
        EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << name;
        return file.readAll();
    }

private:
    QTemporaryDir folder_;
};

/// A text in which "@" marks a place.
struct MarkedText
{
    QByteArray text; ///< without the mark
    QString place;   ///< of what stood behind the mark, as "line:column"

    explicit MarkedText(const QByteArray &marked)
    {
        const qsizetype mark = marked.indexOf('@');
        EXPECT_GE(mark, 0) << marked.constData();
        const QString before = QString::fromUtf8(marked.first(mark));
        const qsizetype lineStart = before.lastIndexOf(u'\n') + 1;
        place = QStringLiteral("%1:%2").arg(before.count(u'\n') + 1).arg(before.sliced(lineStart).toUcs4().size() + 1);
        text = marked.first(mark) + marked.sliced(mark + 1);
    }
};
