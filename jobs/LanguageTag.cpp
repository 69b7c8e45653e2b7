#include "LanguageTag.h"

#include <QRegularExpression>

namespace kareport
{

bool isLanguageTag(const QString &text)
{
    static const QRegularExpression tag(QStringLiteral("^[A-Za-z]{1,8}(-[A-Za-z0-9]{1,8})*\\z"));
    return tag.match(text).hasMatch();
}

} // namespace kareport
