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

inline QByteArray element(const char *name, const QByteArray &content)
{
    return QByteArray("<") + name + '>' + content + "</" + name + '>';
}

inline QByteArray joined(const std::vector<QByteArray> &parts)
{
    QByteArray all;
    for (const QByteArray &part : parts) {
        all += part;
    }
    return all;
}

inline QByteArray field(const char *variable, const char *label, const char *format, const char *align = "LEFT")
{
    return element("Field", element("VariableName", variable) + element("Label", label) + element("Format", format) +
                                element("Align", align));
}

/// A table or, with the element name "Block", a block.
inline QByteArray output(const char *kind, const char *name, const char *dictionary,
                         const std::vector<QByteArray> &fields, std::initializer_list<const char *> sortKeys = {})
{
    QByteArray sort;
    for (const char *key : sortKeys) {
        sort += element("VariableName", key);
    }
    return element(kind, element("Name", name) + element("Use", dictionary) + element("Sort", sort) +
                             element("OutputList", joined(fields)));
}

inline QByteArray variable(int id, const char *name, const char *type)
{
    return element("Variable",
                   element("ID", QByteArray::number(id)) + element("VariableName", name) + element("Type", type));
}

/// A survey dictionary: the identifiers of the data that the tests write.
inline QByteArray surveyDictionary()
{
    return element(
        "Dictionary",
        element("DictionaryName", "Survey") +
            element("VariableList", joined({variable(1, "Number", "NUMBER"), variable(2, "Northing", "COORDINATE"),
                                            variable(3, "Easting", "COORDINATE"), variable(4, "Offset", "OFFSET"),
                                            variable(5, "Second", "OFFSET"), variable(6, "Note", "TEXT"),
                                            variable(7, "Chainage", "STATION"), variable(8, "Count", "INTEGER"),
                                            variable(9, "Done", "BOOLEAN"), variable(10, "Mark", "FLAG")})));
}

/// A template "T" of the title "Title" with the survey dictionary.
inline QByteArray surveyTemplate(const QByteArray &tables, const QByteArray &blocks, const QByteArray &options)
{
    return element("ReportTemplate", element("Name", "T") + element("Title", "Title") + element("Tables", tables) +
                                         element("Dictionaries", surveyDictionary()) + element("Blocks", blocks) +
                                         element("Options", options));
}

inline QByteArray separatorOption(const char *separator)
{
    return element("Separator", separator);
}

} // namespace markup

/// Template files in a library folder and a start folder of their own.
class TemplateFolders
{
public:
    TemplateFolders()
    {
        kareport::setLibraryDir(library_.path());
        kareport::setStartPathName(start_.path());
    }

    QString libraryPath() const { return library_.path(); }
    QString startPath() const { return start_.path(); }
    void putIntoLibrary(const QByteArray &content, const char *name = "t.xml") const { put(library_, name, content); }
    void putIntoStart(const QByteArray &content, const char *name = "t.xml") const { put(start_, name, content); }

private:
    static void put(const QTemporaryDir &folder, const char *name, const QByteArray &content)
    {
        QFile file(folder.filePath(QString::fromUtf8(name)));
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(content);
    }

    QTemporaryDir library_;
    QTemporaryDir start_;
};
