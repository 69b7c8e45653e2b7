#pragma once

#include "DataPreview.h"

#include <QJsonObject>
#include <QString>
#include <QStringList>

#include <map>

namespace kareport
{

/// Keys of a job's data that name its columns.
inline const QString columnsKey = QStringLiteral("columns");
inline const QString orderKey = QStringLiteral("order");

/// Which variables the user has chosen for columns, in addition to what the names of the columns, or their order, say.
class ColumnMapping
{
public:
    /// Forgets what was chosen.
    void clear() { chosen_.clear(); }
    /// Chooses a variable for a column. Of several columns with one variable, the one that it was chosen for last has it: who
    /// goes through a list with the keys takes nothing from the others. @param variable  empty for none
    void choose(int column, const QString &variable);
    bool isEmpty() const { return chosen_.empty(); }

    /// The variables of the columns, empty for none. @param own  the preview of the columns without what was chosen
    QStringList variables(const DataPreview &own) const;
    /// The keys `columns`, and without an order `order`, of a data set that say this.
    /// @param options  the other keys
    /// @param takesList  whether `columns` may be a list of all columns. Without, a column that has the name of a variable is
    ///                   read for it unless another column is chosen
    QJsonObject put(QJsonObject options, const DataPreview &own, bool takesList = true) const;
    /// Takes what such keys say. What is not a column is left out.
    void take(const QJsonObject &options, const DataPreview &own);

private:
    struct Choice
    {
        QString variable;
        int number; ///< in the order of the choices
    };

    bool isOvertaken(int column, const Choice &choice) const;

    std::map<int, Choice> chosen_;
    int choices_ = 0;
};

} // namespace kareport
