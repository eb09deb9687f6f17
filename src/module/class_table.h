// The library's table of creatable classes and the module's entry points.
#pragma once

#include "platform/class_factory.h"

#include <vector>

namespace Norvane::Lumis::Scanning {

// Every creatable class of the library, in class-table order.
const std::vector<ClassEntry>& BeamweaverClassTable();

// Registration: makes every class of the table creatable by class identifier and ProgID in this process.
HRESULT DllRegisterServer();
// Undoes DllRegisterServer.
HRESULT DllUnregisterServer();
// S_OK when no object of the module is alive and no server lock is held, else S_FALSE.
HRESULT DllCanUnloadNow();
// A class factory for a class of the table; CLASS_E_CLASSNOTAVAILABLE for any other class.
HRESULT DllGetClassObject(REFCLSID clsid, REFIID riid, void** out);

// What a host does once at start: registers the sibling components (point lists, geometry values)
// and the library. Safe to call more than once.
void RegisterComponents();

} // namespace Norvane::Lumis::Scanning
