#pragma once

#include <QSize>
#include <QString>

#include <ostream>

// Failure messages show the texts that differ.

inline void PrintTo(const QString &text, std::ostream *out)
{
    *out << '"' << text.toStdString() << '"';
}

inline void PrintTo(QStringView text, std::ostream *out)
{
    PrintTo(text.toString(), out);
}

inline void PrintTo(const QSize &size, std::ostream *out)
{
    *out << size.width() << " x " << size.height();
}
