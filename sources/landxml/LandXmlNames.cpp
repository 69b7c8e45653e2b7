#include "LandXmlNames.h"

#include "NearestName.h"
#include "Xlate.h"

#include <algorithm>

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
    if (others_.size() < mostCompared && !text.isEmpty() && !known_.contains(text)) {
        known_.insert(text);
        others_.append(text);
    }
    return false;
}

QString LandXmlNames::missing() const
{
    switch (of_) {
    case Of::Group: return Xlate("the file has no group of points \"%1\"").arg(wanted_);
    case Of::Surface: return Xlate("the file has no surface \"%1\" for this list").arg(wanted_);
    case Of::Parcel: return Xlate("the file has no parcel \"%1\"").arg(wanted_);
    case Of::Alignment: return Xlate("the file has no alignment \"%1\"").arg(wanted_);
    case Of::GradeLine: break;
    }
    return Xlate("the file has no grade line \"%1\" in the alignments that are listed").arg(wanted_);
}

std::optional<InputError> LandXmlNames::error(const QString &path) const
{
    if (wanted_.isEmpty() || isFound_) {
        return std::nullopt;
    }
    if (others_.isEmpty()) {
        return InputError{path, std::nullopt,
                          missing() + QStringLiteral("; ") + Xlate("there are no names to choose from")};
    }
    QString names = others_.first(std::min(mostShown, others_.size())).join(QStringLiteral(", "));
    if (others_.size() > mostShown) {
        names += QStringLiteral(", …");
    }
    QString text = missing() + QStringLiteral(": ") + Xlate("one of %1 was expected").arg(names);
    if (const QString question = didYouMean(wanted_, others_); !question.isEmpty()) {
        text += QStringLiteral("; ") + question;
    }
    return InputError{path, std::nullopt, text};
}

} // namespace kareport
