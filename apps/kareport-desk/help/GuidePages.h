#pragma once

#include <QList>
#include <QString>

class QTextDocument;
class QWidget;

namespace kareport
{

/// A page of the guides that are part of the program.
struct GuidePage
{
    QString name; ///< of its file
    QString title;
};

/// The pages that a reader chooses from, in order.
QList<GuidePage> guidePages();

/// The file of a page in a language, or in English where the guides are not translated into it; empty where there is no such
/// page. @param language  such as "de"
QString guideFile(const QString &page, const QString &language);

/// What a heading is called in links: "Saved reports" by "saved-reports".
QString anchorOf(const QString &heading);
/// Gives the headings of a document the names that links have for them.
void nameHeadings(QTextDocument &document);

/// The place of the guides that fits what the user looks at, as a page with or without a heading: "guide-desk.md#printing".
/// @param widget  that has the keyboard; null for none
QString guidePlaceFor(const QWidget *widget);

} // namespace kareport
