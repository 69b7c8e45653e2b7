#pragma once

#include "KaReportExport.h"

#include <QLatin1StringView>
#include <QStringView>

namespace kareport
{

/// Takes the text of a report while it is written, in the order of the text.
class KAREPORT_EXPORT TextOutlet
{
public:
    TextOutlet() = default;
    virtual ~TextOutlet() = default;
    TextOutlet(const TextOutlet &) = delete;
    TextOutlet &operator=(const TextOutlet &) = delete;

    /// Takes what comes next in the text. @return false once something could not be taken; what comes then is ignored
    virtual bool write(QStringView text) = 0;
    /// The same for characters up to U+00FF.
    virtual bool write(QLatin1StringView text) = 0;
};

} // namespace kareport
