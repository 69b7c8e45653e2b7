#pragma once

#include "FieldFormatter.h"
#include "TextBuffer.h"
#include "UJobSettings.h"
#include "UPointNumber.h"

#include <QString>

/// A field and all that its formatting depends on, to be changed by a test.
struct FormattedField
{
    sXmlReportField field;
    UJobSettings settings;
    kareport::FormatOptions options;
    QString suffix;

    FormattedField(int type, int width, int decimals = 0, const char *align = "R");

    /// The text of what a pointer of a kind points to.
    QString of(int kind, const void *value) const;

    QString of(double value) const { return of(8, &value); }
    QString of(qint32 value) const { return of(4, &value); }
    QString of(qint16 value) const { return of(2, &value); }
    QString of(bool value) const { return of(1, &value); }
    QString of(const QString &value) const { return of(16, &value); }
    QString of(const UPointNumber &value) const { return of(32, &value); }
};
