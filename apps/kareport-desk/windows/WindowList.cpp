#include "WindowList.h"

#include "DeskTitles.h"
#include "PlainWidgets.h"
#include "UApplication.h"

#include <QMenu>

#include <utility>

namespace kareport
{

WindowList::WindowList(QMenu &menu, std::function<void(UDocument *report)> activate)
    : menu_(menu), activate_(std::move(activate))
{}

void WindowList::fill(const UDocument *inFront)
{
    qDeleteAll(entries_);
    entries_.clear();
    int number = 0;
    for (UDocument *document : UApplication::Get()->GetDocuments()) {
        if (!document->IsShown()) {
            continue;
        }
        if (entries_.isEmpty()) {
            entries_.append(menu_.addSeparator());
        }
        ++number;
        constexpr int mostKeys = 9;
        const QString key = number <= mostKeys ? u'&' + QString::number(number) + u' ' : QString();
        const QString star = document->IsModified() ? QStringLiteral(" *") : QString();
        QAction *entry = menu_.addAction(key + plainMenuText(nameOf(*document)) + star);
        entry->setCheckable(true);
        entry->setChecked(document == inFront);
        QObject::connect(entry, &QAction::triggered, &menu_, [this, document] {
            if (UApplication::Get()->IsOpen(document)) {
                activate_(document);
            }
        });
        entries_.append(entry);
    }
}

} // namespace kareport
