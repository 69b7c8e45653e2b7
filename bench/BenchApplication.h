#pragma once

#include "Profile.h"

#include <QApplication>

/// Windows need an application, which the first of these benchmarks makes.
inline void needApplication()
{
    static char name[] = "ka_bench";
    static char *arguments[] = {name, nullptr};
    static int count = 1;
    if (QCoreApplication::instance() == nullptr) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
        new QApplication(count, arguments); // as long as the program
    }
    kareport::setProfileStore(kareport::makeMemoryProfile());
}
