#pragma once

#include "ReportPages.h"
#include "ViewFixture.h"

#include <QStringList>

#include <algorithm>
#include <vector>

/// Numbers and pages, for the reader of a failure.
QString joined(const std::vector<qint64> &numbers);

QString shown(const std::vector<kareport::ReportPage> &pages);

/// A text for the reader of a failure, without the greater part of a long one.
QString brief(const QString &text);

/// What a view shows of a text.
QString asShown(QString text);

/// What is wrong with the text that a view shows; empty when nothing is. A view that still loads shows the beginning.
QString wrongWithText(const UReportView &view, const QString &text);

/// What is wrong with the pages that a view which has loaded tells of. Of a long report not every page is looked at.
QString wrongWithPages(UReportView &view, const QString &text, const std::vector<kareport::ReportPage> &pages);
