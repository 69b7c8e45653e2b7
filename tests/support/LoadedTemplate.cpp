#include "LoadedTemplate.h"

LoadedTemplate::LoadedTemplate(const QByteArray &content, const QString &name)
{
    const TemplateOnDisk file(content);
    loaded = file.written() && tpl.LoadTemplate(file.path(), name);
}
