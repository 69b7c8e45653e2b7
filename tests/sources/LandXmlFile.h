#pragma once

#include "JobFolder.h"
#include "LandXmlList.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <functional>
#include <memory>

namespace landxml
{

/// A file of metres, degrees and grads around some elements.
QByteArray fileOf(const QByteArray &elements, const QByteArray &version = "1.2");

/// A list that reads a file of its own. Its dictionary has the variables that are named, with the types that suit them; of
/// an empty list of names, all.
class LandXmlFile
{
public:
    LandXmlFile(const QByteArray &content, kareport::LandXmlQuery query, const QStringList &variables = {},
                kareport::ReadProgress progress = {});

    QString path() const { return folder_.path("road.xml"); }
    /// The values of a row in the order of the variables, "-" for a missing one; "null" for no row. Numbers have a fixed
    /// number of decimals.
    QString row(std::size_t index, int decimals = 4);
    /// All rows.
    QStringList rows(int decimals = 4);
    double number(std::size_t index, const char *variable);
    /// The identifier of a variable.
    unsigned id(const char *variable) const;
    QStringList notes() const;

private:
    JobFolder folder_;
    QStringList variables_;

public:
    std::unique_ptr<kareport::LandXmlList> list;
};

/// A query of a kind.
kareport::LandXmlQuery queryOf(kareport::LandXmlListKind kind, const char *name = "");

} // namespace landxml
