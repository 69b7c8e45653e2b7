#include "LandXmlNames.h"

#include "Xlate.h"

namespace kareport
{

bool LandXmlNames::matches(const std::string &name)
{
    if (wanted_.isEmpty()) {
        return true;
    }
    const QString text = QString::fromStdString(name);
    if (text == wanted_) {
        isFound_ = true;
        return true;
    }
    if (others_.size() <= most && !text.isEmpty() && !others_.contains(text)) {
        others_.append(text);
    }
    return false;
}

std::optional<InputError> LandXmlNames::error(const QString &path) const
{
    if (wanted_.isEmpty() || isFound_) {
        return std::nullopt;
    }
    if (others_.isEmpty()) {
        return InputError{path, std::nullopt,
                          Xlate("\"%1\" is not in the file, which has no names for it").arg(wanted_)};
    }
    QString names = others_.first(std::min(most, others_.size())).join(QStringLiteral(", "));
    if (others_.size() > most) {
        names += QStringLiteral(", …");
    }
    return InputError{path, std::nullopt,
                      Xlate("\"%1\" is not in the file: one of %2 was expected").arg(wanted_, names)};
}

} // namespace kareport
