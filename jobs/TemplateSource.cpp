#include "TemplateSource.h"

#include "NearestName.h"
#include "TemplateCheck.h"
#include "TemplateNames.h"
#include "Xlate.h"

#include <QFileInfo>

namespace kareport
{

std::optional<InputError> wrongTemplateSource(const QString &path)
{
    const QFileInfo info(path);
    if (!info.exists()) {
        return InputError{path, std::nullopt, Xlate("the template file cannot be read: there is no such file")};
    }
    if (!info.isFile()) {
        return InputError{path, std::nullopt,
                          Xlate("a template file was expected; this is a folder, a pipe or a device")};
    }
    if (info.size() > largestTemplateFile) {
        return InputError{path, TextPlace(),
                          Xlate("the template file has %1 MB: at most %2 MB were expected")
                              .arg(info.size() >> 20)
                              .arg(largestTemplateFile >> 20)};
    }
    return std::nullopt;
}

Expected<TemplateFile> readTemplateSource(const QString &path)
{
    if (auto wrong = wrongTemplateSource(path)) {
        return *std::move(wrong);
    }
    auto file = TemplateFile::read(path);
    if (!file) {
        return InputError{path, std::nullopt, Xlate("the template file cannot be read")};
    }
    if (file->text().isEmpty()) {
        return InputError{path, TextPlace(),
                          Xlate("the template file is empty: a <ReportTemplate> element was expected")};
    }
    return std::move(*file);
}

InputError whyNotLoaded(const QString &path, const TemplateFile &file, const QString &name)
{
    if (const auto remark = firstUnreadTemplate(file)) {
        return {path, remark->place,
                name.isEmpty() ? remark->text
                               : Xlate("the template \"%1\" cannot be loaded: %2").arg(name, remark->text)};
    }
    QStringList names = templateNames(file);
    names.removeAll(QString()); // a template without a name cannot be chosen
    if (names.isEmpty()) {
        return {path, TextPlace(), Xlate("the file holds no template: a <ReportTemplate> element was expected")};
    }
    return {path, TextPlace(), Xlate("there is no template named \"%1\": %2").arg(name, oneOfExpected(name, names))};
}

} // namespace kareport
