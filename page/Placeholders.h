#pragma once

#include "UJobSettings.h"

#include <QDateTime>
#include <QString>
#include <QStringList>
#include <QStringView>

#include <optional>

namespace kareport
{

/// The values of placeholders such as {lengthUnit} in the texts of a report. "{{" gives one "{".
class Placeholders
{
public:
    /// @param settings     whose units are named
    /// @param application  the name of the application
    /// @param time         the date and the time of the report
    /// @param title        the title of the report; nothing for that of its template
    Placeholders(const UJobSettings &settings, const QString &application, const QDateTime &time,
                 const std::optional<QString> &title);

    /// The names of all placeholders.
    static QStringList names();
    /// What is wrong with the placeholders of a text, as a sentence that says what was expected; nothing when all are known.
    static std::optional<QString> wrongIn(QStringView text);

    /// A text with the values of its placeholders; {page} becomes one `pageMark`. What is wrong stays as it is.
    /// @param templateTitle  the title of the report's template
    QString textOf(QStringView text, const QString &templateTitle) const;
    /// The same for the label of a field, where {page} becomes three page marks: the width of a column counts as many
    /// characters for it as page headers have.
    QString labelOf(QStringView label, const QString &templateTitle) const;

private:
    QString withValues(QStringView text, const QString &templateTitle, qsizetype pageMarks) const;
    std::optional<QString> valueOf(QStringView name, const QString &templateTitle, qsizetype pageMarks) const;

    QString lengthUnit_;
    QString areaUnit_;
    QString angleUnit_;
    QString application_;
    QString date_;
    QString time_;
    std::optional<QString> title_;
};

} // namespace kareport
