#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

#include <functional>

namespace kareport
{

/// Asks which name was meant by one that is not known, once for each name of each list: comparing one with all takes long, and
/// the steps of a job ask for the same ones again and again.
class NameQuestions
{
public:
    /// @param list   what tells the list of names apart from others; the names of one list stay the same
    /// @param known  gives the names of the list
    /// @return a question such as `did you mean "Elevation"?`, or an empty text
    QString ask(const QString &list, const QString &name, const std::function<QStringList()> &known);

private:
    QHash<QString, QString> asked_;
};

/// A sentence with a question after it; without one, where that is empty.
QString joinedQuestion(const QString &sentence, const QString &question);

} // namespace kareport
