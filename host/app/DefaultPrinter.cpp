#include "DefaultPrinter.h"

namespace kareport
{

namespace
{

DefaultPrinter &currentPrinter()
{
    static DefaultPrinter printer;
    return printer;
}

} // namespace

const DefaultPrinter &defaultPrinter()
{
    return currentPrinter();
}

void setDefaultPrinter(const DefaultPrinter &printer)
{
    currentPrinter() = printer;
}

} // namespace kareport
