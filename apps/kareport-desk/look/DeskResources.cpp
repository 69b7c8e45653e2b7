#include "DeskResources.h"

#include <QDir>

// Outside of every namespace, as the function that it declares is.
static void init()
{
    Q_INIT_RESOURCE(desk);
}

namespace kareport
{

void initDeskResources()
{
    init();
}

} // namespace kareport
