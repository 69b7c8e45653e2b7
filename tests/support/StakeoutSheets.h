#pragma once

#include <QByteArray>
#include <QString>

class UReportDoc;
class UReportView;

// The stakeout list of the examples, whose pages have 72 lines of 106 characters, on sheets of paper.

constexpr int pagesOfStakeout = 8; ///< as the golden file has them

/// Each sheet of a PDF begins with the header of its page of the list, which is nowhere else.
void expectStakeoutPages(const QByteArray &pdf, const char *reason);
/// The same of what was printed into a file.
void expectStakeoutSheets(const QString &path, const char *reason);
/// Prints a report that is the list on several papers, upright and lying, shows their previews, and expects each page on its
/// sheet. The report's margins are then others.
void expectStakeoutPrinted(UReportDoc &report, UReportView &view);
