// Registration of the geometry value classes, so that a program creates them by class identifier,
// by ProgID ("NorvaneComTypes.CoordinateFloat") or as the default class of their interface.
#pragma once

#include "platform/class_factory.h"

#include <vector>

// The six creatable value classes, free-threaded.
std::vector<ClassEntry> ComTypesClassEntries();

// Registers the classes and makes each the default class of its interface. Calling it again only
// registers the same entries again.
void RegisterComTypesClasses();
