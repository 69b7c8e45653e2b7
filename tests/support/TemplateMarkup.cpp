#include "TemplateMarkup.h"

namespace markup
{

QByteArray element(const char *name, const QByteArray &content)
{
    return QByteArray("<") + name + '>' + content + "</" + name + '>';
}

QByteArray joined(const std::vector<QByteArray> &parts)
{
    QByteArray all;
    for (const QByteArray &part : parts) {
        all += part;
    }
    return all;
}

QByteArray field(const char *variable, const char *label, const char *format, const char *align)
{
    return element("Field", element("VariableName", variable) + element("Label", label) + element("Format", format) +
                                element("Align", align));
}

QByteArray output(const char *kind, const char *name, const char *dictionary, const std::vector<QByteArray> &fields,
                  std::initializer_list<const char *> sortKeys)
{
    QByteArray sort;
    for (const char *key : sortKeys) {
        sort += element("VariableName", key);
    }
    return element(kind, element("Name", name) + element("Use", dictionary) + element("Sort", sort) +
                             element("OutputList", joined(fields)));
}

QByteArray variable(int id, const char *name, const char *type)
{
    return element("Variable",
                   element("ID", QByteArray::number(id)) + element("VariableName", name) + element("Type", type));
}

QByteArray surveyDictionary()
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

QByteArray surveyTemplate(const QByteArray &tables, const QByteArray &blocks, const QByteArray &options)
{
    return element("ReportTemplate", element("Name", "T") + element("Title", "Title") + element("Tables", tables) +
                                         element("Dictionaries", surveyDictionary()) + element("Blocks", blocks) +
                                         element("Options", options));
}

QByteArray separatorOption(const char *separator)
{
    return element("Separator", separator);
}

} // namespace markup

TemplateFolders::TemplateFolders()
{
    kareport::setLibraryDir(library_.path());
    kareport::setStartPathName(start_.path());
}

void TemplateFolders::put(const QTemporaryDir &folder, const char *name, const QByteArray &content)
{
    QFile file(folder.filePath(QString::fromUtf8(name)));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write(content);
}
