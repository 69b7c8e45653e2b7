#include "WindowList.h"

#include "DeskTitles.h"
#include "OpenTemplate.h"
#include "PlainWidgets.h"
#include "UApplication.h"

#include <QFileInfo>
#include <QMenu>

#include <utility>

namespace kareport
{

WindowList::WindowList(QMenu &menu, std::function<void(UDocument *report)> activate)
    : menu_(menu), activate_(std::move(activate))
{}

QAction *WindowList::add(const QString &name, bool isModified)
{
    constexpr qsizetype mostKeys = 9;
    const qsizetype number = ++count_;
    const QString key = number <= mostKeys ? u'&' + QString::number(number) + u' ' : QString();
    QAction *entry = menu_.addAction(key + plainMenuText(name) + (isModified ? QStringLiteral(" *") : QString()));
    entries_.append(entry);
    return entry;
}

void WindowList::fill(const UDocument *inFront)
{
    qDeleteAll(entries_);
    entries_.clear();
    count_ = 0;
    for (UDocument *document : UApplication::Get()->GetDocuments()) {
        if (!document->IsShown()) {
            continue;
        }
        if (count_ == 0) {
            entries_.append(menu_.addSeparator());
        }
        QAction *entry = add(nameOf(*document), document->IsModified());
        entry->setCheckable(true);
        entry->setChecked(document == inFront);
        QObject::connect(entry, &QAction::triggered, &menu_, [this, document] {
            if (UApplication::Get()->IsOpen(document)) {
                activate_(document);
            }
        });
    }
    bool isFirst = true;
    for (const OpenTemplateFile &open : openTemplates()) {
        if (isFirst) {
            entries_.append(menu_.addSeparator());
            isFirst = false;
        }
        QObject::connect(add(QFileInfo(open.path).fileName(), open.isModified), &QAction::triggered, &menu_,
                         [path = open.path] { openTemplateAt(path); });
    }
}

} // namespace kareport
