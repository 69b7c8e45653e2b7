#pragma once

#include "Folders.h"

#include <QByteArray>
#include <QDir>
#include <QFile>
#include <QString>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <initializer_list>
#include <vector>

/// Writes the markup of template files.
namespace markup
{

QByteArray element(const char *name, const QByteArray &content);

QByteArray joined(const std::vector<QByteArray> &parts);

QByteArray field(const char *variable, const char *label, const char *format, const char *align = "LEFT");

/// A table or, with the element name "Block", a block.
QByteArray output(const char *kind, const char *name, const char *dictionary, const std::vector<QByteArray> &fields,
                  std::initializer_list<const char *> sortKeys = {});

QByteArray variable(int id, const char *name, const char *type);

/// A survey dictionary: the identifiers of the data that the tests write.
QByteArray surveyDictionary();

/// A template "T" of the title "Title" with the survey dictionary.
QByteArray surveyTemplate(const QByteArray &tables, const QByteArray &blocks, const QByteArray &options);

QByteArray separatorOption(const char *separator);

} // namespace markup

/// Template files in a library folder and a start folder of their own.
class TemplateFolders
{
public:
    TemplateFolders();

    QString libraryPath() const { return library_.path(); }
    QString startPath() const { return start_.path(); }
    void putIntoLibrary(const QByteArray &content, const char *name = "t.xml") const { put(library_, name, content); }
    void putIntoStart(const QByteArray &content, const char *name = "t.xml") const { put(start_, name, content); }

private:
    static void put(const QTemporaryDir &folder, const char *name, const QByteArray &content);

    QTemporaryDir library_;
    QTemporaryDir start_;
};
