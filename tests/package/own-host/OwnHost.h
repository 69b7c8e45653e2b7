#pragma once

/// How often the module asked this host for the value of an object, so that a program can tell that it was this one.
int valuesFound();
