#pragma once

#include <QString>

class QMainWindow;
class UDocument;

namespace kareport
{

/// What a report is called: its title, which is the name of its file where it has one.
QString nameOf(const UDocument &document);

/// Shows in the titles of all panes, and so on their tabs, which reports have changes that are not saved, and in the title of
/// the main window which report is in front. @param inFront  null for none
void showTitles(QMainWindow &frame, const UDocument *inFront);

} // namespace kareport
